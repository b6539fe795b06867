// What the checks of definition files find.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <vector>

struct LintFinding {
  QString file;
  int line = 0;  // from 1; 0 for the file as a whole
  bool isError = false;
  QString rule;
  QString text;
};

struct LintRule {
  QLatin1String name;
  bool isError;
};

namespace lint_rules {

constexpr bool kError = true;
constexpr bool kWarning = false;

// The file.
inline constexpr LintRule kUnreadable{QLatin1String("unreadable-file"), kError};
inline constexpr LintRule kNotUtf8{QLatin1String("not-utf8"), kError};
inline constexpr LintRule kWorkspaceMark{QLatin1String("workspace-mark"), kError};
inline constexpr LintRule kOpenBlock{QLatin1String("open-block"), kError};
inline constexpr LintRule kUnfinished{QLatin1String("unfinished-definition"), kError};
// The header.
inline constexpr LintRule kUnknownKeyword{QLatin1String("unknown-keyword"), kError};
inline constexpr LintRule kRepeatedKeyword{QLatin1String("repeated-keyword"), kWarning};
inline constexpr LintRule kBadValue{QLatin1String("bad-value"), kError};
inline constexpr LintRule kDuplicateDefinition{QLatin1String("duplicate-definition"), kError};
inline constexpr LintRule kMissingText{QLatin1String("missing-text"), kWarning};
// Ports and attributes.
inline constexpr LintRule kUnknownPort{QLatin1String("unknown-port"), kError};
inline constexpr LintRule kBadListAction{QLatin1String("bad-list-action"), kError};
inline constexpr LintRule kBadMapping{QLatin1String("bad-mapping"), kError};
// Parameters.
inline constexpr LintRule kParameterLines{QLatin1String("parameter-lines"), kError};
inline constexpr LintRule kDuplicateParameter{QLatin1String("duplicate-parameter"), kError};
inline constexpr LintRule kUnknownParameter{QLatin1String("unknown-parameter"), kError};
inline constexpr LintRule kUnknownType{QLatin1String("unknown-type"), kError};
inline constexpr LintRule kPlainText{QLatin1String("plain-text-type"), kError};
inline constexpr LintRule kBadDefault{QLatin1String("bad-default"), kError};
// The template.
inline constexpr LintRule kBadStatement{QLatin1String("bad-statement"), kError};
inline constexpr LintRule kUnknownToken{QLatin1String("unknown-token"), kError};
inline constexpr LintRule kOutputRoute{QLatin1String("output-route"), kError};
inline constexpr LintRule kOmittableLine{QLatin1String("omittable-line"), kError};
inline constexpr LintRule kUnusedPort{QLatin1String("unused-port"), kWarning};
inline constexpr LintRule kUnusedParameter{QLatin1String("unused-parameter"), kWarning};
// Companions.
inline constexpr LintRule kUnknownInCompanion{QLatin1String("unknown-in-companion"), kError};
inline constexpr LintRule kMissingTranslation{QLatin1String("missing-translation"), kWarning};
// Scripts.
inline constexpr LintRule kTclSyntax{QLatin1String("tcl-syntax"), kError};
inline constexpr LintRule kPythonSyntax{QLatin1String("python-syntax"), kError};
inline constexpr LintRule kUncheckedPython{QLatin1String("unchecked-python"), kWarning};

}  // namespace lint_rules

// All of them, in the order above.
ORX_EXPORT const std::vector<LintRule>& lintRules();

class LintReport {
 public:
  void add(const LintRule& rule, const QString& file, int line, const QString& text);
  // By file, then line, then as they were found.
  void sort();
  const std::vector<LintFinding>& findings() const { return m_findings; }

 private:
  std::vector<LintFinding> m_findings;
};
