// One definition as it stands in its file, and what the file says of categories: collected lines, nothing
// taken from them yet. DefinitionFileParser::interpret() makes a TransformerDefinition of it.
#pragma once

#include <transform/registry/loading/DefinitionLines.h>

#include <QString>
#include <QStringList>

#include <vector>

struct DefinitionText {
  QString filePath;
  std::vector<DefinitionLine> header;  // trimmed, as are the blocks
  std::vector<DefinitionLine> templateLines;
  std::vector<DefinitionLine> description;
  std::vector<DefinitionLine> tooltip;
  std::vector<DefinitionLine> changeLog;

  bool isEmpty() const {
    return header.empty() && templateLines.empty() && description.empty() && tooltip.empty() &&
           changeLog.empty();
  }
  // Of what was collected; 0 when nothing was.
  int firstLine() const;
};

QStringList textsOf(const std::vector<DefinitionLine>& lines);

struct CategoryText {
  QString name;
  std::vector<DefinitionLine> lines;
  int line = 0;  // where the block begins, from 1

  QStringList texts() const { return textsOf(lines); }
};

// Reads the block whose first line is the current one. False when the file ends first.
bool readCategoryText(DefinitionLines& lines, std::vector<CategoryText>& categories);
