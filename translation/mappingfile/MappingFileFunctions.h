// Checks the function calls and word-encoded texts inside the words of a statement.
#pragma once

#include <QString>

#include <vector>

class MappingFileReport;
struct MacroReference;
struct MappingFileStatement;
struct MappingFileWord;

class MappingFileFunctions {
 public:
  // None is owned. `references` are those of the statement; they stand for any text.
  MappingFileFunctions(const MappingFileStatement& statement, const std::vector<MacroReference>& references,
                       MappingFileReport& report);

  // Whatever stands in the word. Names of factories and feature types and the settings of workers are not
  // evaluated: a call in the middle of one is none.
  void check(const MappingFileWord& word, bool isName = false);
  // That a word as a whole, or a part of it, is word-encoded.
  void checkEncoded(int begin, int end);
  // The same for each element of a list separated by commas.
  void checkEncodedList(int begin, int end);

 private:
  void checkCalls(int begin, int end);
  void checkCall(const QStringRef& name, int begin, int end);
  bool hasPairs(int begin, int end) const;
  bool checkExpression(int begin, int end);
  bool checkExpressionText(int begin, int end);
  void checkCharacterNames(int begin, int end);
  int find(QChar c, int begin, int end) const;
  bool isEncoded(int begin, int end) const;
  void reportCall(int begin, int end, const char* form);

  const MappingFileStatement& m_statement;
  const QString m_text;  // with letters in the place of references
  MappingFileReport& m_report;
};
