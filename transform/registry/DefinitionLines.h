// The lines of a definition file or a localised companion: UTF-8 (a byte order mark is passed over), with
// their numbers and their places in the file.
#pragma once

#include <QByteArray>
#include <QLatin1String>
#include <QString>

#include <vector>

class QIODevice;

struct DefinitionLine {
  QString text;
  int number = 0;  // from 1
};

class DefinitionLines {
 public:
  // A larger file is no definition file. All of it is held while it is read.
  static constexpr qint64 kLargestFile = 64 * 1024 * 1024;

  // False when the device cannot be read or holds too much; errorString() tells which.
  bool open(QIODevice& device);
  QString errorString() const { return m_error; }

  bool next();
  // Of the current line.
  int number() const { return m_number; }
  qint64 offset() const { return m_begin; }  // in bytes from the start of the file
  qint64 endOffset() const { return m_end; }
  const QString& trimmed() const { return m_trimmed; }
  // Empty, or a comment.
  bool isSkipped() const { return m_trimmed.isEmpty() || m_trimmed.startsWith(QLatin1Char('#')); }
  // Whether everything read so far was sound UTF-8.
  bool isSoundUtf8() const { return m_isSound; }

  // Append the lines up to the end word, without it. False when the file ends first. In a block lines are
  // trimmed, in a template only white space at their ends is removed; empty ones are kept.
  bool readBlock(QLatin1String end, std::vector<DefinitionLine>& lines);
  bool readTemplate(QLatin1String end, std::vector<DefinitionLine>& lines);

 private:
  QByteArray m_bytes;
  int m_begin = 0;
  int m_end = 0;  // behind the line's end
  QString m_line;
  QString m_trimmed;
  int m_number = 0;
  bool m_isSound = true;
  QString m_error;
};
