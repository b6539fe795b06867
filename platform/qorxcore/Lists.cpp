#include <platform/qorxcore/Lists.h>

#include <algorithm>

namespace {

bool isBlank(QChar character) {
  return character == QLatin1Char(' ') || character == QLatin1Char('\t');
}

// A list whose separator is the quote itself takes the other quote, so that it can be read back.
QChar quoteBeside(QChar separator, QChar quote) {
  if (quote != separator) {
    return quote;
  }
  return separator == QLatin1Char('"') ? QLatin1Char('\'') : QLatin1Char('"');
}

bool needsQuotes(const QString& element, QChar separator, QChar quote) {
  if (element.isEmpty() || isBlank(element.front()) || isBlank(element.back())) {
    return true;
  }
  return std::any_of(element.cbegin(), element.cend(), [separator, quote](QChar character) {
    return character == separator || character == quote || character == QLatin1Char('\n') ||
           character == QLatin1Char('\r');
  });
}

// Walks a packed list element by element.
class ElementReader {
 public:
  ElementReader(const QString& text, QChar separator, QChar quote)
      : m_text(text), m_separator(separator), m_quote(quote) {}

  bool atEnd() const { return m_position > m_text.size(); }

  // Whether the next element begins with this character, blanks before it aside.
  bool beginsWith(QChar character) const {
    const int start = skipBlanks(m_position);
    return character != m_separator && start < m_text.size() && m_text.at(start) == character;
  }

  // The next element up to its separator, which is stepped over.
  QString next() { return beginsWith(m_quote) ? nextQuoted() : nextPlain(); }

  QString nextPlain() {
    const int start = m_position;
    const int end = separatorFrom(start);
    m_position = end + 1;
    return m_text.mid(start, end - start);
  }

  // An element in braces, which nest; text behind the closing brace makes it a plain element.
  QString nextBraced() {
    const int start = skipBlanks(m_position);
    const int close = closingBrace(start);
    const int end = separatorFrom(std::min(close + 1, m_text.size()));
    const int from = m_position;
    m_position = end + 1;
    if (skipBlanks(close + 1) < end) {
      return m_text.mid(from, end - from);
    }
    return m_text.mid(start + 1, close - start - 1);
  }

 private:
  int skipBlanks(int position) const {
    while (position < m_text.size() && isBlank(m_text.at(position)) && m_text.at(position) != m_separator) {
      ++position;
    }
    return position;
  }

  int separatorFrom(int position) const {
    const int found = m_text.indexOf(m_separator, position);
    return found < 0 ? m_text.size() : found;
  }

  // The end of the text when the brace never closes.
  int closingBrace(int position) const {
    int depth = 0;
    for (; position < m_text.size(); ++position) {
      if (m_text.at(position) == QLatin1Char('{')) {
        ++depth;
      } else if (m_text.at(position) == QLatin1Char('}') && --depth == 0) {
        break;
      }
    }
    return position;
  }

  QString nextQuoted() {
    QString element;
    int position = skipBlanks(m_position) + 1;
    for (;;) {
      int end = m_text.indexOf(m_quote, position);
      const bool closed = end >= 0;
      end = closed ? end : m_text.size();
      element.append(m_text.constData() + position, end - position);
      position = end + 1;
      if (!closed || position >= m_text.size() || m_text.at(position) != m_quote) {
        break;
      }
      element += m_quote;
      ++position;
    }
    position = std::min(position, m_text.size());
    const int end = separatorFrom(position);
    if (skipBlanks(position) < end) {
      element.append(m_text.constData() + position, end - position);
    }
    m_position = end + 1;
    return element;
  }

  const QString& m_text;
  const QChar m_separator;
  const QChar m_quote;
  int m_position = 0;
};

}  // namespace

QStringList QORXSdfStringToList(const QString& text, QChar separator, QChar quote) {
  QStringList list;
  if (text.isEmpty()) {
    return list;
  }
  ElementReader reader(text, separator, quoteBeside(separator, quote));
  while (!reader.atEnd()) {
    list.append(reader.next());
  }
  return list;
}

QString QORXListToSdfString(const QStringList& list, QChar separator, QChar quote) {
  const QChar used = quoteBeside(separator, quote);
  QString packed;
  bool first = true;
  for (const QString& element : list) {
    if (!first) {
      packed += separator;
    }
    first = false;
    if (!needsQuotes(element, separator, used)) {
      packed += element;
      continue;
    }
    packed += used;
    for (const QChar character : element) {
      if (character == used) {
        packed += used;
      }
      packed += character;
    }
    packed += used;
  }
  return packed;
}

QStringList QORXStringToList(const QString& text, QChar separator) {
  QStringList list;
  const QChar quote = quoteBeside(separator, QLatin1Char('"'));
  const auto addPiece = [&list](const QString& piece) {
    if (!piece.isEmpty()) {
      list.append(piece);
    }
  };
  ElementReader reader(text, separator, quote);
  while (!reader.atEnd()) {
    if (reader.beginsWith(quote)) {
      addPiece(reader.next());
    } else if (reader.beginsWith(QLatin1Char('{'))) {
      addPiece(reader.nextBraced());
    } else {
      addPiece(reader.nextPlain().trimmed());
    }
  }
  return list;
}
