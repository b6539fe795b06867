#include <apps/orxt/Console.h>
#include <apps/orxt/LintCommand.h>
#include <transform/registry/DefinitionLint.h>

#include <CLI/CLI.hpp>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace {

constexpr CommandFacts kFacts = {"lint",
                                 "Check definition files: grammar, tokens, references, script fragments",
                                 "orxt lint resources/transformers\norxt lint --json MyTransformer.ort"};

}  // namespace

LintCommand::LintCommand() : Command(kFacts) {}

void LintCommand::declare(CLI::App& app) {
  app.add_option("path", m_paths, "Definition files, or folders of them")->type_name("PATH")->required();
  app.add_flag("--json", m_json, "As JSON");
}

ExitStatus LintCommand::run(Console& console) {
  DefinitionLint lint;
  bool isUnreadable = false;
  for (const std::string& text : m_paths) {
    const QString path = QString::fromStdString(text);
    if (!QFileInfo::exists(path)) {
      console.failFile(path, QStringLiteral("no such file or folder"));
      isUnreadable = true;
      continue;
    }
    lint.checkPath(path);
  }
  bool hasErrors = false;
  QJsonArray list;
  for (const LintFinding& finding : lint.findings()) {
    hasErrors = hasErrors || finding.isError;
    const QString severity = severityName(finding.isError ? Severity::Error : Severity::Warning);
    if (m_json) {
      list.append(QJsonObject{{QStringLiteral("file"), finding.file},
                              {QStringLiteral("line"), finding.line},
                              {QStringLiteral("severity"), severity},
                              {QStringLiteral("rule"), finding.rule},
                              {QStringLiteral("text"), finding.text}});
    } else {
      console.showFinding(finding.file, finding.line, finding.isError ? Severity::Error : Severity::Warning,
                          finding.text + QLatin1String(" [") + finding.rule + QLatin1Char(']'));
    }
  }
  if (m_json)
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
  if (isUnreadable)
    return kExitFile;
  return hasErrors ? kExitRefused : kExitDone;
}
