#include <transform/workspace/ParameterLines.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <algorithm>

ParameterLines::ParameterLines(const TransformerStruct& record) : m_transformer(record.line) {
  for (const XformParmStruct& parameter : record.parameters)
    m_lines.emplace_back(parameter.parmName, parameter.line);
  std::sort(m_lines.begin(), m_lines.end());
}

ParameterLines::ParameterLines(std::vector<std::pair<QString, int>> lines) : m_lines(std::move(lines)) {
  std::sort(m_lines.begin(), m_lines.end());
}

int ParameterLines::of(const QString& parameter) const {
  const auto behind =
      std::upper_bound(m_lines.begin(), m_lines.end(), parameter,
                       [](const QString& name, const auto& entry) { return name < entry.first; });
  return behind != m_lines.begin() && std::prev(behind)->first == parameter ? std::prev(behind)->second
                                                                            : m_transformer;
}
