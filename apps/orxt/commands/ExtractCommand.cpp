#include <apps/orxt/commands/ExtractCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/facts/DocumentReading.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/VersionStore.h>
#include <translation/CustomExtraction.h>
#include <translation/WorkspaceDocument.h>

#include <CLI/CLI.hpp>

#include <algorithm>
#include <limits>

namespace messages = orx::messages;

using orx::Severity;

namespace {

constexpr CommandFacts kFacts = {"extract", "Make an embedded custom transformer a file of its own",
                                 "orxt extract land_cover.orw \"Tidy Area\" -o shared/tidy_area.ort"};

constexpr int kLongestFinding = 300;

// The sub-document on which a line stands, told by where each begins.
QString documentAt(const IXMLComponentReader& reader, const QStringList& names, int line) {
  QString found;
  int begin = 0;
  for (const QString& name : names) {
    const int first = reader.GetDocumentLine(name);
    if (first <= line && first > begin) {
      begin = first;
      found = name;
    }
  }
  return found;
}

}  // namespace

ExtractCommand::ExtractCommand() : Command(kFacts) {}

void ExtractCommand::declare(CLI::App& app) {
  app.add_option("workspace", m_workspace, "Workspace file; - is standard input")
      ->type_name("WORKSPACE")
      ->required();
  app.add_option("name", m_name, "Name of the custom transformer")->type_name("NAME")->required();
  app.add_option("-o,--output", m_output, "Custom-transformer file (.ort); the new version goes in front")
      ->type_name("FILE")
      ->required();
  app.add_option("--version", m_version, "Version number to store it under, instead of its own")
      ->type_name("NUMBER")
      ->check(CLI::Range(1, std::numeric_limits<int>::max()));
  m_definitions.declare(app);
  app.footer(app.get_footer() +
             "The custom transformers that stand inside it go into the file as well. Versions that the\n"
             "file holds already stay as they are; to replace one is refused. The workspace is not changed:\n"
             "to use the file, put it into a folder for transformers or name its folder with --resources.\n");
}

ExitStatus ExtractCommand::run(Console& console) {
  const QString fileName = QString::fromStdString(m_workspace);
  const QString shownName = InputFile::shownName(fileName);
  const QString outputFile = QString::fromStdString(m_output);
  if (outputFile == QLatin1String("-")) {
    console.fail(messages::kNeedsFile);
    return kExitUsage;
  }
  WorkspaceDocument document(fileName);
  const ExitStatus status = readDocument(document, fileName, console);
  if (status != kExitDone)
    return status;

  CustomExtraction extraction(document.reader(), document.headerLines(), m_definitions.load(console));
  const QString name = QString::fromStdString(m_name);
  const QStringList names = extraction.names();
  if (!names.contains(name)) {
    console.showFinding(shownName, 0, Severity::Error,
                        names.isEmpty() ? TransformResString(messages::kEmbedsNone)
                                        : TransformResString(messages::kEmbedsOthers,
                                                             {name, names.join(QLatin1String(", "))}));
    return kExitRefused;
  }
  orx::Findings diagnostics(shownName);
  const bool isPrepared = extraction.prepare(name, m_version, diagnostics);
  console.show(diagnostics);
  if (!isPrepared)
    return kExitRefused;
  warn(document, extraction, shownName, console);

  QString error;
  bool isRefused = false;
  if (VersionStore(outputFile)
          .insert(extraction.fields(), extraction.definition(), extraction.document(), error, &isRefused))
    return kExitDone;
  console.fail(error);
  return isRefused ? kExitRefused : kExitFile;
}

void ExtractCommand::warn(const WorkspaceDocument& document, const CustomExtraction& extraction,
                          const QString& shownName, Console& console) const {
  for (const QString& parameter : extraction.workspaceParameters()) {
    console.showFinding(shownName, 0, Severity::Warning,
                        TransformResString(messages::kRefersToWorkspace, parameter));
  }
  const QStringList names = extraction.names();
  for (const WorkspaceLossReport::Loss& loss : document.losses()) {
    if (!extraction.parts().contains(documentAt(document.reader(), names, loss.line)))
      continue;
    orx::Finding finding = WorkspaceDocument::findingOf(loss);
    finding.file = shownName;
    finding.severity = Severity::Warning;
    finding.text = TransformResString(messages::kNotInFile, onOneLine(finding.text, kLongestFinding));
    console.show(finding);
  }
}
