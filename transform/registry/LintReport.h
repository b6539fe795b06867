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
inline const LintRule kUnreadable{QLatin1String("unreadable-file"), kError};
inline const LintRule kNotUtf8{QLatin1String("not-utf8"), kError};
inline const LintRule kWorkspaceMark{QLatin1String("workspace-mark"), kError};
inline const LintRule kOpenBlock{QLatin1String("open-block"), kError};
inline const LintRule kUnfinished{QLatin1String("unfinished-definition"), kError};
// The header.
inline const LintRule kUnknownKeyword{QLatin1String("unknown-keyword"), kError};
inline const LintRule kRepeatedKeyword{QLatin1String("repeated-keyword"), kWarning};
inline const LintRule kBadValue{QLatin1String("bad-value"), kError};
inline const LintRule kDuplicateDefinition{QLatin1String("duplicate-definition"), kError};
inline const LintRule kMissingText{QLatin1String("missing-text"), kWarning};
// Ports and attributes.
inline const LintRule kUnknownPort{QLatin1String("unknown-port"), kError};
inline const LintRule kBadListAction{QLatin1String("bad-list-action"), kError};
inline const LintRule kBadMapping{QLatin1String("bad-mapping"), kError};
// Parameters.
inline const LintRule kParameterLines{QLatin1String("parameter-lines"), kError};
inline const LintRule kDuplicateParameter{QLatin1String("duplicate-parameter"), kError};
inline const LintRule kUnknownParameter{QLatin1String("unknown-parameter"), kError};
inline const LintRule kUnknownType{QLatin1String("unknown-type"), kError};
inline const LintRule kPlainText{QLatin1String("plain-text-type"), kError};
inline const LintRule kBadDefault{QLatin1String("bad-default"), kError};
// The template.
inline const LintRule kBadStatement{QLatin1String("bad-statement"), kError};
inline const LintRule kUnknownToken{QLatin1String("unknown-token"), kError};
inline const LintRule kOutputRoute{QLatin1String("output-route"), kError};
inline const LintRule kOmittableLine{QLatin1String("omittable-line"), kError};
inline const LintRule kUnusedPort{QLatin1String("unused-port"), kWarning};
inline const LintRule kUnusedParameter{QLatin1String("unused-parameter"), kWarning};
// Companions.
inline const LintRule kUnknownInCompanion{QLatin1String("unknown-in-companion"), kError};
inline const LintRule kMissingTranslation{QLatin1String("missing-translation"), kWarning};
// Scripts.
inline const LintRule kTclSyntax{QLatin1String("tcl-syntax"), kError};
inline const LintRule kPythonSyntax{QLatin1String("python-syntax"), kError};
inline const LintRule kUncheckedPython{QLatin1String("unchecked-python"), kWarning};

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
