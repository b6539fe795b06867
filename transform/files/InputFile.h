// A file to read by name, also where it can be read only once: "-" (standard input) and whatever is no
// regular file (a pipe, /dev/stdin) is copied to a private temporary file, which is deleted with this object.
#pragma once

#include <platform/Export.h>
#include <transform/files/TemporaryFile.h>

#include <QString>

#include <memory>

class QFile;

class ORX_EXPORT InputFile {
 public:
  explicit InputFile(const QString& fileName) : m_fileName(fileName) {}

  // How the file is called in messages.
  static QString shownName(const QString& fileName);
  static bool isStandardInput(const QString& fileName);

  // False when there is nothing to read; errorString() gives the reason without the file's name. Of a stream
  // no more than 1 GiB is taken.
  bool open();
  // Valid after open(): the regular file that holds the bytes.
  QString path() const;
  // Whether the bytes came from a stream, so that there is no file to replace.
  bool isCopy() const { return m_copy != nullptr; }
  const QString& errorString() const { return m_error; }

 private:
  bool copy(QFile& stream);
  bool fail(const QString& reason);

  QString m_fileName;
  std::unique_ptr<TemporaryFile> m_copy;
  QString m_error;
};
