// The words of a statement: how a text is read back from one, where the words of a statement end, where its
// function calls do. All linear in the size of the text.
//
// The writer is quotifyStringForMF() in TextHelpers.h, whose form is fixed. It stands beside these in
// MappingFileWords.cpp, for the three only make sense together.
#pragma once

#include <platform/Export.h>

#include <QString>

// Whether quotifyStringForMF() makes one word of the text that is read back as the text. It cannot carry a
// backslash directly before a double quote: the quote might as well be the end of the word.
ORX_EXPORT bool canBeWord(const QString& text);
// The text that a word stands for: the inverse of quotifyStringForMF().
ORX_EXPORT QString textOfWord(const QString& word);

struct ORX_EXPORT MappingFileWord {
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

class ORX_EXPORT MappingFileWords {
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
ORX_EXPORT QStringRef mappingFileCallName(const QString& text, int position, int end);
// Behind the parenthesis that closes the one at `open`; -1 when none does before `end`.
ORX_EXPORT int endOfMappingFileCall(const QString& text, int open, int end);
