#include <transform/workspace/reading/DecodedInputSource.h>
#include <transform/workspace/reading/FileLines.h>

#include <cstring>

namespace {
constexpr int kBuffer = 256 * 1024;
}

FileLines::FileLines(QIODevice& device) : m_device(device), m_buffer(kBuffer, Qt::Uninitialized) {}

// Moves what is left to the front and reads on; false when nothing came.
bool FileLines::fill() {
  const int left = m_filled - m_end;
  std::memmove(m_buffer.data(), m_buffer.constData() + m_end, static_cast<std::size_t>(left));
  m_filled = left;
  m_begin = 0;
  m_end = 0;
  while (!m_atEnd && m_filled < kBuffer) {
    const qint64 count = m_device.read(m_buffer.data() + m_filled, kBuffer - m_filled);
    if (count <= 0) {
      m_atEnd = true;
      m_failed = count < 0;
      break;
    }
    m_filled += static_cast<int>(count);
  }
  return m_filled > left;
}

bool FileLines::next() {
  m_position += size();
  m_begin = m_end;
  if (!m_started) {
    m_started = true;
    fill();
    const QByteArray head = QByteArray::fromRawData(m_buffer.constData(), std::min(m_filled, 4));
    m_order = utf16ByteOrder(head);
    const auto first = static_cast<unsigned char>(m_filled > 0 ? m_buffer[0] : 0);
    const int mark = m_order && first >= 0xfe ? 2 : head.startsWith("\xef\xbb\xbf") ? 3 : 0;
    m_mark = QByteArray(m_buffer.constData(), mark);
    m_begin = m_end = mark;
    m_position = mark;
  }
  m_startsLine = m_endsLine;
  const QByteArray lineEnd = encoded('\n');
  int searched = m_begin;
  for (;;) {
    const char* const found = static_cast<const char*>(
        std::memchr(m_buffer.constData() + searched, '\n', static_cast<std::size_t>(m_filled - searched)));
    if (found) {
      int at = static_cast<int>(found - m_buffer.constData());
      if (m_order) {
        // The byte may be one half of another character.
        const int start = m_begin + (at - m_begin) / 2 * 2;
        if (start + 2 > m_filled || std::memcmp(m_buffer.constData() + start, lineEnd.constData(), 2) != 0) {
          searched = at + 1;
          continue;
        }
        at = start + 1;
      }
      m_end = at + 1;
      m_endsLine = true;
      break;
    }
    if (m_begin > 0 || m_filled < kBuffer) {
      const int known = m_filled - m_begin;
      m_end = m_begin;
      if (fill()) {
        // A character of two bytes may have been cut in half.
        searched = m_order ? known / 2 * 2 : known;
        continue;
      }
    }
    m_end = m_order && !m_atEnd ? m_filled / 2 * 2 : m_filled;
    m_endsLine = m_atEnd && m_end == m_filled;
    break;
  }
  if (m_end == m_begin)
    return false;
  if (m_startsLine)
    ++m_line;
  return true;
}

ushort FileLines::unit(int index) const {
  const auto* bytes = reinterpret_cast<const unsigned char*>(data());
  switch (m_order) {
    case 'L':
      return static_cast<ushort>(bytes[2 * index] | bytes[2 * index + 1] << 8);
    case 'B':
      return static_cast<ushort>(bytes[2 * index] << 8 | bytes[2 * index + 1]);
    default:
      return bytes[index];
  }
}

QByteArray FileLines::encoded(char ascii) const {
  switch (m_order) {
    case 'L':
      return QByteArray(1, ascii) + QByteArray(1, 0);
    case 'B':
      return QByteArray(1, 0) + QByteArray(1, ascii);
    default:
      return QByteArray(1, ascii);
  }
}

bool FileLines::startsWith(const char* ascii) const {
  const int length = static_cast<int>(std::strlen(ascii));
  if (unitCount() < length)
    return false;
  for (int i = 0; i < length; ++i) {
    if (unit(i) != static_cast<ushort>(ascii[i]))
      return false;
  }
  return true;
}

int FileLines::matchComment(const char* marker) const {
  const int count = unitCount();
  int at = 0;
  while (at < count && unit(at) == ' ')
    ++at;
  if (at + 2 > count || unit(at) != '#' || unit(at + 1) != '!')
    return 0;
  at += 2;
  const int afterMark = at;
  while (at < count && unit(at) == ' ')
    ++at;
  if (*marker == '\0')
    return at > afterMark ? at : 0;
  for (; *marker; ++marker, ++at) {
    if (at >= count || unit(at) != static_cast<ushort>(*marker))
      return 0;
  }
  return at;
}
