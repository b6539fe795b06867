// The lines of a definition file or a localised companion: UTF-8, trimmed, empty and comment lines told
// apart.
#pragma once

#include <QString>
#include <QStringList>
#include <QTextStream>

class QIODevice;

class DefinitionLines {
 public:
  explicit DefinitionLines(QIODevice& device);

  bool next();
  // Of the current line: from 1.
  int number() const { return m_number; }
  const QString& trimmed() const { return m_trimmed; }
  // Empty, or a comment.
  bool isSkipped() const { return m_trimmed.isEmpty() || m_trimmed.startsWith(QLatin1Char('#')); }

  // Appends the trimmed lines up to the end word; empty ones are kept. False when the file ends first.
  bool readBlock(QLatin1String end, QStringList& lines);
  // The lines of a template up to its end; only white space at their ends is removed. False when the file
  // ends first.
  bool readTemplate(QStringList& lines);

 private:
  QTextStream m_stream;
  QString m_line;
  QString m_trimmed;
  int m_number = 0;
};
