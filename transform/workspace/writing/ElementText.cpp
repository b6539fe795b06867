#include <transform/workspace/writing/ElementText.h>

namespace {

QLatin1String entityOf(ushort unit) {
  switch (unit) {
    case '&':
      return QLatin1String("&amp;");
    case '<':
      return QLatin1String("&lt;");
    case '>':
      return QLatin1String("&gt;");
    case '\'':
      return QLatin1String("&apos;");
    case '"':
      return QLatin1String("&quot;");
    case '\n':
      return QLatin1String("&#10;");
    case '\r':
      return QLatin1String("&#13;");
    case '\t':
      return QLatin1String("&#9;");
    default:
      return QLatin1String();
  }
}

bool holdsEverything(const QTextCodec& codec) {
  const QByteArray name = codec.name().toUpper();
  return name.startsWith("UTF-") || name == "GB18030";
}

}  // namespace

ElementText::ElementText(const QTextCodec* codec)
    : m_codec(codec && !holdsEverything(*codec) ? codec : nullptr) {}

void ElementText::openSection(const Word& name) {
  m_text += QLatin1Char('<');
  word(name);
  m_text += QLatin1String(">\n");
}

void ElementText::closeElement(const Word& name) {
  m_text += QLatin1String("</");
  word(name);
  m_text += QLatin1String(">\n");
}

void ElementText::beginElement(const Word& name) {
  m_text += QLatin1Char('<');
  word(name);
  m_text += QLatin1Char('\n');
}

void ElementText::attribute(QStringView name, const QString& value) {
  m_text += QLatin1String("  ");
  m_text.append(name.data(), static_cast<int>(name.size()));
  m_text += QLatin1String("=\"");
  escaped(value);
  m_text += QLatin1String("\"\n");
}

void ElementText::endAttributes(bool childrenFollow) {
  m_text += childrenFollow ? QLatin1String(">\n") : QLatin1String("/>\n");
}

void ElementText::escaped(const QString& value) {
  const ushort* const end = value.utf16() + value.size();
  const ushort* plain = value.utf16();
  for (const ushort* at = plain; at != end; ++at) {
    // All characters that need an entity stand below this one.
    if (*at > '>')
      continue;
    const QLatin1String entity = entityOf(*at);
    if (entity.size() == 0)
      continue;
    escapedSpan(plain, at);
    m_text += entity;
    plain = at + 1;
  }
  escapedSpan(plain, end);
}

void ElementText::escapedSpan(const ushort* begin, const ushort* end) {
  const auto append = [&](const ushort* from, const ushort* to) {
    m_text.append(reinterpret_cast<const QChar*>(from), static_cast<int>(to - from));
  };
  if (!m_codec) {
    append(begin, end);
    return;
  }
  const ushort* plain = begin;
  for (const ushort* at = begin; at != end;) {
    const int units = QChar::isHighSurrogate(*at) && at + 1 != end ? 2 : 1;
    if (*at >= 0x80 && !m_codec->canEncode(QString(reinterpret_cast<const QChar*>(at), units))) {
      const uint code = units == 2 ? QChar::surrogateToUcs4(at[0], at[1]) : *at;
      append(plain, at);
      m_text += QStringLiteral("&#%1;").arg(code);
      plain = at + units;
    }
    at += units;
  }
  append(plain, end);
}
