// The lines of a definition file or a localised companion: UTF-8, with their numbers and their places in the
// file. Lines are found as bytes and become text only when it is asked for.
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
  static QString tooLargeMessage();

  // A piece of a file, as it stands, or with isWholeFile a file: a byte order mark at its start is then
  // passed over. The bytes are shared, not copied.
  void open(const QByteArray& bytes, bool isWholeFile);
  // A file, or what stands for one. False when the device cannot be read or holds too much; errorString()
  // tells which.
  bool open(QIODevice& device);
  QString errorString() const { return m_error; }

  bool next();
  // Of the current line.
  int number() const { return m_number; }
  qint64 offset() const { return m_begin; }  // in bytes from the start
  qint64 endOffset() const { return m_end; }
  QString trimmed() const;
  // Whether the trimmed line is, or begins with, this word of ASCII characters.
  bool is(QLatin1String word) const;
  bool startsWith(QLatin1String word) const {
    // Most lines differ in the first character.
    return m_isTrimmedAsText ? m_trimmedText.startsWith(word)
                             : m_last - m_first >= word.size() &&
                                   m_bytes.constData()[m_first] == *word.data() && holdsAtStart(word);
  }
  // What stands behind the word that the trimmed line begins with, trimmed.
  QString behind(QLatin1String word) const;
  // Empty, or a comment.
  bool isSkipped() const;
  // Whether everything, read or not, is sound UTF-8.
  bool isSoundUtf8() const;

  // Append the lines up to the end word, without it; without `lines` they are passed over. False when the
  // file ends first. In a block lines are trimmed, in a template only white space at their ends is removed;
  // empty ones are kept.
  bool readBlock(QLatin1String end, std::vector<DefinitionLine>* lines);
  bool readTemplate(QLatin1String end, std::vector<DefinitionLine>* lines);

 private:
  bool holdsAtStart(QLatin1String word) const;
  QString textWithoutTrailingSpace() const;

  QByteArray m_bytes;
  int m_begin = 0;
  int m_end = 0;  // behind the line's end
  // What is left of the line without white space. White space that is not ASCII is seen only in the text, so
  // that a line with other characters at an end is trimmed as text.
  int m_first = 0;
  int m_last = 0;
  bool m_isTrimmedAsText = false;
  QString m_trimmedText;
  int m_number = 0;
  QString m_error;
};
