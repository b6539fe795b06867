#include <transform/text/MessageStrings.h>
#include <translation/Diagnostics.h>

void Diagnostics::report(Rule rule, int line, const QString& node, const QStringList& arguments) {
  reportText(rule, line, node, TransformResString(diagnosticRule(rule).message, arguments));
}

void Diagnostics::reportText(Rule rule, int line, const QString& node, const QString& text) {
  const Severity severity = diagnosticRule(rule).severity;
  m_all.push_back({rule, severity, m_file, line, node, text});
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

QString formatDiagnostic(const Diagnostic& diagnostic) {
  QString result = diagnostic.file;
  if (diagnostic.line > 0)
    result += QLatin1Char(':') + QString::number(diagnostic.line);
  result += QLatin1String(": ") + severityName(diagnostic.severity) + QLatin1String(": ");
  if (!diagnostic.node.isEmpty())
    result += diagnostic.node + QLatin1String(": ");
  return result + diagnostic.text;
}
