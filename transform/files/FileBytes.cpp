#include <platform/qorxcore/Local8Bit.h>
#include <transform/files/FileBytes.h>

#include <algorithm>
#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

constexpr qint64 kPiece = 64 * 1024;

}  // namespace

bool FileBytes::open(const QString& path) {
  close();
  m_size = 0;
  m_isAtEnd = false;
  m_isTooLarge = false;
  m_error.clear();
  m_descriptor = ::open(QORXToLocal8Bit(path).constData(), O_RDONLY | O_CLOEXEC);
  struct stat status {};
  if (m_descriptor < 0 || ::fstat(m_descriptor, &status) != 0) {
    return fail();
  }
  // What is no regular file does not tell its size.
  m_toldSize = S_ISREG(status.st_mode) ? status.st_size : 0;
  return readMore();
}

bool FileBytes::readAll() {
  while (m_error.isEmpty() && !m_isAtEnd) {
    m_isTooLarge = std::max<qint64>(m_toldSize, m_size) > m_largest;
    if (m_isTooLarge) {
      errno = EFBIG;
      return fail();
    }
    if (!readMore()) {
      return false;
    }
  }
  return m_error.isEmpty();
}

bool FileBytes::readMore() {
  const qint64 wanted = m_size == 0 ? kPiece : std::max(m_toldSize + 1, m_size + kPiece);
  if (m_buffer.size() < wanted) {
    m_buffer.resize(static_cast<int>(wanted));
  }
  ssize_t got = 0;
  do {
    got = ::read(m_descriptor, m_buffer.data() + m_size, static_cast<std::size_t>(m_buffer.size() - m_size));
  } while (got < 0 && errno == EINTR);
  if (got < 0) {
    return fail();
  }
  m_size += static_cast<int>(got);
  m_isAtEnd = got == 0 || (m_size == m_toldSize && m_size < m_buffer.size());
  if (m_isAtEnd) {
    close();
  }
  return true;
}

bool FileBytes::fail() {
  m_error = qt_error_string(errno);
  close();
  return false;
}

void FileBytes::close() {
  if (m_descriptor >= 0) {
    ::close(m_descriptor);
  }
  m_descriptor = -1;
}
