#include <transform/findings/Finding.h>

namespace orx {

QString textWithNode(const Finding& finding) {
  return finding.node.isEmpty() ? finding.text : finding.node + QLatin1String(": ") + finding.text;
}

QString formatFinding(const QString& file, int line, const QString& severity, const QString& text) {
  const QString place = line > 0 ? file + QLatin1Char(':') + QString::number(line) : file;
  return place + QLatin1String(": ") + severity + QLatin1String(": ") + text;
}

QString formatFinding(const Finding& finding) {
  return formatFinding(finding.file, finding.line, severityName(finding.severity), textWithNode(finding));
}

}  // namespace orx
