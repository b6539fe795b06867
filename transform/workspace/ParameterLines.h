// Where the parameters of a transformer stand in their file.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <utility>
#include <vector>

struct TransformerStruct;

class ORX_EXPORT ParameterLines {
 public:
  ParameterLines() = default;
  explicit ParameterLines(const TransformerStruct& record);
  // Of parameters that belong to no transformer: names and lines.
  explicit ParameterLines(std::vector<std::pair<QString, int>> lines);

  // The last that gives the parameter; that of the transformer when none does.
  int of(const QString& parameter) const;

 private:
  int m_transformer = 0;
  std::vector<std::pair<QString, int>> m_lines;  // by name, then as they stand
};
