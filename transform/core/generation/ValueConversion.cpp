#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/MacroText.h>
#include <transform/core/generation/ValueConversion.h>
#include <transform/text/TextHelpers.h>

namespace {

// The inverse of quotifyStringForMF().
QString unquoted(const QString& text) {
  if (text.size() < 2 || !text.startsWith(QLatin1Char('"')) || !text.endsWith(QLatin1Char('"'))) {
    return text;
  }
  QString inner = text.mid(1, text.size() - 2);
  int trailing = 0;
  while (trailing < inner.size() && inner.at(inner.size() - 1 - trailing) == QLatin1Char('\\')) {
    ++trailing;
  }
  inner.chop(trailing / 2);
  return inner.replace(QLatin1String("\\\""), QLatin1String("\""));
}

QString toPlain(const QString& value, ValueEncoding from) {
  switch (from) {
    case ValueEncoding::Word:
      return QORXWwjdDecode(value);
    case ValueEncoding::UserString:
      return encodeUserString(value);
    case ValueEncoding::Quoted:
      return unquoted(value);
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
