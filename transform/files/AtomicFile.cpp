#include <platform/qorxcore/Local8Bit.h>
#include <transform/files/AtomicFile.h>
#include <transform/files/output/OutputPlace.h>

#include <QFile>
#include <QRandomGenerator>

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace {

constexpr int kMostAttempts = 100;
constexpr qint64 kCompared = 1 << 16;

QByteArray temporaryName() {
  return ".orx-" + QByteArray::number(QRandomGenerator::global()->generate64(), 16) + ".tmp";
}

// Owner first: changing the owner may clear permission bits.
bool copyOwnerAndPermissions(int descriptor, const struct stat& from) {
  struct stat own {};
  if (::fstat(descriptor, &own) != 0) {
    return false;
  }
  const bool differs = own.st_uid != from.st_uid || own.st_gid != from.st_gid;
  if (differs && ::fchown(descriptor, from.st_uid, from.st_gid) != 0) {
    // An owner that cannot be kept is no reason to refuse; the group alone may still be.
    [[maybe_unused]] const int kept = ::fchown(descriptor, static_cast<uid_t>(-1), from.st_gid);
  }
  return ::fchmod(descriptor, from.st_mode & 07777) == 0;
}

// Whether both hold the same bytes. Where that cannot be told they count as different.
bool haveSameContent(int folder, const QByteArray& name, const QByteArray& otherName) {
  QFile file;
  QFile other;
  for (const auto& [opened, path] : {std::make_pair(&file, &name), std::make_pair(&other, &otherName)}) {
    const int descriptor = ::openat(folder, path->constData(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    if (descriptor < 0 || !opened->open(descriptor, QIODevice::ReadOnly | QIODevice::Unbuffered,
                                        QFileDevice::AutoCloseHandle)) {
      return false;
    }
  }
  if (file.size() != other.size()) {
    return false;
  }
  QByteArray bytes;
  do {
    bytes = file.read(kCompared);
    if (bytes != other.read(kCompared)) {
      return false;
    }
  } while (!bytes.isEmpty());
  return true;
}

}  // namespace

AtomicFile::AtomicFile(const QString& fileName) : m_fileName(fileName) {}

AtomicFile::~AtomicFile() {
  discard();
}

bool AtomicFile::open() {
  discard();
  m_error.clear();
  if (m_fileName == QLatin1String("-")) {
    return openStandardOutput();
  }
  const OutputPlace place = OutputPlace::find(QORXToLocal8Bit(m_fileName));
  switch (place.kind) {
    case OutputPlace::Kind::Unusable:
      return fail(place.error);
    case OutputPlace::Kind::Descriptor:
      return adopt(::fcntl(place.descriptor, F_DUPFD_CLOEXEC, 0));
    case OutputPlace::Kind::Special:
      return adopt(::open(place.path().constData(), O_WRONLY | O_CLOEXEC | O_NOCTTY));
    case OutputPlace::Kind::New:
    case OutputPlace::Kind::Regular:
      break;
  }
  m_folder = ::open(place.folder.constData(), O_PATH | O_DIRECTORY | O_CLOEXEC);
  if (m_folder < 0) {
    return fail(errno);
  }
  m_targetName = place.name;
  return openReplacement(place.kind == OutputPlace::Kind::Regular ? &place.status : nullptr);
}

bool AtomicFile::openStandardOutput() {
  std::fflush(stdout);  // what was printed before comes first
  return adopt(::fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 0));
}

bool AtomicFile::openReplacement(const struct stat* replaced) {
  if (replaced != nullptr && ::faccessat(m_folder, m_targetName.constData(), W_OK, AT_EACCESS) != 0) {
    return fail(errno);
  }
  // What will not be public must not be so while it is written.
  const mode_t mode = replaced != nullptr ? 0600 : 0666;
  int descriptor = -1;
  for (int attempt = 0; attempt < kMostAttempts && descriptor < 0; ++attempt) {
    m_temporaryName = temporaryName();
    descriptor =
        ::openat(m_folder, m_temporaryName.constData(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
    if (descriptor < 0 && errno != EEXIST) {
      break;
    }
  }
  if (descriptor < 0) {
    m_temporaryName.clear();  // it is not ours to remove
    return fail(errno);
  }
  m_device.openDescriptor(descriptor);
  return replaced == nullptr || copyOwnerAndPermissions(descriptor, *replaced) || fail(errno);
}

QIODevice& AtomicFile::device() {
  return m_device;
}

bool AtomicFile::commit() {
  if (!m_device.isOpen()) {
    return m_error.isEmpty() ? fail(EBADF) : false;
  }
  m_device.close();
  if (m_device.firstError() != 0) {
    return fail(m_device.firstError());
  }
  if (!m_temporaryName.isEmpty() && !haveSameContent(m_folder, m_temporaryName, m_targetName)) {
    if (::renameat(m_folder, m_temporaryName.constData(), m_folder, m_targetName.constData()) != 0) {
      return fail(errno);
    }
    m_temporaryName.clear();
  }
  discard();
  return true;
}

QString AtomicFile::errorString() const {
  return m_error;
}

bool AtomicFile::adopt(int descriptor) {
  if (descriptor < 0) {
    return fail(errno);
  }
  m_device.openDescriptor(descriptor);
  return true;
}

// Leaves nothing behind of what was not committed.
void AtomicFile::discard() {
  m_device.close();
  if (!m_temporaryName.isEmpty()) {
    ::unlinkat(m_folder, m_temporaryName.constData(), 0);
    m_temporaryName.clear();
  }
  if (m_folder >= 0) {
    ::close(m_folder);
    m_folder = -1;
  }
}

bool AtomicFile::fail(int error) {
  const QString name = m_fileName == QLatin1String("-") ? QStringLiteral("standard output") : m_fileName;
  m_error = name + QLatin1String(": ") + qt_error_string(error);
  discard();
  return false;
}
