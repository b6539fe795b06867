#include <transform/core/GenerationKeywords.h>
#include <transform/core/TokenScanner.h>
#include <transform/core/generation/OrderedSubstitution.h>

#include <QRegularExpression>

#include <algorithm>

namespace {

QString reference(const QString& token) {
  return QLatin1String("$(") + token + QLatin1Char(')');
}

const QRegularExpression& wildcardStart() {
  static const QRegularExpression pattern(QStringLiteral("OUTPUT.*FEATURE_TYPE[ \\t]+\\*"));
  return pattern;
}

// The two forms in which a clause begins.
bool beginsClause(const QString& line) {
  static const QRegularExpression token(QStringLiteral("\\$\\(OUTPUT_.*_FTYPE\\)"));
  static const QRegularExpression text(QStringLiteral("OUTPUT.*FEATURE_TYPE"));
  return token.match(line).hasMatch() || text.match(line).hasMatch();
}

bool isBlank(const QString& line) {
  return std::all_of(line.begin(), line.end(), [](QChar c) { return c.isSpace(); });
}

}  // namespace

OrderedSubstitution::OrderedSubstitution(const QStringList& lines)
    : m_lines(lines), m_removed(static_cast<std::size_t>(lines.size()), false) {
  for (int line = 0; line < m_lines.size(); ++line) {
    m_size += m_lines.at(line).size();
    scan(line, true);
  }
  m_largestSize += m_size;
}

void OrderedSubstitution::scan(int line, bool countsTokens) {
  TokenScanner scanner(m_lines.at(line));
  while (scanner.next()) {
    const QString name = scanner.name().toString();
    if (countsTokens) {
      ++m_counts[name];
    }
    std::vector<int>& where = m_where[name];
    if (where.empty() || where.back() != line) {
      where.push_back(line);
    }
  }
  m_hasOddTokens = m_hasOddTokens || scanner.isNested() || scanner.endsOpen();
}

std::vector<int> OrderedSubstitution::candidates(const QString& token) const {
  std::vector<int> lines;
  if (TokenScanner::isPlainName(token)) {
    lines = m_where.value(token);
    std::sort(lines.begin(), lines.end());
    lines.erase(std::unique(lines.begin(), lines.end()), lines.end());
  } else if (m_hasOddTokens) {
    lines.reserve(m_removed.size());
    for (int line = 0; line < m_lines.size(); ++line) {
      lines.push_back(line);
    }
  }
  return lines;
}

bool OrderedSubstitution::holds(int line, const QString& text) const {
  return !m_removed[static_cast<std::size_t>(line)] && m_lines.at(line).contains(text);
}

bool OrderedSubstitution::contains(const QString& token) const {
  const QString text = reference(token);
  const std::vector<int> lines = candidates(token);
  return std::any_of(lines.begin(), lines.end(), [&](int line) { return holds(line, text); });
}

void OrderedSubstitution::substitute(const QString& token, const QString& value) {
  const QString text = reference(token);
  m_largestSize += (kFactor + m_counts.take(token)) * value.size();
  const bool mayBringTokens = value.contains(QLatin1Char('$')) || m_hasOddTokens;
  for (const int line : candidates(token)) {
    if (!holds(line, text)) {
      continue;
    }
    QString& changed = m_lines[line];
    const qint64 growth = qint64(changed.count(text)) * (value.size() - text.size());
    if (m_size + growth > m_largestSize) {
      m_isTooLarge = true;
      continue;
    }
    changed.replace(text, value);
    m_size += growth;
    if (isBlank(changed)) {
      remove(line);
    } else if (mayBringTokens) {
      scan(line, false);
    }
  }
}

void OrderedSubstitution::removeLinesWith(const QString& token) {
  const QString text = reference(token);
  for (const int line : candidates(token)) {
    if (holds(line, text)) {
      remove(line);
    }
  }
}

void OrderedSubstitution::removeOutputClause(const QString& tag, bool wildcard) {
  const QString startToken = kOutputTokenStart + tag + kFeatureTypeTokenEnd;
  const QString start = reference(startToken);
  const QString end = reference(kOutputTokenStart + tag + kFunctionsTokenEnd);
  if (wildcard) {
    for (int line = 0; line < m_lines.size(); ++line) {
      if (!m_removed[static_cast<std::size_t>(line)] && wildcardStart().match(m_lines.at(line)).hasMatch()) {
        removeClauseFrom(line, end, start, wildcard);
      }
    }
    return;
  }
  for (const int line : candidates(startToken)) {
    if (holds(line, start)) {
      removeClauseFrom(line, end, start, wildcard);
    }
  }
}

void OrderedSubstitution::removeClauseFrom(int line, const QString& end, const QString& start,
                                           bool wildcard) {
  remove(line);
  if (m_lines.at(line).contains(end)) {
    return;
  }
  for (++line; line < m_lines.size(); ++line) {
    if (m_removed[static_cast<std::size_t>(line)]) {
      continue;
    }
    const QString& text = m_lines.at(line);
    const bool isEnd = text.contains(end);
    const bool isOwn = isEnd || text.contains(start) || (wildcard && wildcardStart().match(text).hasMatch());
    if (isBlank(text) || (!isOwn && beginsClause(text))) {
      return;
    }
    remove(line);
    if (isEnd) {
      return;
    }
  }
}

QStringList OrderedSubstitution::lines() const {
  QStringList left;
  left.reserve(m_lines.size());
  for (int line = 0; line < m_lines.size(); ++line) {
    if (!m_removed[static_cast<std::size_t>(line)]) {
      left.append(m_lines.at(line));
    }
  }
  return left;
}
