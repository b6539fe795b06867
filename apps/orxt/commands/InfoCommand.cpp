#include <apps/orxt/commands/InfoCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/DocumentReading.h>
#include <apps/orxt/facts/InfoJson.h>
#include <apps/orxt/facts/InfoText.h>
#include <translation/WorkspaceDocument.h>

#include <CLI/CLI.hpp>
#include <QJsonDocument>

#include <algorithm>

namespace {

constexpr CommandFacts kFacts = {"info", "Show what workspaces hold",
                                 "orxt info parcels.orw\n"
                                 "orxt info --json nightly/*.orw | jq '.[].transformers'\n"
                                 "git show HEAD~1:parcels.orw | orxt info -"};

}  // namespace

InfoCommand::InfoCommand() : Command(kFacts) {}

void InfoCommand::declare(CLI::App& app) {
  app.add_option("workspace", m_workspaces,
                 "Workspace files or files of custom transformers; - is standard input")
      ->type_name("WORKSPACE")
      ->required();
  app.add_flag("--json", m_json, "As JSON: a list with one entry for each file that could be read");
  m_language.declareLanguage(app);
}

ExitStatus InfoCommand::run(Console& console) {
  int worst = kExitDone;
  bool isFirst = true;
  QJsonArray entries;
  for (const std::string& name : m_workspaces) {
    const ExitStatus status = describe(QString::fromStdString(name), isFirst, entries, console);
    worst = std::max<int>(worst, status);
    isFirst = isFirst && status != kExitDone;
  }
  if (m_json)
    console.print(QString::fromUtf8(QJsonDocument(entries).toJson()));
  return static_cast<ExitStatus>(worst);
}

ExitStatus InfoCommand::describe(const QString& fileName, bool isFirst, QJsonArray& entries,
                                 Console& console) const {
  WorkspaceDocument document(fileName);
  const ExitStatus status =
      readDocument(document, fileName, console, WorkspaceDocument::Versions::NewestRead);
  if (status != kExitDone)
    return status;
  const QString shownName = InputFile::shownName(fileName);
  if (m_json)
    entries.append(infoJson(document, shownName));
  else
    console.print((isFirst ? QString() : QStringLiteral("\n")) + InfoText(document).text(shownName));
  return kExitDone;
}
