#include <transform/registry/DefinitionLines.h>
#include <transform/text/MessageStrings.h>

#include <QIODevice>
#include <QTextCodec>

#include <algorithm>

namespace {

constexpr long kTooLarge = 370740;
constexpr int kMibUtf8 = 106;
const char kByteOrderMark[] = "\xEF\xBB\xBF";
constexpr int kByteOrderMarkSize = 3;

QString withoutTrailingSpace(const QString& line) {
  int end = line.size();
  while (end > 0 && line.at(end - 1).isSpace()) {
    --end;
  }
  return line.left(end);
}

}  // namespace

bool DefinitionLines::open(QIODevice& device) {
  // One byte more than may be there; a pipe gives its content in pieces.
  constexpr int kPiece = 256 * 1024;
  for (qint64 size = 0; size <= kLargestFile; size = m_bytes.size()) {
    m_bytes.resize(static_cast<int>(size) + kPiece);
    const qint64 got = device.read(m_bytes.data() + size, kPiece);
    m_bytes.truncate(static_cast<int>(size + std::max<qint64>(got, 0)));
    if (got <= 0) {
      // At its end a sequential device may answer as for an error.
      if (got < 0 && !device.isSequential()) {
        m_error = device.errorString();
        return false;
      }
      break;
    }
  }
  if (m_bytes.size() > kLargestFile) {
    m_bytes.clear();
    m_error = TransformResString(kTooLarge, QString::number(kLargestFile / (1024 * 1024)));
    return false;
  }
  if (m_bytes.startsWith(kByteOrderMark)) {
    m_end = kByteOrderMarkSize;
  }
  return true;
}

bool DefinitionLines::next() {
  if (m_end >= m_bytes.size()) {
    return false;
  }
  m_begin = m_end;
  const int lineFeed = m_bytes.indexOf('\n', m_begin);
  const int size = (lineFeed < 0 ? m_bytes.size() : lineFeed) - m_begin;
  m_end = lineFeed < 0 ? m_bytes.size() : lineFeed + 1;
  QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
  m_line = QTextCodec::codecForMib(kMibUtf8)->toUnicode(m_bytes.constData() + m_begin, size, &state);
  m_isSound = m_isSound && state.invalidChars == 0 && state.remainingChars == 0;
  m_trimmed = m_line.trimmed();
  ++m_number;
  return true;
}

bool DefinitionLines::readBlock(QLatin1String end, std::vector<DefinitionLine>& lines) {
  while (next()) {
    if (m_trimmed == end) {
      return true;
    }
    lines.push_back({m_trimmed, m_number});
  }
  return false;
}

bool DefinitionLines::readTemplate(QLatin1String end, std::vector<DefinitionLine>& lines) {
  while (next()) {
    QString line = withoutTrailingSpace(m_line);
    if (line == end) {
      return true;
    }
    lines.push_back({std::move(line), m_number});
  }
  return false;
}
