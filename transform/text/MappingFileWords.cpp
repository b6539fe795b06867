#include <platform/qorxcore/Quoting.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/TextHelpers.h>

namespace {

const QLatin1Char kQuote('"');
const QLatin1Char kBackslash('\\');
// Between quoted texts that are a list: one word, which stands for itself.
const QLatin1String kNextQuoted(",\"");

bool isBlank(QChar c) {
  return c == QLatin1Char(' ') || c == QLatin1Char('\t');
}

bool isNameCharacter(QChar c) {
  return c.unicode() < 0x80 && (c.isLetterOrNumber() || c == QLatin1Char('_'));
}

int backslashesAtEnd(const QString& text) {
  int count = 0;
  while (count < text.size() && text.at(text.size() - 1 - count) == kBackslash)
    ++count;
  return count;
}

// What stands between the quotes of a word, read.
QString readInside(const QStringRef& inside) {
  QString text;
  text.reserve(inside.size());
  for (int i = 0; i < inside.size(); ++i) {
    const bool isEscape = inside.at(i) == kBackslash && i + 1 < inside.size() && inside.at(i + 1) == kQuote;
    text += inside.at(isEscape ? ++i : i);
  }
  // Backslashes directly before the closing quote are doubled.
  text.chop(backslashesAtEnd(text) / 2);
  return text;
}

}  // namespace

QString quotifyStringForMF(const QString& text) {
  static const QString kSpecials = QStringLiteral(" \t()\\\"");
  QString quoted = QORXQuotifyString(text, kSpecials);
  if (quoted.size() < 3 || !quoted.startsWith(kQuote) || !quoted.endsWith(kQuote))
    return quoted;
  QString inner = quoted.mid(1, quoted.size() - 2);
  inner.replace(kQuote, QLatin1String("\\\""));
  return kQuote + inner + QString(backslashesAtEnd(inner), kBackslash) + kQuote;
}

bool canBeWord(const QString& text) {
  return !text.contains(QLatin1String("\\\""));
}

QString textOfWord(const QString& word) {
  const bool isQuoted = word.size() >= 2 && word.startsWith(kQuote) && word.endsWith(kQuote);
  return isQuoted ? readInside(word.midRef(1, word.size() - 2)) : word;
}

QString MappingFileWord::value() const {
  if (kind != Kind::Quoted)
    return text.toString();
  return readInside(text.mid(1, text.size() - (isClosed ? 2 : 1)));
}

bool MappingFileWords::next(MappingFileWord& word) {
  while (m_position < m_text.size() && isBlank(m_text.at(m_position)))
    ++m_position;
  if (m_position >= m_text.size())
    return false;
  word = {};
  const int begin = m_position;
  if (m_text.at(begin) == kQuote) {
    word.kind = MappingFileWord::Kind::Quoted;
    m_position = endOfQuote(begin, word);
    while (word.isClosed && m_text.midRef(m_position, kNextQuoted.size()) == kNextQuoted) {
      word.kind = MappingFileWord::Kind::Bare;
      m_position = endOfQuote(m_position + 1, word);
    }
    word.isGlued = word.isClosed && m_position < m_text.size() && !isBlank(m_text.at(m_position));
  } else {
    const QStringRef name = mappingFileCallName(m_text, begin, m_text.size());
    int from = begin;
    if (!name.isEmpty()) {
      word.kind = MappingFileWord::Kind::Call;
      const int end = endOfMappingFileCall(m_text, begin + 1 + name.size(), m_text.size());
      word.isClosed = end >= 0;
      from = word.isClosed ? end : m_text.size();
    }
    m_position = endOfBare(from, word);
  }
  word.text = m_text.midRef(begin, m_position - begin);
  return true;
}

// One backslash escapes a quote; before the closing quote they are doubled, so there is an even number of
// them.
int MappingFileWords::endOfQuote(int open, MappingFileWord& word) const {
  bool isEscaped = false;
  for (int i = open + 1; i < m_text.size(); ++i) {
    if (m_text.at(i) == kQuote && !isEscaped)
      return i + 1;
    isEscaped = m_text.at(i) == kBackslash && !isEscaped;
  }
  word.isClosed = false;
  return m_text.size();
}

int MappingFileWords::endOfBare(int from, MappingFileWord& word) const {
  int i = from;
  while (i < m_text.size() && !isBlank(m_text.at(i))) {
    if (m_isSettings && m_text.at(i) == kQuote && i > from && m_text.at(i - 1) == QLatin1Char(':')) {
      const int end = endOfQuote(i, word);
      if (!word.isClosed)
        return end;
      i = end;
    } else {
      ++i;
    }
  }
  return i;
}

QStringRef mappingFileCallName(const QString& text, int position, int end) {
  if (position >= end || text.at(position) != QLatin1Char('@'))
    return {};
  int i = position + 1;
  while (i < end && isNameCharacter(text.at(i)))
    ++i;
  const bool isCall = i > position + 1 && i < end && text.at(i) == QLatin1Char('(');
  return isCall ? text.midRef(position + 1, i - position - 1) : QStringRef();
}

int endOfMappingFileCall(const QString& text, int open, int end) {
  int parentheses = 0;
  int braces = 0;
  bool isQuoted = false;
  for (int i = open; i < end; ++i) {
    switch (text.at(i).unicode()) {
      case '"':
        isQuoted = braces == 0 && !isQuoted;
        break;
      case '{':
        braces += isQuoted ? 0 : 1;
        break;
      case '}':
        braces -= isQuoted || braces == 0 ? 0 : 1;
        break;
      case '(':
        parentheses += isQuoted || braces > 0 ? 0 : 1;
        break;
      case ')':
        parentheses -= isQuoted || braces > 0 ? 0 : 1;
        if (parentheses == 0 && !isQuoted && braces == 0)
          return i + 1;
        break;
      default:
        break;
    }
  }
  return -1;
}
