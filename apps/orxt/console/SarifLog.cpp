#include <apps/orxt/console/SarifLog.h>
#include <transform/text/MessageStrings.h>
#include <translation/ProgramVersion.h>

#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QUrl>

using orx::Severity;

namespace {

QJsonObject message(const QString& text) {
  return {{QStringLiteral("text"), text}};
}

QString level(Severity severity) {
  return severity == Severity::Hint ? QStringLiteral("note") : orx::severityName(severity);
}

// A relative name stays relative; everything that means something in a URI is encoded.
QString fileUri(const QString& file) {
  if (QFileInfo(file).isAbsolute())
    return QUrl::fromLocalFile(file).toString(QUrl::FullyEncoded);
  return QString::fromLatin1(QUrl::toPercentEncoding(file, "/"));
}

QJsonObject physicalLocation(const QString& file, int line) {
  QJsonObject physical{
      {QStringLiteral("artifactLocation"), QJsonObject{{QStringLiteral("uri"), fileUri(file)}}}};
  if (line > 0)
    physical.insert(QStringLiteral("region"), QJsonObject{{QStringLiteral("startLine"), line}});
  return physical;
}

QJsonObject ruleEntry(const orx::RuleRow& row) {
  QJsonObject entry{
      {QStringLiteral("id"), QString(row.name)},
      {QStringLiteral("shortDescription"),
       message(QString(row.name).replace(QLatin1Char('-'), QLatin1Char(' ')))},
      {QStringLiteral("defaultConfiguration"), QJsonObject{{QStringLiteral("level"), level(row.severity)}}}};
  if (row.message != 0)
    entry.insert(QStringLiteral("fullDescription"), message(TransformResString(row.message)));
  return entry;
}

QJsonArray ruleEntries() {
  QJsonArray entries;
  for (const orx::RuleRow& row : orx::ruleTable())
    entries.append(ruleEntry(row));
  return entries;
}

}  // namespace

void SarifLog::add(const orx::Finding& finding) {
  QJsonObject location{{QStringLiteral("physicalLocation"), physicalLocation(finding.file, finding.line)}};
  if (!finding.node.isEmpty())
    location.insert(QStringLiteral("logicalLocations"),
                    QJsonArray{QJsonObject{{QStringLiteral("name"), finding.node}}});
  m_results.append(QJsonObject{{QStringLiteral("ruleId"), QString(orx::ruleRow(finding.rule).name)},
                               {QStringLiteral("ruleIndex"), static_cast<int>(finding.rule)},
                               {QStringLiteral("level"), level(finding.severity)},
                               {QStringLiteral("message"), message(orx::textWithNode(finding))},
                               {QStringLiteral("locations"), QJsonArray{location}}});
}

void SarifLog::addUnreadable(const QString& file, const QString& reason) {
  m_notifications.append(QJsonObject{
      {QStringLiteral("level"), QStringLiteral("error")},
      {QStringLiteral("message"), message(reason)},
      {QStringLiteral("locations"),
       QJsonArray{QJsonObject{{QStringLiteral("physicalLocation"), physicalLocation(file, 0)}}}}});
}

QString SarifLog::text() const {
  const QJsonObject driver{{QStringLiteral("name"), QStringLiteral("orxt")},
                           {QStringLiteral("version"), programVersion().section(QLatin1Char(' '), -1)},
                           {QStringLiteral("rules"), ruleEntries()}};
  const QJsonObject run{
      {QStringLiteral("tool"), QJsonObject{{QStringLiteral("driver"), driver}}},
      {QStringLiteral("columnKind"), QStringLiteral("utf16CodeUnits")},
      {QStringLiteral("invocations"),
       QJsonArray{QJsonObject{{QStringLiteral("executionSuccessful"), m_notifications.isEmpty()},
                              {QStringLiteral("toolExecutionNotifications"), m_notifications}}}},
      {QStringLiteral("results"), m_results}};
  const QJsonObject log{
      {QStringLiteral("$schema"), QStringLiteral("https://json.schemastore.org/sarif-2.1.0.json")},
      {QStringLiteral("version"), QStringLiteral("2.1.0")},
      {QStringLiteral("runs"), QJsonArray{run}}};
  return QString::fromUtf8(QJsonDocument(log).toJson());
}
