#include <transform/findings/RuleSettings.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

namespace orx {

namespace {

QString allNames() {
  QStringList names;
  for (const RuleRow& row : ruleTable())
    names.append(row.name);
  return names.join(QLatin1String(", "));
}

// False for a word that is none; no severity stands for "off".
bool readSeverity(const QString& word, std::optional<Severity>& severity) {
  severity = std::nullopt;
  if (word == QLatin1String("off"))
    return true;
  for (const Severity one : {Severity::Error, Severity::Warning, Severity::Hint}) {
    if (word == severityName(one)) {
      severity = one;
      return true;
    }
  }
  return false;
}

}  // namespace

bool RuleSettings::set(const QString& setting, QString& reason) {
  const int equals = setting.indexOf(QLatin1Char('='));
  const RuleRow* row = equals < 0 ? nullptr : findRule(setting.left(equals));
  if (!row) {
    reason = TransformResString(messages::kNoRule, {setting, allNames()});
    return false;
  }
  const QString word = setting.mid(equals + 1);
  std::optional<Severity> severity;
  if (!readSeverity(word, severity)) {
    reason = TransformResString(messages::kNoSeverity, {word, row->name});
    return false;
  }
  if (row->kind == RuleKind::Writing && severity != row->severity) {
    reason = TransformResString(messages::kCannotBeLowered, QString(row->name));
    return false;
  }
  m_severities.insert(static_cast<int>(row->rule), severity);
  return true;
}

std::optional<Severity> RuleSettings::severity(Rule rule) const {
  return m_severities.value(static_cast<int>(rule), ruleRow(rule).severity);
}

std::vector<Finding> RuleSettings::apply(std::vector<Finding> findings) const {
  std::vector<Finding> left;
  for (Finding& finding : findings) {
    const std::optional<Severity> counted = severity(finding.rule);
    if (!counted)
      continue;
    finding.severity = *counted;
    left.push_back(std::move(finding));
  }
  return left;
}

}  // namespace orx
