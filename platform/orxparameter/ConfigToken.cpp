#include <platform/orxparameter/ConfigToken.h>
#include <platform/qorxcore/WordEncoding.h>

#include <algorithm>

namespace {

const QLatin1Char kQuote('"');

bool isSeparator(QChar c) {
  return c == QLatin1Char('%') || c == QLatin1Char(',');
}

QString inQuotes(QString piece) {
  piece.replace(QLatin1String("\""), QLatin1String("\"\""));
  return kQuote + piece + kQuote;
}

void keepOnOneLine(QString& config) {
  config.replace(QLatin1Char('\n'), QLatin1String("<u000a>"));
  config.replace(QLatin1Char('\r'), QLatin1String("<u000d>"));
}

}  // namespace

bool ORX_isBlank(QChar c) {
  const ushort code = c.unicode();
  return code == ' ' || (code >= '\t' && code <= '\r');
}

int ORX_closingQuote(const QString& text, int open) {
  for (int at = text.indexOf(kQuote, open + 1); at >= 0; at = text.indexOf(kQuote, at + 2)) {
    if (at + 1 == text.size() || text.at(at + 1) != kQuote) {
      return at;
    }
  }
  return -1;
}

QString ORX_quoteConfigPiece(const QString& piece) {
  const auto needsQuotes = [](QChar c) { return ORX_isBlank(c) || isSeparator(c) || c == kQuote; };
  if (!piece.isEmpty() && std::none_of(piece.cbegin(), piece.cend(), needsQuotes)) {
    return piece;
  }
  QString quoted = inQuotes(piece);
  keepOnOneLine(quoted);
  return quoted;
}

QStringList ORX_splitConfig(const QString& config, QChar separator) {
  QStringList pieces;
  QString piece;
  bool quoted = false;
  const auto finish = [&] {
    if (quoted || !piece.isEmpty()) {
      pieces.append(piece);
    }
  };
  ConfigPieceReader reader(config);
  while (reader.next()) {
    if (reader.before() == separator) {
      finish();
      piece.clear();
      quoted = false;
    } else if (!reader.before().isNull()) {
      piece += reader.before();
    }
    piece += reader.text();
    quoted = quoted || reader.isQuoted();
  }
  finish();
  return pieces;
}

QString ORX_readConfig(const QString& text, int& position, ConfigEnd end) {
  QString config;
  const int size = text.size();
  while (position < size) {
    const int start = position;
    bool sound = true;
    if (text.at(start) == kQuote) {
      // At most one search fails per text: behind an open quote that is never closed only doubled quotes are
      // left, and those close each other.
      const int close = ORX_closingQuote(text, start);
      if (close < 0) {
        sound = false;
      } else {
        position = close + 1;
      }
    }
    for (; position < size && !isSeparator(text.at(position)); ++position) {
      if (ORX_isBlank(text.at(position))) {
        if (end == ConfigEnd::FirstBlank) {
          break;
        }
        sound = false;
      }
    }
    const QString piece = text.mid(start, position - start);
    config += sound ? piece : inQuotes(piece);
    if (position == size || !isSeparator(text.at(position))) {
      break;
    }
    config += text.at(position++);
  }
  keepOnOneLine(config);
  return config == QLatin1String("\"\"") ? QString() : config;
}

QStringList ORX_readMemberConfig(const QString& config) {
  QStringList parts;
  QString part;
  ConfigPieceReader reader(config);
  while (reader.next()) {
    if (reader.before() == QLatin1Char(',')) {
      parts.append(QORXWwjdDecode(part));
      part.clear();
    } else if (!reader.before().isNull()) {
      part += reader.before();
    }
    part += reader.text();
  }
  parts.append(QORXWwjdDecode(part));
  return parts;
}

bool ConfigPieceReader::next() {
  const int size = m_config.size();
  if (m_started ? m_after.isNull() : size == 0) {
    return false;
  }
  m_started = true;
  m_before = m_after;
  m_after = QChar();
  m_text.clear();
  m_quoted = false;
  if (m_position < size && m_config.at(m_position) == kQuote) {
    const int close = ORX_closingQuote(m_config, m_position);
    if (close >= 0) {
      m_text = m_config.mid(m_position + 1, close - m_position - 1);
      m_text.replace(QLatin1String("\"\""), QLatin1String("\""));
      m_quoted = true;
      m_position = close + 1;
    }
  }
  const int start = m_position;
  while (m_position < size && !isSeparator(m_config.at(m_position))) {
    ++m_position;
  }
  m_text += m_config.midRef(start, m_position - start);
  if (m_position < size) {
    m_after = m_config.at(m_position++);
  }
  return true;
}
