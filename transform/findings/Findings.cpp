#include <transform/findings/Findings.h>
#include <transform/text/MessageStrings.h>

namespace orx {

namespace {

// Without the message files, under a wrong home, the rule and its arguments still tell what is meant.
QString textOf(Rule rule, long message, const QStringList& arguments) {
  const QString text = TransformResString(message, arguments);
  return text.isEmpty() ? (QStringList{ruleRow(rule).name} + arguments).join(QLatin1Char(' ')) : text;
}

}  // namespace

void Findings::report(Rule rule, int line, const QString& node, const QStringList& arguments,
                      const QString& remark) {
  reportAs(rule, ruleRow(rule).message, line, node, arguments);
  if (!remark.isEmpty())
    m_all.back().text += QLatin1Char(' ') + remark;
}

void Findings::reportAs(Rule rule, long message, int line, const QString& node,
                        const QStringList& arguments) {
  Finding finding;
  finding.rule = rule;
  finding.line = line;
  finding.node = node;
  finding.text = textOf(rule, message, arguments);
  finding.message = message;
  add(std::move(finding));
}

void Findings::reportText(Rule rule, int line, const QString& node, const QString& text, long message) {
  Finding finding;
  finding.rule = rule;
  finding.line = line;
  finding.node = node;
  finding.text = text;
  finding.message = message;
  add(std::move(finding));
}

void Findings::reportParameter(Rule rule, long message, int line, const QString& node,
                               const QString& parameter, const QString& text) {
  reportText(rule, line, node, text, message);
  m_all.back().parameter = parameter;
}

void Findings::reportUnwritable(int line, const QString& node, const QString& parameter,
                                const QString& reason) {
  report(Rule::UnwritableValue, line, node, {parameter, reason});
  m_all.back().parameter = parameter;
}

void Findings::add(Finding finding) {
  const RuleRow& row = ruleRow(finding.rule);
  finding.severity = row.severity;
  m_forbidsWriting = m_forbidsWriting || (row.kind == RuleKind::Writing && row.severity == Severity::Error);
  if (finding.file.isEmpty())
    finding.file = m_file;
  if (finding.severity == Severity::Error)
    ++m_errors;
  m_all.push_back(std::move(finding));
}

void Findings::take(const std::vector<Finding>& judged) {
  for (const Finding& finding : judged) {
    m_errors += finding.severity == Severity::Error ? 1 : 0;
    m_all.push_back(finding);
  }
}

}  // namespace orx
