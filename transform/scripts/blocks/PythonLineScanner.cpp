#include <transform/scripts/ScriptBlocks.h>
#include <transform/scripts/blocks/PythonLineScanner.h>
#include <transform/text/MessageNumbers.h>

#include <QRegularExpression>

namespace messages = orx::messages;

namespace {

bool isQuote(QChar character) {
  return character == QLatin1Char('\'') || character == QLatin1Char('"');
}

bool isTripleAt(const QString& line, int at) {
  return at + 2 < line.size() && line[at + 1] == line[at] && line[at + 2] == line[at];
}

// Whether the letters in front of a quote make the text a formatted one.
bool isFormattedPrefix(const QString& line, int quoteAt) {
  bool formatted = false;
  for (int i = quoteAt - 1; i >= 0 && i >= quoteAt - 2; --i) {
    const QChar letter = line[i].toLower();
    if (letter == QLatin1Char('f')) {
      formatted = true;
    } else if (letter != QLatin1Char('r')) {
      break;
    }
  }
  return formatted;
}

// The prefix is put in front of the key with "+", so an operator in the key that binds less would take it
// apart.
bool isSafeBehindPlus(const QString& key) {
  constexpr int kLongestKey = 300;
  if (key.size() > kLongestKey) {
    return false;
  }
  static const QRegularExpression kLiteral(QStringLiteral("'[^']*'|\"[^\"]*\""));
  static const QRegularExpression kLooseOperator(
      QStringLiteral("\\b(?:if|or|and|not|in|is|lambda)\\b|[<>=,:&|^]"));
  QString code = key;
  code.replace(kLiteral, QStringLiteral("''"));
  return !kLooseOperator.match(code).hasMatch();
}

}  // namespace

ScriptRefusal PythonLineScanner::scan(const QString& line, bool redirectsLookups) {
  ++m_line;
  if (!m_quote.isNull()) {
    return {messages::kScriptTextOfSeveralLines, m_line};
  }
  m_hasStatementMark = false;
  m_sawSemicolon = false;
  const QVector<ScriptKey> keys = redirectsLookups ? redirectedPythonKeys(line) : QVector<ScriptKey>();
  int nextKey = 0;
  ScriptRefusal refusal;
  int at = 0;
  while (at < line.size()) {
    while (nextKey < keys.size() && keys[nextKey].position <= at) {
      const ScriptKey& key = keys[nextKey++];
      if (!isRedirectable() || !isSafeBehindPlus(line.mid(key.position, key.length))) {
        return {messages::kScriptLookup, m_line};
      }
    }
    if (m_quote.isNull() && line[at] == QLatin1Char('#')) {
      m_lineEnd = LineEnd::Comment;
      return {};
    }
    at = m_quote.isNull() ? scanCode(line, at, refusal) : scanText(line, at);
    if (refusal) {
      return refusal;
    }
  }
  m_lineEnd = m_quote.isNull() ? LineEnd::Code : m_isTriple ? LineEnd::TextOfSeveralLines : LineEnd::Text;
  return {};
}

// The lookup's own quotes are single ones; they fit into a replacement field of a text in other quotes alone.
bool PythonLineScanner::isRedirectable() const {
  return m_quote.isNull() || (m_isFormatted && m_formatBraces > 0 && m_quote != QLatin1Char('\''));
}

int PythonLineScanner::scanText(const QString& line, int at) {
  const QChar character = line[at];
  if (character == QLatin1Char('\\')) {
    return at + 2;
  }
  if (character == m_quote && (!m_isTriple || isTripleAt(line, at))) {
    m_quote = QChar();
    return at + (m_isTriple ? 3 : 1);
  }
  if (m_isFormatted && (character == QLatin1Char('{') || character == QLatin1Char('}'))) {
    const bool doubled = at + 1 < line.size() && line[at + 1] == character;
    if (m_formatBraces == 0 && doubled) {
      return at + 2;
    }
    m_formatBraces += character == QLatin1Char('{') ? 1 : -1;
  }
  return at + 1;
}

int PythonLineScanner::scanCode(const QString& line, int at, ScriptRefusal& refusal) {
  const QChar character = line[at];
  if (m_sawSemicolon && !character.isSpace()) {
    m_hasStatementMark = true;
  }
  if (isQuote(character)) {
    m_quote = character;
    m_isTriple = isTripleAt(line, at);
    m_isFormatted = isFormattedPrefix(line, at);
    m_formatBraces = 0;
    return at + (m_isTriple ? 3 : 1);
  }
  switch (character.unicode()) {
    case u'(':
      m_brackets.append({QLatin1Char(')'), m_line});
      break;
    case u'[':
      m_brackets.append({QLatin1Char(']'), m_line});
      break;
    case u'{':
      m_brackets.append({QLatin1Char('}'), m_line});
      break;
    case u')':
    case u']':
    case u'}':
      if (m_brackets.isEmpty() || m_brackets.last().close != character) {
        refusal = {messages::kScriptUnbalanced, m_line};
        return at;
      }
      m_brackets.removeLast();
      break;
    default:
      if (m_brackets.isEmpty()) {
        noteStatementMark(line, at);
      }
      break;
  }
  return at + 1;
}

void PythonLineScanner::noteStatementMark(const QString& line, int at) {
  const auto charAt = [&line](int index) {
    return index >= 0 && index < line.size() ? line[index] : QChar();
  };
  const QChar character = line[at];
  if (character == QLatin1Char(':')) {
    m_hasStatementMark = true;
  } else if (character == QLatin1Char(';')) {
    m_sawSemicolon = true;
  } else if (character == QLatin1Char('=') && charAt(at + 1) != character) {
    const QChar before = charAt(at - 1);
    const bool isShift = before == charAt(at - 2);
    const bool isComparison = before == QLatin1Char('=') || before == QLatin1Char('!') ||
                              ((before == QLatin1Char('<') || before == QLatin1Char('>')) && !isShift);
    m_hasStatementMark = m_hasStatementMark || !isComparison;
  }
}
