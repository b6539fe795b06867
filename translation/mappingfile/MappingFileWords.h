// Splits statements into words, and finds where function calls end. Linear in the size of the statement.
#pragma once

#include <QString>

struct MappingFileWord {
  enum class Kind { Bare, Quoted, Call };

  QStringRef text;  // with its quotes
  Kind kind = Kind::Bare;
  bool isClosed = true;  // its quote or parenthesis
  bool isGlued = false;  // no blank stands behind the closing quote

  int offset() const { return text.position(); }
  bool is(QLatin1String keyword) const { return kind == Kind::Bare && text == keyword; }
  // Without quotes and escapes.
  QString value() const;
};

class MappingFileWords {
 public:
  // The text must outlive this object.
  explicit MappingFileWords(const QString& text, int from = 0) : m_text(text), m_position(from) {}

  // Whether words are settings "KEY:VALUE", in which VALUE may be quoted.
  void setSettings(bool isSettings) { m_isSettings = isSettings; }
  // False behind the last word.
  bool next(MappingFileWord& word);
  // What stands behind the words read so far, without the blanks around it.
  QStringRef rest() const { return m_text.midRef(m_position).trimmed(); }

 private:
  int endOfQuote(int open, MappingFileWord& word) const;
  int endOfBare(int from, MappingFileWord& word) const;

  const QString& m_text;
  int m_position;
  bool m_isSettings = false;
};

// The name of a call "@NAME(" that begins at the position; empty when none does.
QStringRef mappingFileCallName(const QString& text, int position, int end);
// Behind the parenthesis that closes the one at `open`; -1 when none does before `end`.
int endOfMappingFileCall(const QString& text, int open, int end);
