#include <transform/custom/ParameterReferences.h>

#include <QRegularExpression>

namespace {

const QRegularExpression& pattern() {
  static const QRegularExpression reference(QStringLiteral("\\$\\(([^$()]*)\\)"));
  return reference;
}

}  // namespace

QString replaceParameterReferences(const QString& text,
                                   const std::function<bool(const QString&, QString&)>& replace) {
  QString replaced;
  int copied = 0;
  for (auto match = pattern().globalMatch(text); match.hasNext();) {
    const QRegularExpressionMatch found = match.next();
    QString replacement;
    if (!replace(found.captured(1), replacement))
      continue;
    replaced += text.mid(copied, found.capturedStart() - copied) + replacement;
    copied = found.capturedEnd();
  }
  return copied == 0 ? text : replaced + text.mid(copied);
}

bool anyParameterReference(const QString& text, const std::function<bool(const QString&)>& matches) {
  for (auto match = pattern().globalMatch(text); match.hasNext();) {
    if (matches(match.next().captured(1)))
      return true;
  }
  return false;
}
