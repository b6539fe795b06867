// Output that appears whole or not at all: written beside its place, renamed when complete.
//
// A new file gets the permissions that the umask leaves; one that replaces another gets that one's
// permissions and, where the system allows it, its owner. A symbolic link stays: the file it points to is
// replaced. A file that may not be written is refused even when its folder would let it be replaced. A file
// that holds the same bytes already is left as it is, its time included, so that nothing made of it is made
// again.
#pragma once

#include <platform/Export.h>
#include <transform/files/DescriptorDevice.h>

#include <QByteArray>
#include <QIODevice>
#include <QString>

class ORX_EXPORT AtomicFile {
 public:
  // "-" is standard output. A place that is no regular file (a device, a pipe, an open descriptor such as
  // /dev/stdout) is written directly.
  explicit AtomicFile(const QString& fileName);
  ~AtomicFile();
  AtomicFile(const AtomicFile&) = delete;
  AtomicFile& operator=(const AtomicFile&) = delete;

  // False when the place cannot be written; errorString() names the file and the reason. An open file that
  // was not committed is given up first.
  bool open();
  // Whether what is written goes to its place at once, before commit().
  bool isDirect() const { return m_device.isOpen() && m_temporaryName.isEmpty(); }
  // Valid after open(); owned by this object.
  QIODevice& device();
  // Puts the file in its place. False when anything written was lost; the file that stood there is then
  // untouched. Without commit() nothing changes.
  bool commit();
  QString errorString() const;

 private:
  bool openStandardOutput();
  bool openReplacement(const struct stat* replaced);
  bool adopt(int descriptor);
  void discard();
  bool fail(int error);

  QString m_fileName;
  DescriptorDevice m_device;
  int m_folder = -1;           // descriptor of the folder of the place, while a replacement is written
  QByteArray m_targetName;     // inside that folder
  QByteArray m_temporaryName;  // inside that folder; empty when the place is written directly
  QString m_error;
};
