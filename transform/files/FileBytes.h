// Reads whole files, one after the other, into memory that is kept from file to file: cheap for many small
// ones.
#pragma once

#include <platform/Export.h>

#include <QByteArray>
#include <QString>

class ORX_EXPORT FileBytes {
 public:
  // No more than that is read of a file.
  explicit FileBytes(qint64 largest) : m_largest(largest) {}
  ~FileBytes() { close(); }
  FileBytes(const FileBytes&) = delete;
  FileBytes& operator=(const FileBytes&) = delete;

  // Opens the file and reads its first bytes, of a small one all. False when that fails; errorString() gives
  // the reason.
  bool open(const QString& path);
  // Reads what is left. False when that fails or the file is too large.
  bool readAll();
  // What was read of the file that was opened last. Valid until more is read.
  QByteArray bytes() const { return QByteArray::fromRawData(m_buffer.constData(), m_size); }
  bool isTooLarge() const { return m_isTooLarge; }
  const QString& errorString() const { return m_error; }

 private:
  bool readMore();
  bool fail();
  void close();

  qint64 m_largest;
  int m_descriptor = -1;
  QByteArray m_buffer;  // only grows
  int m_size = 0;
  qint64 m_toldSize = 0;
  bool m_isAtEnd = false;
  bool m_isTooLarge = false;
  QString m_error;
};
