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
  // As much as the device says it has and one byte more, so that one reading tells its end; a pipe says
  // nothing and gives its content in pieces.
  constexpr qint64 kPiece = 256 * 1024;
  const qint64 told = device.isSequential() ? 0 : std::min(device.size() - device.pos(), kLargestFile);
  qint64 piece = told > 0 ? told + 1 : kPiece;
  for (qint64 size = 0; size <= kLargestFile; size = m_bytes.size(), piece = kPiece) {
    m_bytes.resize(static_cast<int>(size + piece));
    const qint64 got = device.read(m_bytes.data() + size, piece);
    m_bytes.truncate(static_cast<int>(size + std::max<qint64>(got, 0)));
    if (got <= 0) {
      // At its end a sequential device may answer as for an error.
      if (got < 0 && !device.isSequential()) {
        m_error = device.errorString();
        return false;
      }
      break;
    }
    if (m_bytes.size() == told && device.atEnd()) {
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
  const char* bytes = m_bytes.constData() + m_begin;
  if (std::all_of(bytes, bytes + size, [](char c) { return static_cast<unsigned char>(c) < 0x80; })) {
    m_line = QString::fromLatin1(bytes, size);  // most lines by far, and sound
  } else {
    static const QTextCodec* const utf8 = QTextCodec::codecForMib(kMibUtf8);
    QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
    m_line = utf8->toUnicode(bytes, size, &state);
    m_isSound = m_isSound && state.invalidChars == 0 && state.remainingChars == 0;
  }
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
