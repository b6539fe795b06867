#include <transform/registry/LintReport.h>

#include <algorithm>
#include <tuple>

namespace {

// Texts quote what they find, which may be a line of any length.
constexpr int kLongestText = 400;

}  // namespace

const std::vector<LintRule>& lintRules() {
  using namespace lint_rules;
  static const std::vector<LintRule> rules = {
      kUnreadable,          kNotUtf8,
      kWorkspaceMark,       kOpenBlock,
      kUnfinished,          kUnknownKeyword,
      kRepeatedKeyword,     kBadValue,
      kDuplicateDefinition, kMissingText,
      kUnknownPort,         kBadListAction,
      kBadMapping,          kParameterLines,
      kDuplicateParameter,  kUnknownParameter,
      kUnknownType,         kPlainText,
      kBadDefault,          kBadStatement,
      kUnknownToken,        kOutputRoute,
      kOmittableLine,       kUnusedPort,
      kUnusedParameter,     kUnknownInCompanion,
      kMissingTranslation,  kTclSyntax,
      kPythonSyntax,        kUncheckedPython,
  };
  return rules;
}

void LintReport::add(const LintRule& rule, const QString& file, int line, const QString& text) {
  const bool isLong = text.size() > kLongestText;
  m_findings.push_back(
      {file, line, rule.isError, rule.name, isLong ? text.left(kLongestText) + QLatin1String("...") : text});
}

void LintReport::sort() {
  std::stable_sort(m_findings.begin(), m_findings.end(), [](const LintFinding& a, const LintFinding& b) {
    return std::tie(a.file, a.line) < std::tie(b.file, b.line);
  });
}
