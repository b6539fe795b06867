#include <transform/core/GenerationKeywords.h>
#include <transform/core/Keywords.h>
#include <transform/core/TokenScanner.h>

namespace {

bool hasTag(const QString& name, QLatin1String start, QLatin1String end) {
  return name.size() > start.size() + end.size() && name.startsWith(start) && name.endsWith(end);
}

}  // namespace

bool isReservedToken(const QString& name) {
  return name == kInputLinesToken || name == kUuidToken || name == kEncodedNameToken ||
         name == kIdentifierParameter || name == kSchemaToken || name == kValueListToken ||
         hasTag(name, kInputTokenStart, kInputTokenEnd) ||
         hasTag(name, kOutputTokenStart, kFeatureTypeTokenEnd) ||
         hasTag(name, kOutputTokenStart, kFunctionsTokenEnd);
}

namespace {

bool isSpecial(QChar c) {
  return c == QLatin1Char('$') || c == QLatin1Char('(') || c == QLatin1Char(')');
}

}  // namespace

bool TokenScanner::next() {
  const int size = m_text.size();
  const QChar* text = m_text.constData();
  int at = m_text.indexOf(QLatin1Char('$'), m_end);
  while (at >= 0) {
    if (at + 1 == size) {
      m_endsOpen = true;
      break;
    }
    if (text[at + 1] != QLatin1Char('(')) {
      m_isNested = m_isNested || text[at + 1] == QLatin1Char('$');
      at = m_text.indexOf(QLatin1Char('$'), at + 1);
      continue;
    }
    int stop = at + 2;
    while (stop < size && !isSpecial(text[stop])) {
      ++stop;
    }
    if (stop == size) {
      m_endsOpen = true;
      break;
    }
    if (text[stop] == QLatin1Char(')')) {
      m_begin = at;
      m_end = stop + 1;
      return true;
    }
    m_isNested = true;
    at = m_text.indexOf(QLatin1Char('$'), stop);
  }
  m_begin = m_end = size;
  return false;
}

bool TokenScanner::isPlainName(const QString& name) {
  for (const QChar c : name) {
    if (isSpecial(c)) {
      return false;
    }
  }
  return true;
}
