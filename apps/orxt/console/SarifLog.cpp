#include <apps/orxt/console/SarifLog.h>
#include <transform/text/MessageStrings.h>
#include <translation/ProgramVersion.h>

#include <QFileInfo>
#include <QJsonDocument>
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

QJsonObject physicalLocation(const QString& file, int line) {
  QJsonObject physical{
      {QStringLiteral("artifactLocation"), QJsonObject{{QStringLiteral("uri"), fileUri(file)}}}};
  if (line > 0)
    physical.insert(QStringLiteral("region"), QJsonObject{{QStringLiteral("startLine"), line}});
  return physical;
}

}  // namespace

SarifLog::SarifLog() {
  for (const DiagnosticRule& rule : diagnosticRules())
    addRule(rule.name, rule.severity, rule.message == 0 ? QString() : TransformResString(rule.message));
}

void SarifLog::addRule(const QString& name, Severity severity, const QString& description) {
  if (m_rulePlaces.contains(name))
    return;
  QJsonObject entry{
      {QStringLiteral("id"), name},
      {QStringLiteral("shortDescription"),
       message(QString(name).replace(QLatin1Char('-'), QLatin1Char(' ')))},
      {QStringLiteral("defaultConfiguration"), QJsonObject{{QStringLiteral("level"), level(severity)}}}};
  if (!description.isEmpty())
    entry.insert(QStringLiteral("fullDescription"), message(description));
  m_rulePlaces.insert(name, m_rules.size());
  m_rules.append(entry);
}

void SarifLog::addFinding(const QString& file, int line, Severity severity, const QString& rule,
                          const QString& node, const QString& text) {
  QJsonObject location{{QStringLiteral("physicalLocation"), physicalLocation(file, line)}};
  if (!node.isEmpty())
    location.insert(QStringLiteral("logicalLocations"),
                    QJsonArray{QJsonObject{{QStringLiteral("name"), node}}});
  m_results.append(QJsonObject{{QStringLiteral("ruleId"), rule},
                               {QStringLiteral("ruleIndex"), m_rulePlaces.value(rule, -1)},
                               {QStringLiteral("level"), level(severity)},
                               {QStringLiteral("message"), message(text)},
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
                           {QStringLiteral("rules"), m_rules}};
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
