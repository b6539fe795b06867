#include <transform/workspace/AttributeScan.h>

namespace {

constexpr int kLongestReference = 16;

bool isBlank(char c) {
  return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

bool endsName(char c) {
  return isBlank(c) || c == '=' || c == '>' || c == '/' || c == '<' || c == '"' || c == '\'';
}

// The character that a reference between "&" and ";" stands for, as far as it is ASCII; 0 for any other.
char referenced(const QByteArray& reference) {
  if (!reference.startsWith('#'))
    return 0;
  const bool isHexadecimal = reference.mid(1, 1) == "x";
  bool isNumber = false;
  const uint code = reference.mid(isHexadecimal ? 2 : 1).toUInt(&isNumber, isHexadecimal ? 16 : 10);
  return isNumber && code < 0x80 ? static_cast<char>(code) : '\0';
}

class AttributeScan {
 public:
  AttributeScan(const QByteArray& text, const QByteArray& name) : m_text(text), m_name(name) {}

  QByteArray last() {
    while ((m_at = m_text.indexOf('<', m_at)) >= 0) {
      if (!skip("<!--", "-->") && !skip("<![CDATA[", "]]>") && !skip("<?", "?>"))
        readTag();
      if (m_at < 0)
        break;
    }
    return m_value;
  }

 private:
  bool skip(const char* begin, const char* end) {
    if (qstrncmp(m_text.constData() + m_at, begin, qstrlen(begin)) != 0)
      return false;
    m_at = m_text.indexOf(end, m_at + static_cast<int>(qstrlen(begin)));
    return true;
  }

  bool isAtEnd() const { return m_at >= m_text.size(); }

  // A line break is followed by the mark of the comment line.
  void skipBlanks() {
    while (!isAtEnd() && isBlank(m_text[m_at])) {
      if (m_text[m_at++] != '\n')
        continue;
      while (!isAtEnd() && m_text[m_at] == ' ')
        ++m_at;
      if (qstrncmp(m_text.constData() + m_at, "#!", 2) == 0)
        m_at += 2;
    }
  }

  QByteArray readName() {
    const int begin = m_at;
    while (!isAtEnd() && !endsName(m_text[m_at]))
      ++m_at;
    return m_text.mid(begin, m_at - begin);
  }

  void readTag() {
    ++m_at;
    readName();
    while (!isAtEnd() && m_text[m_at] != '>' && m_text[m_at] != '<') {
      const int before = m_at;
      skipBlanks();
      const QByteArray name = readName();
      skipBlanks();
      if (!name.isEmpty() && !isAtEnd() && m_text[m_at] == '=') {
        ++m_at;
        skipBlanks();
        readValue(name == m_name);
      }
      if (m_at < 0)
        return;
      if (m_at == before)
        ++m_at;
    }
  }

  void readValue(bool isWanted) {
    if (isAtEnd() || (m_text[m_at] != '"' && m_text[m_at] != '\''))
      return;
    const int begin = m_at + 1;
    const int end = m_text.indexOf(m_text[m_at], begin);
    m_at = end < 0 ? end : end + 1;
    if (end < 0 || !isWanted)
      return;
    m_value = QByteArray("");
    for (int at = begin; at < end; ++at) {
      const int length = m_text[at] == '&' ? m_text.mid(at, kLongestReference).indexOf(';') : -1;
      const char character = length > 0 ? referenced(m_text.mid(at + 1, length - 1)) : '\0';
      m_value += character ? character : m_text[at];
      if (character)
        at += length;
    }
  }

  const QByteArray& m_text;
  const QByteArray& m_name;
  int m_at = 0;
  QByteArray m_value;
};

}  // namespace

QByteArray lastAttributeValue(const QByteArray& commentedXml, const QByteArray& name) {
  return AttributeScan(commentedXml, name).last();
}
