#include <transform/registry/LintReport.h>
#include <transform/text/MessageStrings.h>

#include <algorithm>
#include <tuple>

namespace {

// Texts quote what they find, which may be a line of any length.
constexpr int kLongestText = 400;

}  // namespace

void LintReport::add(orx::Rule rule, long message, const QString& file, int line,
                     const QStringList& arguments) {
  addText(rule, message, file, line, TransformResString(message, arguments));
}

void LintReport::addText(orx::Rule rule, long message, const QString& file, int line, const QString& text) {
  orx::Finding finding;
  finding.rule = rule;
  finding.severity = orx::ruleRow(rule).severity;
  finding.file = file;
  finding.line = line;
  finding.message = message;
  finding.text = text.size() > kLongestText ? text.left(kLongestText) + QLatin1String("...") : text;
  m_findings.push_back(std::move(finding));
}

void LintReport::sort() {
  std::stable_sort(m_findings.begin(), m_findings.end(), [](const orx::Finding& a, const orx::Finding& b) {
    return std::tie(a.file, a.line) < std::tie(b.file, b.line);
  });
}
