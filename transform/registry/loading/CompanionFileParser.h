// Reads localised companions: names, prompts and texts in one language for definitions already read. The
// lines follow the rules of definition files. The next TRANSFORMER_NAME line, or the file's end, ends an
// entry.
#pragma once

#include <transform/registry/loading/DefinitionText.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <utility>
#include <vector>

class QIODevice;

// What a companion says of one transformer. A text that is not there leaves the definition's own.
struct CompanionEntry {
  struct Text {
    QString name;  // of the parameter or tag
    QString text;
    int line = 0;  // from 1
  };

  QString name;
  int version = 0;
  bool hasVersion = false;  // without one the entry serves every version
  QString localizedName;
  std::vector<Text> prompts;
  std::vector<Text> tagDescriptions;
  QStringList descriptionLines;
  QStringList tooltipLines;
  QStringList changeLog;
  int line = 0;  // of its TRANSFORMER_NAME line, from 1
};

struct CategoryName {
  QString name;
  QString localizedName;
  int line = 0;
};

class CompanionFileParser {
 public:
  // The device is open for reading. False, with nothing collected, when it cannot be read or holds too much.
  bool parse(QIODevice& device);
  QString errorString() const { return m_error; }
  // The same of a whole file's bytes, which are always read.
  void parse(const QByteArray& file);

  const std::vector<CompanionEntry>& entries() const { return m_entries; }
  std::vector<CompanionEntry> takeEntries() { return std::move(m_entries); }
  const std::vector<CategoryText>& categoryDescriptions() const { return m_categoryDescriptions; }
  const std::vector<CategoryName>& categoryNames() const { return m_categoryNames; }
  // Lines that mean nothing where they stand.
  const std::vector<DefinitionLine>& strayLines() const { return m_strayLines; }
  // The first line of a block that the end of the file ends; 0 when every block has its end.
  int openBlockLine() const { return m_openBlockLine; }
  bool isSoundUtf8() const { return m_isSoundUtf8; }

 private:
  class Visitor;

  void read(DefinitionLines& lines);
  bool takeLine(const QString& line, int number);

  std::vector<CompanionEntry> m_entries;
  std::vector<CategoryText> m_categoryDescriptions;
  std::vector<CategoryName> m_categoryNames;
  std::vector<DefinitionLine> m_strayLines;
  int m_openBlockLine = 0;
  bool m_isSoundUtf8 = true;
  QString m_error;
};
