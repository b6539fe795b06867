#include <transform/text/MappingFileKeywords.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>

#include <algorithm>

using orx::Rule;

namespace {

constexpr int kMebibyte = 1024 * 1024;
constexpr std::size_t kLongestStatement = LineReader::kLongestLine;
// What remembering a line takes, in characters.
constexpr std::size_t kCostOfLine = 4;

const QLatin1String kBlockLine("# ");
const QLatin1String kBlockBegin("TRANSFORMER_BEGIN ");
const QLatin1String kBlockEnd("TRANSFORMER_END");

bool isBlank(const QStringRef& text) {
  return std::all_of(text.begin(), text.end(), [](QChar c) { return c.isSpace(); });
}

}  // namespace

int MappingFileStatement::lineAt(int offset) const {
  const auto behind = std::upper_bound(lines.begin(), lines.end(), offset,
                                       [](int wanted, const auto& entry) { return wanted < entry.first; });
  return behind == lines.begin() ? line() : std::prev(behind)->second;
}

MappingFileReader::MappingFileReader(const QString& path, MappingFileReport& report)
    : m_lines(path), m_report(report), m_levels(1) {}

MappingFileReader::MappingFileReader(MappingFileReport& report)
    : m_lines(QString()), m_isFed(true), m_isWhole(false), m_report(report), m_levels(1) {}

bool MappingFileReader::open() {
  const bool opened = m_lines.open();
  m_error = m_lines.errorString();
  return opened;
}

void MappingFileReader::feed(const QByteArray& bytes) {
  if (m_fedBegin > 0) {
    m_fed.remove(0, m_fedBegin);
    m_fedSearched -= m_fedBegin;
    m_fedBegin = 0;
  }
  m_fed += bytes;
}

bool MappingFileReader::takeFedLine(QByteArray& line) {
  const int end = m_fed.indexOf('\n', m_fedSearched);
  const int length = (end < 0 ? m_fed.size() : end) - m_fedBegin;
  m_fedSearched = end < 0 ? m_fed.size() : end + 1;
  if (length > LineReader::kLongestLine) {
    m_report.add(Rule::LongStatement, m_number + 1, {QString::number(kLongestStatement / kMebibyte)});
    m_fed.clear();
    m_fedBegin = m_fedSearched = 0;
    return false;
  }
  if (end < 0 && (!m_isWhole || length == 0))
    return false;
  line = m_fed.mid(m_fedBegin, length);
  if (end >= 0 && line.endsWith('\r'))
    line.chop(1);
  m_fedBegin = m_fedSearched;
  return true;
}

bool MappingFileReader::readLine(QByteArray& line) {
  if (m_lines.next()) {
    m_lastNumber = m_lines.number();
    line = m_lines.line();
    return true;
  }
  // A line that was counted but not given is too long; any other failure is the file's.
  if (m_lines.failed() && m_lines.number() == m_lastNumber) {
    m_error = m_lines.errorString();
  } else if (m_lines.failed()) {
    m_lastNumber = m_lines.number();
    m_report.add(Rule::LongStatement, m_number + 1, {QString::number(kLongestStatement / kMebibyte)});
  }
  return false;
}

bool MappingFileReader::fetchLine() {
  if (m_splitNext == m_split.size()) {
    QByteArray line;
    if (!(m_isFed ? takeFedLine(line) : readLine(line)))
      return false;
    // A carriage return alone ends a line as well.
    m_split = line.split('\r');
    m_splitNext = 0;
  }
  const QByteArray& bytes = m_split.at(m_splitNext++);
  ++m_number;
  // With its size, for a null character would end the text.
  m_line = QString::fromUtf8(bytes.constData(), bytes.size());
  checkBytes(bytes);
  return true;
}

void MappingFileReader::checkBytes(const QByteArray& bytes) {
  if (m_number == 1 && bytes.startsWith("\xef\xbb\xbf"))
    m_report.add(Rule::BadCharacter, m_number, {QStringLiteral("U+FEFF")});
  if (!m_saidEncoding && m_line.contains(QChar(QChar::ReplacementCharacter)) && m_line.toUtf8() != bytes) {
    m_saidEncoding = true;
    m_report.add(Rule::NotUtf8, m_number);
  }
  if (!m_saidNull && bytes.contains('\0')) {
    m_saidNull = true;
    m_report.add(Rule::BadCharacter, m_number, {QStringLiteral("U+0000")});
  }
}

int MappingFileReader::belongingLevels(int& offset) const {
  const int open = static_cast<int>(m_levels.size()) - 1;
  offset = 0;
  for (int depth = 0; depth < open; ++depth) {
    const QStringRef rest = m_line.midRef(offset);
    if (rest == QLatin1String("#")) {
      offset = m_line.size();
      return open;
    }
    if (!rest.startsWith(kBlockLine))
      return depth;
    offset += kBlockLine.size();
  }
  return open;
}

MappingFileReader::Item MappingFileReader::next() {
  Item item = Item::End;
  while (m_hasLine || fetchLine()) {
    m_hasLine = false;
    int offset = 0;
    if (belongingLevels(offset) < static_cast<int>(m_levels.size()) - 1) {
      // The line stands outside of the block that is open.
      m_hasLine = true;
      if (closeLevel(innermost(), item))
        return item;
      return leaveOpenBlock();
    }
    const Taken taken = takeLine(m_line.midRef(offset), item);
    m_hasLine = taken == Taken::ItemAgain;
    if (taken != Taken::Nothing)
      return item;
  }
  if (!m_isWhole)
    return Item::More;
  if (closeLevel(innermost(), item))
    return item;
  if (m_levels.size() == 1)
    return Item::End;
  return leaveOpenBlock();
}

MappingFileReader::Item MappingFileReader::leaveOpenBlock() {
  m_report.add(Rule::OpenBlock, innermost().beginLine,
               {kBlockLine + kBlockBegin.trimmed(), kBlockLine + kBlockEnd});
  m_levels.pop_back();
  return Item::BlockEnd;
}

MappingFileReader::Taken MappingFileReader::takeLine(const QStringRef& content, Item& item) {
  if (m_levels.size() > 1 && content.startsWith(kBlockEnd)) {
    if (closeLevel(innermost(), item))
      return Taken::ItemAgain;
    m_levels.pop_back();
    item = Item::BlockEnd;
    return Taken::Item;
  }
  Level& current = innermost();
  if (current.isDocument)
    return Taken::Nothing;
  if (!current.isContinued) {
    if (isBlank(content))
      return Taken::Nothing;
    if (m_levels.size() > 1 && !current.hasContent && content.startsWith(QLatin1Char('<'))) {
      current.isDocument = true;
      return Taken::Nothing;
    }
    current.hasContent = true;
    if (current.scriptLine == 0 && content.startsWith(kBlockLine)) {
      const QStringRef keyword = content.mid(kBlockLine.size());
      if (keyword.startsWith(kBlockBegin) && static_cast<int>(m_levels.size()) <= kDeepestBlock) {
        m_statement.text = keyword.mid(kBlockBegin.size()).toString();
        m_statement.lines = {{0, m_number}};
        m_levels.emplace_back();
        innermost().beginLine = m_number;
        item = Item::BlockBegin;
        return Taken::Item;
      }
      if (keyword.startsWith(kBlockBegin) && !m_saidDepth) {
        m_saidDepth = true;
        m_report.add(Rule::DeepBlock, m_number, {QString::number(kDeepestBlock)});
      }
      if (keyword.startsWith(kBlockEnd)) {
        if (!m_saidDepth)
          m_report.add(Rule::StrayEnd, m_number, {kBlockLine + kBlockEnd});
        return Taken::Nothing;
      }
    }
  }
  append(current, content);
  return !current.isContinued && finishStatement(current, item) ? Taken::Item : Taken::Nothing;
}

void MappingFileReader::append(Level& level, const QStringRef& content) {
  const bool isFirst = !level.isContinued;
  const QStringRef trimmed = content.trimmed();
  if (isFirst) {
    level.pending = {};
    level.isTooLong = false;
    level.isComment = level.scriptLine == 0 && trimmed.startsWith(QLatin1Char('#'));
  } else if (level.isComment && !trimmed.isEmpty() && !trimmed.startsWith(QLatin1Char('#'))) {
    m_report.add(Rule::ContinuedComment, m_number);
  }
  level.isContinued = content.endsWith(QLatin1Char('\\'));
  const int size = content.size() - (level.isContinued ? 1 : 0);
  const auto room =
      static_cast<std::size_t>(level.pending.text.size()) + level.pending.lines.size() * kCostOfLine;
  if (!level.isTooLong && room + static_cast<std::size_t>(size) > kLongestStatement) {
    level.isTooLong = true;
    m_report.add(Rule::LongStatement, level.pending.line(), {QString::number(kLongestStatement / kMebibyte)});
  }
  if (level.isComment || level.isTooLong) {
    // Their text is of no use; only where they begin.
    level.pending.text.clear();
    level.pending.lines.resize(std::min<std::size_t>(level.pending.lines.size(), 1));
  } else {
    level.pending.lines.emplace_back(level.pending.text.size(), m_number);
    level.pending.text += content.left(size);
  }
}

bool MappingFileReader::finishStatement(Level& level, Item& item) {
  std::swap(m_statement, level.pending);
  level.pending = {};
  const bool isOfUse = !level.isComment && !level.isTooLong;
  level.isComment = false;
  if (!isOfUse)
    return false;
  item = Item::Statement;
  const QStringRef text = QStringRef(&m_statement.text).trimmed();
  if (level.scriptLine != 0) {
    if (text == kIncludeEnd)
      level.scriptLine = 0;
    else
      item = Item::ScriptLine;
  } else if (text == kIncludePython || text == kIncludeTcl) {
    level.scriptLine = m_statement.line();
    level.scriptStart = text.toString();
  }
  return true;
}

bool MappingFileReader::closeLevel(Level& level, Item& item) {
  if (level.isContinued) {
    level.isContinued = false;
    m_report.add(Rule::CutContinuation,
                 level.pending.lines.empty() ? m_number : level.pending.lines.back().second);
    if (finishStatement(level, item))
      return true;
  }
  if (level.scriptLine != 0) {
    m_report.add(Rule::OpenBlock, level.scriptLine, {level.scriptStart, kIncludeEnd});
    level.scriptLine = 0;
  }
  return false;
}
