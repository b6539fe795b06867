// Checks the function calls and word-encoded texts inside the words of a statement.
#pragma once

#include <QString>

#include <vector>

class MappingFileReport;
struct MappingFileReference;
struct MappingFileStatement;
struct MappingFileWord;

class MappingFileFunctions {
 public:
  // None is owned. `references` are those of the statement; they stand for any text.
  MappingFileFunctions(const MappingFileStatement& statement,
                       const std::vector<MappingFileReference>& references, MappingFileReport& report);

  // Whatever stands in the word.
  void check(const MappingFileWord& word);
  // That a word as a whole, or a part of it, is word-encoded.
  void checkEncoded(int begin, int end);
  // The same for each element of a list separated by commas.
  void checkEncodedList(int begin, int end);

 private:
  void checkCall(const QStringRef& name, int begin, int end);
  bool hasTwoArguments(int begin, int end) const;
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
