#include <apps/orxt/console/FindingJson.h>

QJsonObject toJson(const orx::Finding& finding) {
  return {{QStringLiteral("file"), finding.file},
          {QStringLiteral("line"), finding.line},
          {QStringLiteral("severity"), orx::severityName(finding.severity)},
          {QStringLiteral("rule"), QString(orx::ruleRow(finding.rule).name)},
          {QStringLiteral("node"), finding.node},
          {QStringLiteral("parameter"), finding.parameter},
          {QStringLiteral("text"), finding.text}};
}

QJsonArray toJson(const std::vector<orx::Finding>& findings) {
  QJsonArray list;
  for (const orx::Finding& finding : findings)
    list.append(toJson(finding));
  return list;
}
