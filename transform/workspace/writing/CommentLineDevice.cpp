#include <transform/workspace/writing/CommentLineDevice.h>

#include <cstring>

CommentLineDevice::CommentLineDevice(QIODevice& target, const QByteArray& prefix, const QByteArray& lineFeed,
                                     const QByteArray& lineEnd)
    : m_target(target), m_prefix(prefix), m_lineFeed(lineFeed), m_lineEnd(lineEnd) {
  open(QIODevice::WriteOnly | QIODevice::Unbuffered);
}

qint64 CommentLineDevice::readData(char*, qint64) {
  return -1;
}

bool CommentLineDevice::pass(const char* data, qint64 size) {
  if (size == 0 || m_target.write(data, size) == size)
    return true;
  setErrorString(m_target.errorString());
  return false;
}

// The text stream hands over whole code units.
qint64 CommentLineDevice::lineFeedIn(const char* data, qint64 from, qint64 size) const {
  while (from < size) {
    const void* const found = std::memchr(data + from, '\n', static_cast<std::size_t>(size - from));
    if (!found)
      break;
    const qint64 at = static_cast<const char*>(found) - data;
    if (m_lineFeed.size() == 1)
      return at;
    const qint64 unit = at / 2 * 2;
    if (unit + 2 <= size && std::memcmp(data + unit, m_lineFeed.constData(), 2) == 0)
      return unit;
    from = at + 1;
  }
  return -1;
}

qint64 CommentLineDevice::writeData(const char* data, qint64 size) {
  qint64 done = 0;
  while (done < size) {
    if (m_atLineStart && !pass(m_prefix.constData(), m_prefix.size()))
      return -1;
    m_atLineStart = false;
    const qint64 lineFeed = lineFeedIn(data, done, size);
    const qint64 end = lineFeed < 0 ? size : lineFeed;
    if (!pass(data + done, end - done))
      return -1;
    done = end;
    if (lineFeed >= 0) {
      if (!pass(m_lineEnd.constData(), m_lineEnd.size()))
        return -1;
      done += m_lineFeed.size();
      m_atLineStart = true;
    }
  }
  return size;
}
