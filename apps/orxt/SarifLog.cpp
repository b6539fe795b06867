#include <apps/orxt/SarifLog.h>
#include <transform/text/MessageStrings.h>
#include <translation/ProgramVersion.h>

#include <QFileInfo>
#include <QJsonArray>
#include <QUrl>

namespace {

QJsonObject message(const QString& text) {
  return {{QStringLiteral("text"), text}};
}

QString level(Severity severity) {
  return severity == Severity::Hint ? QStringLiteral("note") : severityName(severity);
}

// A relative name stays relative; everything that means something in a URI is encoded.
QString fileUri(const QString& file) {
  if (QFileInfo(file).isAbsolute())
    return QUrl::fromLocalFile(file).toString(QUrl::FullyEncoded);
  return QString::fromLatin1(QUrl::toPercentEncoding(file, "/"));
}

QJsonArray ruleList() {
  QJsonArray rules;
  for (const DiagnosticRule& rule : diagnosticRules()) {
    QJsonObject entry{{QStringLiteral("id"), QString(rule.name)},
                      {QStringLiteral("shortDescription"),
                       message(QString(rule.name).replace(QLatin1Char('-'), QLatin1Char(' ')))},
                      {QStringLiteral("defaultConfiguration"),
                       QJsonObject{{QStringLiteral("level"), level(rule.severity)}}}};
    const QString text = rule.message == 0 ? QString() : TransformResString(rule.message);
    if (!text.isEmpty())
      entry.insert(QStringLiteral("fullDescription"), message(text));
    rules.append(entry);
  }
  return rules;
}

QJsonObject physicalLocation(const QString& file, int line) {
  QJsonObject physical{
      {QStringLiteral("artifactLocation"), QJsonObject{{QStringLiteral("uri"), fileUri(file)}}}};
  if (line > 0)
    physical.insert(QStringLiteral("region"), QJsonObject{{QStringLiteral("startLine"), line}});
  return physical;
}

QJsonObject result(const Diagnostic& finding) {
  QJsonObject location{{QStringLiteral("physicalLocation"), physicalLocation(finding.file, finding.line)}};
  if (!finding.node.isEmpty())
    location.insert(QStringLiteral("logicalLocations"),
                    QJsonArray{QJsonObject{{QStringLiteral("name"), finding.node}}});
  return {{QStringLiteral("ruleId"), QString(diagnosticRule(finding.rule).name)},
          {QStringLiteral("ruleIndex"), static_cast<int>(finding.rule)},
          {QStringLiteral("level"), level(finding.severity)},
          {QStringLiteral("message"), message(textWithNode(finding))},
          {QStringLiteral("locations"), QJsonArray{location}}};
}

}  // namespace

QJsonObject sarifLog(const std::vector<ValidationReport>& reports) {
  QJsonArray results;
  QJsonArray notifications;
  for (const ValidationReport& report : reports) {
    for (const Diagnostic& finding : report.findings)
      results.append(result(finding));
    if (!report.isReadable()) {
      notifications.append(QJsonObject{
          {QStringLiteral("level"), QStringLiteral("error")},
          {QStringLiteral("message"), message(report.readError)},
          {QStringLiteral("locations"),
           QJsonArray{QJsonObject{{QStringLiteral("physicalLocation"), physicalLocation(report.file, 0)}}}}});
    }
  }
  const QJsonObject driver{{QStringLiteral("name"), QStringLiteral("orxt")},
                           {QStringLiteral("version"), programVersion().section(QLatin1Char(' '), -1)},
                           {QStringLiteral("rules"), ruleList()}};
  const QJsonObject run{
      {QStringLiteral("tool"), QJsonObject{{QStringLiteral("driver"), driver}}},
      {QStringLiteral("columnKind"), QStringLiteral("utf16CodeUnits")},
      {QStringLiteral("invocations"),
       QJsonArray{QJsonObject{{QStringLiteral("executionSuccessful"), notifications.isEmpty()},
                              {QStringLiteral("toolExecutionNotifications"), notifications}}}},
      {QStringLiteral("results"), results}};
  return {{QStringLiteral("$schema"), QStringLiteral("https://json.schemastore.org/sarif-2.1.0.json")},
          {QStringLiteral("version"), QStringLiteral("2.1.0")},
          {QStringLiteral("runs"), QJsonArray{run}}};
}
