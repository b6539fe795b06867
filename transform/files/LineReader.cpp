#include <transform/files/LineReader.h>

#include <cstdio>
#include <unistd.h>

LineReader::LineReader(const QString& fileName, qint64 longestLine)
    : m_fileName(fileName), m_file(fileName), m_longestLine(longestLine) {}

bool LineReader::open() {
  const bool opened = m_fileName == QLatin1String("-") ? m_file.open(STDIN_FILENO, QIODevice::ReadOnly)
                                                       : m_file.open(QIODevice::ReadOnly);
  return opened || fail(m_file.errorString());
}

bool LineReader::next() {
  if (failed() || !m_file.isOpen()) {
    return false;
  }
  // One byte beyond the limit, and one for the line end, tell a line that is too long.
  m_line = m_file.readLine(m_longestLine + 2);
  if (m_line.isEmpty()) {
    return m_file.error() == QFileDevice::NoError ? false : fail(m_file.errorString());
  }
  m_offset = m_nextOffset;
  m_nextOffset += m_line.size();
  ++m_number;
  if (m_line.endsWith('\n')) {
    m_line.chop(m_line.endsWith("\r\n") ? 2 : 1);
  }
  return m_line.size() <= m_longestLine ||
         fail(QStringLiteral("line %1 is longer than %2 bytes").arg(m_number).arg(m_longestLine));
}

bool LineReader::fail(const QString& reason) {
  m_error = m_fileName + QLatin1String(": ") + reason;
  m_line.clear();
  return false;
}
