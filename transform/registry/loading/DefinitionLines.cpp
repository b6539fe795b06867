#include <transform/registry/loading/DefinitionLines.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QIODevice>
#include <QTextCodec>

#include <algorithm>
#include <cstring>

namespace messages = orx::messages;

namespace {

constexpr int kMibUtf8 = 106;
const char kByteOrderMark[] = "\xEF\xBB\xBF";
constexpr int kByteOrderMarkSize = 3;

bool isAscii(const char* bytes, int size) {
  return std::all_of(bytes, bytes + size, [](char c) { return static_cast<unsigned char>(c) < 0x80; });
}

bool isWhiteSpace(char c) {
  return c == ' ' || (c >= '\t' && c <= '\r');
}

QString decoded(const char* bytes, int size, QTextCodec::ConverterState& state) {
  static const QTextCodec* const utf8 = QTextCodec::codecForMib(kMibUtf8);
  return utf8->toUnicode(bytes, size, &state);
}

QString decoded(const char* bytes, int size) {
  if (isAscii(bytes, size)) {
    return QString::fromLatin1(bytes, size);  // most lines by far
  }
  QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
  return decoded(bytes, size, state);
}

}  // namespace

QString DefinitionLines::tooLargeMessage() {
  return TransformResString(messages::kFileTooLarge, QString::number(kLargestFile / (1024 * 1024)));
}

void DefinitionLines::open(const QByteArray& bytes, bool isWholeFile) {
  *this = DefinitionLines();
  m_bytes = bytes;
  if (isWholeFile && m_bytes.startsWith(kByteOrderMark)) {
    m_end = kByteOrderMarkSize;
  }
}

bool DefinitionLines::open(QIODevice& device) {
  // As much as the device says it has and one byte more, so that one reading tells its end; a pipe says
  // nothing and gives its content in pieces.
  constexpr qint64 kPiece = 256 * 1024;
  const qint64 told = device.isSequential() ? 0 : std::min(device.size() - device.pos(), kLargestFile);
  qint64 piece = told > 0 ? told + 1 : kPiece;
  QByteArray bytes;
  for (qint64 size = 0; size <= kLargestFile; size = bytes.size(), piece = kPiece) {
    bytes.resize(static_cast<int>(size + piece));
    const qint64 got = device.read(bytes.data() + size, piece);
    bytes.truncate(static_cast<int>(size + std::max<qint64>(got, 0)));
    if (got <= 0) {
      // At its end a sequential device may answer as for an error.
      if (got < 0 && !device.isSequential()) {
        m_error = device.errorString();
        return false;
      }
      break;
    }
    if (bytes.size() == told && device.atEnd()) {
      break;
    }
  }
  if (bytes.size() > kLargestFile) {
    m_error = tooLargeMessage();
    return false;
  }
  open(bytes, true);
  return true;
}

bool DefinitionLines::next() {
  if (m_end >= m_bytes.size()) {
    return false;
  }
  m_begin = m_end;
  const char* bytes = m_bytes.constData();
  const void* lineFeed =
      std::memchr(bytes + m_begin, '\n', static_cast<std::size_t>(m_bytes.size() - m_begin));
  m_last = lineFeed ? static_cast<int>(static_cast<const char*>(lineFeed) - bytes) : m_bytes.size();
  m_end = lineFeed ? m_last + 1 : m_last;
  const int end = m_last;
  m_first = m_begin;
  while (m_first < m_last && isWhiteSpace(bytes[m_first])) {
    ++m_first;
  }
  while (m_first < m_last && isWhiteSpace(bytes[m_last - 1])) {
    --m_last;
  }
  m_isTrimmedAsText = m_first < m_last && !(isAscii(bytes + m_first, 1) && isAscii(bytes + m_last - 1, 1));
  if (m_isTrimmedAsText) {
    m_trimmedText = decoded(bytes + m_begin, end - m_begin).trimmed();
  }
  ++m_number;
  return true;
}

QString DefinitionLines::trimmed() const {
  return m_isTrimmedAsText ? m_trimmedText : decoded(m_bytes.constData() + m_first, m_last - m_first);
}

bool DefinitionLines::is(QLatin1String word) const {
  return m_isTrimmedAsText ? m_trimmedText == word : m_last - m_first == word.size() && startsWith(word);
}

bool DefinitionLines::holdsAtStart(QLatin1String word) const {
  return std::memcmp(m_bytes.constData() + m_first, word.data(), static_cast<std::size_t>(word.size())) == 0;
}

QString DefinitionLines::behind(QLatin1String word) const {
  if (m_isTrimmedAsText) {
    return m_trimmedText.mid(word.size()).trimmed();
  }
  const int first = m_first + word.size();
  return decoded(m_bytes.constData() + first, m_last - first).trimmed();
}

bool DefinitionLines::isSkipped() const {
  return m_isTrimmedAsText ? m_trimmedText.isEmpty() || m_trimmedText.startsWith(QLatin1Char('#'))
                           : m_first == m_last || m_bytes.at(m_first) == '#';
}

bool DefinitionLines::isSoundUtf8() const {
  if (isAscii(m_bytes.constData(), m_bytes.size())) {
    return true;
  }
  QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
  decoded(m_bytes.constData(), m_bytes.size(), state);
  return state.invalidChars == 0 && state.remainingChars == 0;
}

bool DefinitionLines::readBlock(QLatin1String end, std::vector<DefinitionLine>* lines) {
  while (next()) {
    if (is(end)) {
      return true;
    }
    if (lines) {
      lines->push_back({trimmed(), m_number});
    }
  }
  return false;
}

bool DefinitionLines::readTemplate(QLatin1String end, std::vector<DefinitionLine>* lines) {
  while (next()) {
    // The end word stands at the line's start, which only the text tells when it was trimmed there.
    if (is(end) && (m_isTrimmedAsText ? textWithoutTrailingSpace() == end : m_first == m_begin)) {
      return true;
    }
    if (lines) {
      lines->push_back({textWithoutTrailingSpace(), m_number});
    }
  }
  return false;
}

QString DefinitionLines::textWithoutTrailingSpace() const {
  if (m_first == m_last) {
    return QString();
  }
  const char* bytes = m_bytes.constData();
  if (!m_isTrimmedAsText) {
    return decoded(bytes + m_begin, m_last - m_begin);
  }
  const QString line = decoded(bytes + m_begin, m_end - m_begin - (bytes[m_end - 1] == '\n' ? 1 : 0));
  int size = line.size();
  while (size > 0 && line.at(size - 1).isSpace()) {
    --size;
  }
  return line.left(size);
}
