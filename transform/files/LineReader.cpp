#include <transform/files/LineReader.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <algorithm>
#include <cstring>
#include <unistd.h>

namespace messages = orx::messages;

namespace {

constexpr int kChunk = 64 * 1024;

}  // namespace

LineReader::LineReader(const QString& fileName, qint64 longestLine)
    : m_fileName(fileName), m_file(fileName), m_longestLine(longestLine) {}

bool LineReader::open() {
  m_line.reserve(kChunk);  // kept from line to line
  const QIODevice::OpenMode mode = QIODevice::ReadOnly | QIODevice::Unbuffered;
  const bool opened = m_fileName == QLatin1String("-") ? m_file.open(STDIN_FILENO, mode) : m_file.open(mode);
  return opened || fail(TransformResString(messages::kCannotBeRead, m_file.errorString()));
}

bool LineReader::next() {
  m_line.resize(0);
  if (failed() || !m_file.isOpen()) {
    return false;
  }
  m_offset += m_consumed;
  m_consumed = 0;
  bool complete = false;
  while (!complete && (m_start < m_chunk.size() || fill())) {
    const char* begin = m_chunk.constData() + m_start;
    const int available = m_chunk.size() - m_start;
    const auto* end = static_cast<const char*>(std::memchr(begin, '\n', static_cast<std::size_t>(available)));
    complete = end != nullptr;
    const int taken = complete ? static_cast<int>(end - begin) + 1 : available;
    m_line.append(begin, complete ? taken - 1 : taken);
    m_start += taken;
    m_consumed += taken;
    // A carriage return may still turn out to be part of the line end.
    if (m_line.size() > m_longestLine + 1) {
      break;
    }
  }
  if (failed() || m_consumed == 0) {
    return false;
  }
  ++m_number;
  if (complete && m_line.endsWith('\r')) {
    m_line.chop(1);
  }
  return m_line.size() <= m_longestLine ||
         fail(TransformResString(messages::kLineTooLong,
                                 {QString::number(m_number), QString::number(m_longestLine)}));
}

// False at the end of the file and after an error.
bool LineReader::fill() {
  m_start = 0;
  m_chunk.resize(kChunk);
  const qint64 read = m_file.read(m_chunk.data(), kChunk);
  m_chunk.resize(static_cast<int>(std::max<qint64>(read, 0)));
  return read > 0 || (read < 0 && fail(TransformResString(messages::kCannotBeRead, m_file.errorString())));
}

bool LineReader::fail(const QString& reason) {
  m_error = m_fileName + QLatin1String(": ") + reason;
  m_line.clear();
  return false;
}
