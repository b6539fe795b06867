// Walks over the tokens "$(NAME)" of a text, from left to right. Only plain tokens are found: their NAME
// holds none of "$", "(" and ")".
#pragma once

#include <platform/Export.h>

#include <QString>

// Whether a template's token of that name stands for something of the instance: its ports, name or schema.
ORX_EXPORT bool isReservedToken(const QString& name);

class TokenScanner {
 public:
  // The text must outlive the scanner.
  explicit TokenScanner(const QString& text) : m_text(text) {}

  // Moves to the next token; false when there is none.
  bool next();

  int begin() const { return m_begin; }
  int end() const { return m_end; }  // behind the closing parenthesis
  QStringRef name() const { return m_text.midRef(m_begin + 2, m_end - m_begin - 3); }

  // Both hold for what was walked over so far; ask behind the last token.
  //
  // The text stops inside something that text behind it could make a token of.
  bool endsOpen() const { return m_endsOpen; }
  // A "$" or "$(" has a further "$" or "(" behind it, so that a token inserted inside could make another.
  bool isNested() const { return m_isNested; }

  // Whether the name can be that of a plain token.
  static bool isPlainName(const QString& name);

 private:
  const QString& m_text;
  int m_begin = 0;
  int m_end = 0;
  bool m_endsOpen = false;
  bool m_isNested = false;
};
