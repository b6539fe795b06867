#include <transform/registry/lint/CompanionLint.h>
#include <transform/text/MessageNumbers.h>

#include <QIODevice>

#include <algorithm>

using orx::Rule;
namespace messages = orx::messages;

namespace {

bool isBlankText(const QStringList& lines) {
  return std::all_of(lines.begin(), lines.end(), [](const QString& line) { return line.isEmpty(); });
}

}  // namespace

void LintedCatalogue::add(const std::shared_ptr<const LintedDefinition>& definition) {
  m_byName[definition->fields().name].push_back(definition);
  for (const QString& category : definition->fields().category.split(QLatin1Char(','))) {
    m_categories.insert(category.trimmed());
  }
}

void CompanionLint::add(Rule rule, long message, int line, const QStringList& arguments) {
  m_report.add(rule, message, m_file, line, arguments);
}

void CompanionLint::check(QIODevice& device, bool isComplete) {
  CompanionFileParser parser;
  if (!parser.parse(device)) {
    add(Rule::UnreadableFile, messages::kDefinitionUnreadable, 0, {parser.errorString()});
    return;
  }
  if (!parser.isSoundUtf8()) {
    add(Rule::NotUtf8, messages::kFileNotUtf8, 0);
  }
  if (parser.openBlockLine() != 0) {
    add(Rule::OpenBlock, messages::kBlockWithoutEnd, parser.openBlockLine());
  }
  for (const DefinitionLine& line : parser.strayLines()) {
    add(Rule::UnknownKeyword, messages::kLineMeansNothing, line.number, {line.text});
  }
  for (const CompanionEntry& entry : parser.entries()) {
    checkEntry(entry, isComplete);
  }
  for (const CategoryText& category : parser.categoryDescriptions()) {
    if (!m_catalogue.hasCategory(category.name)) {
      add(Rule::UnknownInCompanion, messages::kNoSuchCategory, category.line, {category.name});
    }
  }
  for (const CategoryName& category : parser.categoryNames()) {
    if (!m_catalogue.hasCategory(category.name)) {
      add(Rule::UnknownInCompanion, messages::kNoSuchCategory, category.line, {category.name});
    }
  }
}

void CompanionLint::checkRepetitions(const std::vector<CompanionEntry::Text>& texts) {
  QSet<QString> names;
  for (const CompanionEntry::Text& text : texts) {
    if (names.contains(text.name)) {
      add(Rule::RepeatedKeyword, messages::kRepeatedText, text.line, {text.name});
    }
    names.insert(text.name);
  }
}

void CompanionLint::checkEntry(const CompanionEntry& entry, bool isComplete) {
  checkRepetitions(entry.prompts);
  checkRepetitions(entry.tagDescriptions);
  bool isKnown = false;
  for (const auto& definition : m_catalogue.named(entry.name)) {
    const int version = definition->fields().version;
    const QString versionText = QString::number(version);
    if (entry.hasVersion && entry.version != version) {
      continue;
    }
    isKnown = true;
    m_translated.insert({entry.name, version});
    for (const CompanionEntry::Text& prompt : entry.prompts) {
      if (!definition->parameterNames().contains(prompt.name)) {
        add(Rule::UnknownInCompanion, messages::kVersionHasNoParameter, prompt.line,
            {entry.name, versionText, prompt.name});
      }
    }
    for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
      if (!definition->isInput(tag.name) && !definition->isOutput(tag.name)) {
        add(Rule::UnknownInCompanion, messages::kVersionHasNoPort, tag.line,
            {entry.name, versionText, tag.name});
      }
    }
    if (isComplete) {
      checkCompleteness(entry, *definition);
    }
  }
  if (!isKnown) {
    if (entry.hasVersion)
      add(Rule::UnknownInCompanion, messages::kNoSuchVersion, entry.line,
          {entry.name, QString::number(entry.version)});
    else
      add(Rule::UnknownInCompanion, messages::kUnknownTransformerName, entry.line, {entry.name});
  }
}

void CompanionLint::checkCompleteness(const CompanionEntry& entry, const LintedDefinition& definition) {
  const auto need = [&](bool isThere, long message, const QStringList& further = {}) {
    if (!isThere) {
      add(Rule::MissingTranslation, message, entry.line,
          QStringList{entry.name, QString::number(definition.fields().version)} + further);
    }
  };
  need(!entry.localizedName.isEmpty(), messages::kNameNotTranslated);
  need(!isBlankText(entry.descriptionLines), messages::kDescriptionNotTranslated);
  need(!isBlankText(entry.tooltipLines), messages::kTooltipNotTranslated);
  need(!isBlankText(entry.changeLog), messages::kChangeLogNotTranslated);
  QSet<QString> translated;
  for (const CompanionEntry::Text& prompt : entry.prompts) {
    if (!prompt.text.isEmpty()) {
      translated.insert(prompt.name);
    }
  }
  for (const LintedParameter& parameter : definition.parameters()) {
    need(parameter.prompt.isEmpty() || translated.contains(parameter.name), messages::kPromptNotTranslated,
         {parameter.name});
  }
  QSet<QString> describedPorts;
  for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
    describedPorts.insert(tag.name);
  }
  for (const QString& port : definition.inputs() + definition.outputs()) {
    need(definition.fields().tagDescriptions.value(port).isEmpty() || describedPorts.contains(port),
         messages::kPortNotTranslated, {port});
  }
}
