#include <apps/orxt/commands/ValidateCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/FindingJson.h>
#include <apps/orxt/console/SarifLog.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <CLI/CLI.hpp>
#include <QJsonDocument>

#include <algorithm>

namespace messages = orx::messages;

using orx::Severity;

namespace {

constexpr CommandFacts kFacts = {"validate", "Find everything that is wrong with workspaces",
                                 "orxt validate parcels.orw roads.orw\n"
                                 "orxt validate --quiet --rule missing-file=error nightly/*.orw\n"
                                 "orxt validate --sarif parcels.orw >parcels.sarif"};

QJsonObject reportJson(const ValidationReport& report) {
  return {{QStringLiteral("file"), report.file},
          {QStringLiteral("unreadable"), report.readError},
          {QStringLiteral("errors"), report.count(Severity::Error)},
          {QStringLiteral("warnings"), report.count(Severity::Warning)},
          {QStringLiteral("hints"), report.count(Severity::Hint)},
          {QStringLiteral("findings"), toJson(report.findings)}};
}

QString sarif(const std::vector<ValidationReport>& reports) {
  SarifLog log;
  for (const ValidationReport& report : reports) {
    for (const orx::Finding& finding : report.findings)
      log.add(finding);
    if (!report.isReadable())
      log.addUnreadable(report.file, report.readError);
  }
  return log.text();
}

ExitStatus exitStatus(const std::vector<ValidationReport>& reports) {
  ExitStatus status = kExitDone;
  for (const ValidationReport& report : reports) {
    if (!report.isReadable())
      return kExitFile;
    if (report.count(Severity::Error) > 0)
      status = kExitRefused;
  }
  return status;
}

}  // namespace

ValidateCommand::ValidateCommand() : Command(kFacts) {}

void ValidateCommand::declare(CLI::App& app) {
  app.add_option("workspace", m_workspaces, "Workspace files; - is standard input")
      ->type_name("WORKSPACE")
      ->required();
  m_options.declare(app, "As JSON: a list with one object per workspace");
  m_parameters.declare(app);
  app.add_flag("-q,--quiet", m_quiet, "Errors only, and no summary");
  m_definitions.declare(app);
}

ExitStatus ValidateCommand::run(Console& console) {
  orx::RuleSettings settings;
  QHash<QString, QString> values;
  if (!m_options.readRules(settings, console) || !m_parameters.read(values, console))
    return kExitUsage;
  TransformerMgr& registry = m_definitions.load(console);
  std::vector<ValidationReport> reports;
  for (const std::string& workspace : m_workspaces) {
    reports.push_back(validateWorkspace(QString::fromStdString(workspace), registry, settings, values));
    std::vector<orx::Finding>& findings = reports.back().findings;
    if (m_quiet) {
      findings.erase(
          std::remove_if(findings.begin(), findings.end(),
                         [](const orx::Finding& finding) { return finding.severity != Severity::Error; }),
          findings.end());
    }
    show(reports.back(), console);
  }
  summarize(reports, console);
  return exitStatus(reports);
}

void ValidateCommand::show(const ValidationReport& report, Console& console) const {
  if (!m_options.isJson() && !m_options.isSarif()) {
    for (const orx::Finding& finding : report.findings)
      console.show(finding);
  }
  if (!report.isReadable())
    console.failFile(report.file, report.readError);
}

void ValidateCommand::summarize(const std::vector<ValidationReport>& reports, Console& console) const {
  if (m_options.isSarif()) {
    console.print(sarif(reports));
    return;
  }
  if (m_options.isJson()) {
    QJsonArray list;
    for (const ValidationReport& report : reports)
      list.append(reportJson(report));
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
    return;
  }
  if (m_quiet)
    return;
  int counts[3] = {};
  int unreadable = 0;
  for (const ValidationReport& report : reports) {
    for (const Severity severity : {Severity::Error, Severity::Warning, Severity::Hint})
      counts[static_cast<int>(severity)] += report.count(severity);
    unreadable += report.isReadable() ? 0 : 1;
  }
  QString line =
      TransformResString(messages::kSummary, {QString::number(reports.size()), QString::number(counts[0]),
                                              QString::number(counts[1]), QString::number(counts[2])});
  if (unreadable > 0)
    line += QLatin1Char(' ') + TransformResString(messages::kUnreadableCount, QString::number(unreadable));
  console.print(line + QLatin1Char('\n'));
}
