// The scripts inside a mapping file: Tcl is parsed by the Tcl library, Python is collected and compiled by
// python3. Nothing is run.
#pragma once

#include <QString>
#include <QStringList>

#include <vector>

class MappingFileReport;
struct MappingFileStatement;

class MappingFileScripts {
 public:
  // The part of a statement; references to macros count as words.
  static void checkTcl(const MappingFileStatement& statement, int begin, int end, MappingFileReport& report);

  // The lines of a block, one after the other.
  void beginBlock(bool isPython);
  void addLine(const MappingFileStatement& line);
  void endBlock(MappingFileReport& report);

  // Compiles what was collected.
  void finish(MappingFileReport& report);

 private:
  bool m_isPython = false;
  QString m_block;
  std::vector<int> m_blockLines;
  QStringList m_python;
  std::vector<std::vector<int>> m_pythonLines;  // physical lines of each script
  qint64 m_pythonSize = 0;
  int m_uncheckedLine = 0;
};
