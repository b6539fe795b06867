#include <transform/workspace/reading/DocumentLimits.h>
#include <transform/workspace/records/RecordCheck.h>
#include <transform/workspace/writing/ElementText.h>
#include <transform/workspace/writing/XmlText.h>

QString valueRefusal(const QString& value) {
  const int at = firstForbidden(value);
  if (at >= 0) {
    return QStringLiteral("the character U+%1 cannot stand in a document")
        .arg(value[at].unicode(), 4, 16, QLatin1Char('0'));
  }
  // No escape is longer than this; only a value that may be too long is escaped to find out.
  constexpr int kLongestEscape = 10;
  if (value.size() > limits::kValueLength / kLongestEscape) {
    ElementText text;
    text.escaped(value);
    if (text.text().size() > limits::kValueLength)
      return QStringLiteral("a value is longer than %1 characters").arg(limits::kValueLength);
  }
  return QString();
}
