#include <transform/text/MessageNumbers.h>
#include <transform/workspace/reading/DocumentLimits.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/records/RecordCheck.h>
#include <transform/workspace/writing/ElementText.h>
#include <transform/workspace/writing/XmlText.h>

namespace messages = orx::messages;

QString valueRefusal(const QString& value) {
  const int at = firstForbidden(value);
  if (at >= 0) {
    return documentText(messages::kForbiddenCharacter,
                        {QString::number(value[at].unicode(), 16).rightJustified(4, QLatin1Char('0'))});
  }
  // No escape is longer than this; only a value that may be too long is escaped to find out.
  constexpr int kLongestEscape = 10;
  if (value.size() > limits::kValueLength / kLongestEscape) {
    ElementText text;
    text.escaped(value);
    if (text.text().size() > limits::kValueLength)
      return documentText(messages::kLongDocumentValue, {QString::number(limits::kValueLength)});
  }
  return QString();
}
