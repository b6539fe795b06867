// Reads the statements of a mapping file, or of a file of custom transformers, one after the other: physical
// lines are joined, comments left out, definitions of custom transformers and blocks of script lines told
// apart. What is wrong with the lines is reported; memory is bounded by the longest statement.
#pragma once

#include <transform/files/LineReader.h>

#include <QByteArrayList>
#include <QString>

#include <memory>
#include <utility>
#include <vector>

class MappingFileReport;

struct MappingFileStatement {
  QString text;
  std::vector<std::pair<int, int>> lines;  // offset in the text and physical line, of each line of it

  int line() const { return lines.empty() ? 0 : lines.front().second; }
  // The physical line, from 1, in which the character at `offset` stands.
  int lineAt(int offset) const;
};

class MappingFileReader {
 public:
  static constexpr int kDeepestBlock = 64;

  enum class Item { Statement, ScriptLine, BlockBegin, BlockEnd, End };

  // `report` is not owned.
  MappingFileReader(const QString& path, MappingFileReport& report);

  // False when the file cannot be read; errorString() tells why.
  bool open();
  // The block that BlockBegin opens, and all that stands in it, comes before its BlockEnd. Every block ends,
  // also one that the file leaves open.
  Item next();
  // Of a BlockBegin the fields behind the keyword.
  const MappingFileStatement& statement() const { return m_statement; }
  // Of the line read last.
  int lineNumber() const { return m_number; }
  const QString& errorString() const { return m_error; }

 private:
  struct Level {
    MappingFileStatement pending;
    int beginLine = 0;
    int scriptLine = 0;  // of the INCLUDE whose script lines are being read; 0 outside
    QString scriptStart;
    bool isContinued = false;
    bool isComment = false;
    bool hasContent = false;
    bool isDocument = false;  // the text of a workspace, which is not for the engine
    bool isTooLong = false;
  };
  enum class Taken { Nothing, Item, ItemAgain };

  bool fetchLine();
  void checkBytes(const QByteArray& bytes);
  // Where the content of the line begins for the innermost level that it belongs to.
  int belongingLevels(int& offset) const;
  Taken takeLine(const QStringRef& content, Item& item);
  void append(Level& level, const QStringRef& content);
  bool finishStatement(Level& level, Item& item);
  // What a level leaves open. True when that gave a last statement.
  bool closeLevel(Level& level, Item& item);
  // Of a block whose end is missing.
  Item leaveOpenBlock();
  Level& innermost() { return m_levels.back(); }

  LineReader m_lines;
  MappingFileReport& m_report;
  std::vector<Level> m_levels;
  MappingFileStatement m_statement;
  QByteArrayList m_split;  // what carriage returns make of the line read last
  int m_splitNext = 0;
  QString m_line;
  bool m_hasLine = false;
  int m_number = 0;
  qint64 m_lastNumber = 0;
  bool m_saidEncoding = false;
  bool m_saidNull = false;
  bool m_saidDepth = false;
  QString m_error;
};
