#include <transform/files/DescriptorDevice.h>

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <ctime>
#include <poll.h>
#include <unistd.h>

namespace {

constexpr int kBufferSize = 64 * 1024;
constexpr qint64 kLargestWrite = 1 << 30;

// Keeps a closed pipe from ending the process, so that it is seen as an error of the write.
class BrokenPipeGuard {
 public:
  BrokenPipeGuard() {
    sigemptyset(&m_signal);
    sigaddset(&m_signal, SIGPIPE);
    sigset_t pending;
    sigemptyset(&pending);
    sigpending(&pending);
    m_wasPending = sigismember(&pending, SIGPIPE) == 1;
    pthread_sigmask(SIG_BLOCK, &m_signal, &m_before);
  }
  ~BrokenPipeGuard() {
    const int error = errno;
    const timespec atOnce{};
    while (!m_wasPending && sigtimedwait(&m_signal, nullptr, &atOnce) < 0 && errno == EINTR) {
    }
    pthread_sigmask(SIG_SETMASK, &m_before, nullptr);
    errno = error;
  }
  BrokenPipeGuard(const BrokenPipeGuard&) = delete;
  BrokenPipeGuard& operator=(const BrokenPipeGuard&) = delete;

 private:
  sigset_t m_signal{};
  sigset_t m_before{};
  bool m_wasPending = false;
};

void waitUntilWritable(int descriptor) {
  pollfd request{descriptor, POLLOUT, 0};
  poll(&request, 1, -1);
}

}  // namespace

DescriptorDevice::~DescriptorDevice() {
  DescriptorDevice::close();
}

void DescriptorDevice::openDescriptor(int descriptor) {
  m_descriptor = descriptor;
  m_firstError = 0;
  m_buffer.clear();
  m_buffer.reserve(kBufferSize);
  setErrorString(QString());
  QIODevice::open(QIODevice::WriteOnly | QIODevice::Unbuffered);
}

bool DescriptorDevice::flush() {
  if (m_descriptor >= 0 && m_firstError == 0 && !m_buffer.isEmpty()) {
    writeOut(m_buffer.constData(), m_buffer.size());
    m_buffer.resize(0);
  }
  return m_descriptor >= 0 && m_firstError == 0;
}

void DescriptorDevice::close() {
  if (m_descriptor < 0) {
    return;
  }
  flush();
  // The descriptor is gone even when closing reports an error, so it is never closed again.
  if (::close(m_descriptor) != 0 && errno != EINTR) {
    fail(errno);
  }
  m_descriptor = -1;
  m_buffer.clear();
  QIODevice::close();
}

qint64 DescriptorDevice::readData(char*, qint64) {
  return -1;
}

qint64 DescriptorDevice::writeData(const char* data, qint64 size) {
  if (m_firstError != 0) {
    return -1;
  }
  if (m_buffer.size() + size > kBufferSize && !flush()) {
    return -1;
  }
  if (size >= kBufferSize) {
    return writeOut(data, size) ? size : -1;
  }
  m_buffer.append(data, static_cast<int>(size));
  return size;
}

bool DescriptorDevice::writeOut(const char* data, qint64 size) {
  const BrokenPipeGuard guard;
  while (size > 0) {
    const ssize_t written =
        ::write(m_descriptor, data, static_cast<std::size_t>(std::min(size, kLargestWrite)));
    if (written > 0) {
      data += written;
      size -= written;
    } else if (written < 0 && (errno == EAGAIN || errno == EWOULDBLOCK)) {
      waitUntilWritable(m_descriptor);
    } else if (written == 0 || errno != EINTR) {
      fail(written == 0 ? ENOSPC : errno);
      return false;
    }
  }
  return true;
}

void DescriptorDevice::fail(int error) {
  if (m_firstError == 0) {
    m_firstError = error;
    setErrorString(qt_error_string(error));
  }
}
