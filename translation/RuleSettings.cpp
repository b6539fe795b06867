#include <transform/text/MessageStrings.h>
#include <translation/RuleSettings.h>

namespace {

constexpr long kNoRule = 370873;
constexpr long kNoSeverity = 370874;

}  // namespace

bool RuleSettings::set(const QString& setting, QString& reason, const QStringList& furtherRules) {
  const int equals = setting.indexOf(QLatin1Char('='));
  const QString name = setting.left(equals);
  if (equals < 0 || !(findDiagnosticRule(name) || furtherRules.contains(name))) {
    QStringList names;
    for (const DiagnosticRule& known : diagnosticRules())
      names.append(known.name);
    names += furtherRules;
    names.removeDuplicates();
    reason = TransformResString(kNoRule, {setting, names.join(QLatin1String(", "))});
    return false;
  }
  const QString level = setting.mid(equals + 1);
  if (level == QLatin1String("off")) {
    m_severities.insert(name, std::nullopt);
    return true;
  }
  for (const Severity severity : {Severity::Error, Severity::Warning, Severity::Hint}) {
    if (level == severityName(severity)) {
      m_severities.insert(name, severity);
      return true;
    }
  }
  reason = TransformResString(kNoSeverity, {level, name});
  return false;
}

std::optional<Severity> RuleSettings::severity(const QString& rule, Severity severity) const {
  return m_severities.value(rule, severity);
}

std::vector<Diagnostic> RuleSettings::apply(const std::vector<Diagnostic>& findings) const {
  std::vector<Diagnostic> left;
  for (const Diagnostic& finding : findings) {
    const std::optional<Severity> counted = severity(diagnosticRule(finding.rule).name, finding.severity);
    if (!counted)
      continue;
    left.push_back(finding);
    left.back().severity = *counted;
  }
  return left;
}
