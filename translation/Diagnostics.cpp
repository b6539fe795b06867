#include <transform/text/MessageStrings.h>
#include <translation/Diagnostics.h>

void Diagnostics::report(Rule rule, int line, const QString& node, const QStringList& arguments) {
  const DiagnosticRule& entry = diagnosticRule(rule);
  const QString text = TransformResString(entry.message, arguments);
  // Without the message files, under a wrong home, the rule and its arguments still tell what is meant.
  reportText(rule, line, node,
             text.isEmpty() ? (QStringList{entry.name} + arguments).join(QLatin1Char(' ')) : text);
}

void Diagnostics::reportText(Rule rule, int line, const QString& node, const QString& text) {
  reportIn(m_file, rule, line, node, text);
}

void Diagnostics::reportParameter(Rule rule, int line, const QString& node, const QString& parameter,
                                  const QString& text) {
  reportIn(m_file, rule, line, node, text);
  m_all.back().parameter = parameter;
}

void Diagnostics::reportUnwritable(int line, const QString& node, const QString& parameter,
                                   const QString& reason) {
  report(Rule::UnwritableValue, line, node, {parameter, reason});
  m_all.back().parameter = parameter;
}

void Diagnostics::reportIn(const QString& file, Rule rule, int line, const QString& node,
                           const QString& text) {
  const Severity severity = diagnosticRule(rule).severity;
  m_all.push_back({rule, severity, file, line, node, text, QString()});
  if (severity == Severity::Error)
    ++m_errors;
}

QString severityName(Severity severity) {
  switch (severity) {
    case Severity::Error:
      return QStringLiteral("error");
    case Severity::Warning:
      return QStringLiteral("warning");
    case Severity::Hint:
      break;
  }
  return QStringLiteral("hint");
}

QString formatFinding(const QString& file, int line, const QString& severity, const QString& text) {
  const QString place = line > 0 ? file + QLatin1Char(':') + QString::number(line) : file;
  return place + QLatin1String(": ") + severity + QLatin1String(": ") + text;
}

QString textWithNode(const Diagnostic& diagnostic) {
  return diagnostic.node.isEmpty() ? diagnostic.text
                                   : diagnostic.node + QLatin1String(": ") + diagnostic.text;
}

QString formatDiagnostic(const Diagnostic& diagnostic) {
  return formatFinding(diagnostic.file, diagnostic.line, severityName(diagnostic.severity),
                       textWithNode(diagnostic));
}
