// Output that appears whole or not at all: written beside its place, renamed when complete.
#pragma once

#include <platform/Export.h>

#include <QIODevice>
#include <QString>

#include <memory>

class QFileDevice;

class ORX_EXPORT AtomicFile {
 public:
  // "-" is standard output. A place that is no regular file (a device, a pipe) is written directly.
  explicit AtomicFile(const QString& fileName);
  ~AtomicFile();
  AtomicFile(const AtomicFile&) = delete;
  AtomicFile& operator=(const AtomicFile&) = delete;

  // False when the place cannot be written; errorString() names the file and the reason.
  bool open();
  // Valid after open(); owned by this object.
  QIODevice& device();
  // Puts the file in its place. False when anything written was lost; the file that stood there is then untouched.
  // Without commit() nothing changes.
  bool commit();
  QString errorString() const;

 private:
  QString m_fileName;
  std::unique_ptr<QFileDevice> m_device;
  bool m_replaces = false;
  QString m_error;
};
