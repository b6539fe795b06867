// Walks over the references "$(NAME)" of a text, from left to right. In nested references such as "$($(A)_B)"
// the innermost is found.
#pragma once

#include <QString>

class MacroReferences {
 public:
  explicit MacroReferences(const QString& text) : m_text(text) {}

  // Moves to the next reference; false when there is none.
  bool next() {
    int open = m_text.indexOf(QLatin1String("$("), m_end);
    if (open < 0)
      return false;
    const int close = m_text.indexOf(QLatin1Char(')'), open);
    if (close < 0)
      return false;
    open = m_text.lastIndexOf(QLatin1String("$("), close);
    m_start = open;
    m_end = close + 1;
    return true;
  }

  int start() const { return m_start; }
  int end() const { return m_end; }  // behind the closing parenthesis
  QString name() const { return m_text.mid(m_start + 2, m_end - m_start - 3); }

 private:
  const QString m_text;
  int m_start = 0;
  int m_end = 0;
};
