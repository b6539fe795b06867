// Walks through Python code line by line and keeps track of brackets, texts and comments: enough to tell
// where statements begin and whether a line stands in a text.
#pragma once

#include <transform/scripts/blocks/ScriptRefusal.h>

#include <QString>
#include <QVector>

class PythonLineScanner {
 public:
  enum class LineEnd { Code, Comment, Text, TextOfSeveralLines };

  // Reads the next line. `redirectsLookups` tells whether the block is written for a custom transformer's
  // instance.
  ScriptRefusal scan(const QString& line, bool redirectsLookups);

  // Of the line read last.
  LineEnd lineEnd() const { return m_lineEnd; }
  // Assignment, colon, or code behind a semicolon, outside all brackets: the line is no expression.
  bool hasStatementMark() const { return m_hasStatementMark; }
  bool isInsideBrackets() const { return !m_brackets.isEmpty(); }
  // The line, from 1, of the innermost bracket that is still open.
  int openBracketLine() const { return m_brackets.last().line; }

 private:
  struct Bracket {
    QChar close;
    int line;
  };
  // Each of these reads from `at` on and answers how far it read.
  int scanText(const QString& line, int at);
  int scanCode(const QString& line, int at, ScriptRefusal& refusal);
  void noteStatementMark(const QString& line, int at);
  bool isRedirectable() const;

  int m_line = 0;
  QVector<Bracket> m_brackets;
  LineEnd m_lineEnd = LineEnd::Code;
  bool m_hasStatementMark = false;
  bool m_sawSemicolon = false;
  // The text being read; no quote outside of texts.
  QChar m_quote;
  bool m_isTriple = false;
  bool m_isFormatted = false;
  int m_formatBraces = 0;
};
