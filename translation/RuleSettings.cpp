#include <transform/text/MessageStrings.h>
#include <translation/RuleSettings.h>

#include <QStringList>

#include <algorithm>

namespace {

constexpr long kNoRule = 370873;
constexpr long kNoSeverity = 370874;

}  // namespace

bool RuleSettings::set(const QString& setting, QString& reason) {
  const int equals = setting.indexOf(QLatin1Char('='));
  const QString name = setting.left(equals);
  const DiagnosticRule* rule = equals < 0 ? nullptr : findDiagnosticRule(name);
  if (!rule) {
    QStringList names;
    for (const DiagnosticRule& known : diagnosticRules())
      names.append(known.name);
    reason = TransformResString(kNoRule, {setting, names.join(QLatin1String(", "))});
    return false;
  }
  const QString level = setting.mid(equals + 1);
  if (level == QLatin1String("off")) {
    m_severities.insert(static_cast<int>(rule->rule), std::nullopt);
    return true;
  }
  for (const Severity severity : {Severity::Error, Severity::Warning, Severity::Hint}) {
    if (level == severityName(severity)) {
      m_severities.insert(static_cast<int>(rule->rule), severity);
      return true;
    }
  }
  reason = TransformResString(kNoSeverity, {level, name});
  return false;
}

std::vector<Diagnostic> RuleSettings::apply(std::vector<Diagnostic> findings) const {
  if (m_severities.isEmpty())
    return findings;
  const auto isOff = [this](const Diagnostic& finding) {
    const auto setting = m_severities.constFind(static_cast<int>(finding.rule));
    return setting != m_severities.constEnd() && !setting->has_value();
  };
  findings.erase(std::remove_if(findings.begin(), findings.end(), isOff), findings.end());
  for (Diagnostic& finding : findings) {
    const auto setting = m_severities.constFind(static_cast<int>(finding.rule));
    if (setting != m_severities.constEnd())
      finding.severity = **setting;
  }
  return findings;
}
