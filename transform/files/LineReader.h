// Reads a text file line by line, as bytes, with the place of each line; its memory is bounded by the longest
// line that is allowed.
#pragma once

#include <platform/Export.h>

#include <QByteArray>
#include <QFile>
#include <QString>

class ORX_EXPORT LineReader {
 public:
  static constexpr qint64 kLongestLine = 16 * 1024 * 1024;

  // "-" is standard input.
  explicit LineReader(const QString& fileName, qint64 longestLine = kLongestLine);

  // False when the file cannot be read; errorString() names the file and the reason.
  bool open();
  // Steps to the next line. False at the end of the file and after an error; failed() tells them apart.
  bool next();

  // The current line without its line end, "\n" or "\r\n".
  const QByteArray& line() const { return m_line; }
  // Of the current line, from 1 up.
  qint64 number() const { return m_number; }
  // Where the current line begins, in bytes from the start of the file.
  qint64 offset() const { return m_offset; }

  bool failed() const { return !m_error.isEmpty(); }
  const QString& errorString() const { return m_error; }

 private:
  bool fill();
  bool fail(const QString& reason);

  QString m_fileName;
  QFile m_file;
  qint64 m_longestLine;
  QByteArray m_line;
  qint64 m_number = 0;
  qint64 m_offset = 0;
  qint64 m_consumed = 0;  // bytes of the current line with its end
  QByteArray m_chunk;     // what was read ahead, from m_start on
  int m_start = 0;
  QString m_error;
};
