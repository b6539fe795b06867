#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/generation/ValueConversion.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/TextHelpers.h>

namespace {

QString toPlain(const QString& value, ValueEncoding from) {
  switch (from) {
    case ValueEncoding::Word:
      return QORXWwjdDecode(value);
    case ValueEncoding::UserString:
      return encodeUserString(value);
    case ValueEncoding::Quoted:
      return textOfWord(value);
    case ValueEncoding::Plain:
      break;
  }
  return value;
}

QString fromPlain(const QString& value, ValueEncoding to) {
  switch (to) {
    case ValueEncoding::Word:
      return encodeAroundReferences(value);
    case ValueEncoding::UserString:
      return decodeUserString(value);
    case ValueEncoding::Quoted:
      return quotifyStringForMF(value);
    case ValueEncoding::Plain:
      break;
  }
  return value;
}

}  // namespace

namespace value_conversion {

QString convert(const QString& value, ValueEncoding from, ValueEncoding to, bool quote) {
  const QString converted = from == to || value == kUnusedValue ? value : fromPlain(toPlain(value, from), to);
  const bool mayNeedQuotes = to == ValueEncoding::Plain || to == ValueEncoding::UserString;
  return quote && mayNeedQuotes ? quotifyStringForMF(converted) : converted;
}

}  // namespace value_conversion
