// Reads the statements of a mapping file, or of a file of custom transformers, one after the other: physical
// lines are joined, comments left out, definitions of custom transformers and blocks of script lines told
// apart. What is wrong with the lines is reported; memory is bounded by the longest statement. The text
// comes from a file, or piece by piece from whoever writes it.
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

  enum class Item { Statement, ScriptLine, BlockBegin, BlockEnd, More, End };

  // `report` is not owned.
  MappingFileReader(const QString& path, MappingFileReport& report);
  // Of a text that feed() gives.
  explicit MappingFileReader(MappingFileReport& report);

  // False when the file cannot be read; errorString() tells why.
  bool open();
  // Adds to the text, in pieces of any size; endFeed() tells that it is whole.
  void feed(const QByteArray& bytes);
  void endFeed() { m_isWhole = true; }
  // The block that BlockBegin opens, and all that stands in it, comes before its BlockEnd. Every block ends,
  // also one that the file leaves open. More tells that no whole line is left of what was fed.
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
  // The next line without its end, of the file or of what was fed. False when there is none.
  bool readLine(QByteArray& line);
  bool takeFedLine(QByteArray& line);
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
  QByteArray m_fed;       // a text that comes in pieces
  int m_fedBegin = 0;     // of what was not taken yet
  int m_fedSearched = 0;  // up to where there is no line end
  bool m_isFed = false;
  bool m_isWhole = true;
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
