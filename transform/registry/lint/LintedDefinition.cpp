#include <platform/orxparameter/MemberList.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/registry/lint/LintedDefinition.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/specialised/TransformerCfgFactory.h>

namespace {

QSet<QString> withHidden(const QStringList& tags, const QString& hidden) {
  QSet<QString> all(tags.begin(), tags.end());
  if (!hidden.isEmpty()) {
    all.insert(hidden);
  }
  return all;
}

}  // namespace

LintedDefinition::LintedDefinition(DefinitionText text)
    : m_text(std::move(text)), m_fields(DefinitionFileParser::interpret(m_text)) {
  m_hasOwnClass = findTransformerCfgRule(m_fields.name, m_fields.version) != nullptr;
  for (const DefinitionLine& line : m_text.header) {
    const DefinitionKeyword* keyword = findDefinitionKeyword(line.text, DefinitionKeyword::kDefinition);
    m_header.push_back({keyword, keyword ? keywordValue(*keyword, line.text) : QString(), line});
  }
  m_inputs = TagList::parse(m_fields.inputTags).tags + TagList::parse(m_fields.dynamicInputTags).tags;
  m_outputs = TagList::parse(m_fields.outputTags).tags;
  m_inputSet = withHidden(m_inputs, m_fields.hiddenInputTag);
  m_outputSet = withHidden(m_outputs, m_fields.hiddenOutputTag);
  collectParameters();
}

void LintedDefinition::collectParameters() {
  // The n-th line of each keyword belongs to the n-th name, wherever it stands.
  std::vector<int> nameLines;
  std::vector<int> typeLines;
  std::vector<int> defaultLines;
  for (const HeaderLine& line : m_header) {
    if (!line.keyword) {
      continue;
    }
    if (line.keyword->word == kParameterName) {
      nameLines.push_back(line.line.number);
    } else if (line.keyword->word == kParameterType) {
      typeLines.push_back(line.line.number);
    } else if (line.keyword->word == kParameterDefault) {
      defaultLines.push_back(line.line.number);
    }
  }
  m_parameterNames = {kIdentifierParameter};
  if (!m_fields.multiProcess.isEmpty()) {
    m_parameterNames += {kProcessCountParameter, kProcessCountDisplayParameter, kGroupsOrderedParameter};
  }
  for (std::size_t i = 0; i < nameLines.size(); ++i) {
    const int n = static_cast<int>(i);
    LintedParameter parameter;
    parameter.name = m_fields.parameterNames[n];
    parameter.prompt = m_fields.parameterPrompts[n];
    parameter.defaultValue = m_fields.parameterDefaults[n];
    parameter.type = GUIType::fromTransformerTypeString(m_fields.parameterTypes.value(n), parameter.name,
                                                        parameter.prompt);
    parameter.line = nameLines[i];
    parameter.typeLine = i < typeLines.size() ? typeLines[i] : parameter.line;
    parameter.defaultLine = i < defaultLines.size() ? defaultLines[i] : parameter.line;
    m_parameterNames.insert(parameter.name);
    const MemberList members(parameter.type);
    if (parameter.type.getType() == kMultiParameterType) {
      for (const GUIType& member : members.members()) {
        m_parameterNames.insert(member.getName());
      }
    }
    m_parameters.push_back(std::move(parameter));
  }
}

int LintedDefinition::line() const {
  return m_text.header.empty() ? 0 : m_text.header.front().number;
}

int LintedDefinition::nameLine() const {
  for (const HeaderLine& line : m_header) {
    if (line.keyword && line.keyword->word == kTransformerName) {
      return line.line.number;
    }
  }
  return line();
}
