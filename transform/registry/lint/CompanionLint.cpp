#include <transform/registry/lint/CompanionLint.h>

#include <QIODevice>

#include <algorithm>

using orx::Rule;

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

void CompanionLint::add(Rule rule, int line, const QString& text) {
  m_report.add(rule, m_file, line, text);
}

void CompanionLint::check(QIODevice& device, bool isComplete) {
  CompanionFileParser parser;
  if (!parser.parse(device)) {
    add(Rule::UnreadableFile, 0, parser.errorString());
    return;
  }
  if (!parser.isSoundUtf8()) {
    add(Rule::NotUtf8, 0, QStringLiteral("The file is not UTF-8"));
  }
  if (parser.openBlockLine() != 0) {
    add(Rule::OpenBlock, parser.openBlockLine(), QStringLiteral("This block has no end"));
  }
  for (const DefinitionLine& line : parser.strayLines()) {
    add(Rule::UnknownKeyword, line.number, QLatin1String("This line means nothing here: ") + line.text);
  }
  for (const CompanionEntry& entry : parser.entries()) {
    checkEntry(entry, isComplete);
  }
  for (const CategoryText& category : parser.categoryDescriptions()) {
    if (!m_catalogue.hasCategory(category.name)) {
      add(Rule::UnknownInCompanion, category.line,
          QStringLiteral("There is no category '%1'").arg(category.name));
    }
  }
  for (const CategoryName& category : parser.categoryNames()) {
    if (!m_catalogue.hasCategory(category.name)) {
      add(Rule::UnknownInCompanion, category.line,
          QStringLiteral("There is no category '%1'").arg(category.name));
    }
  }
}

void CompanionLint::checkRepetitions(const std::vector<CompanionEntry::Text>& texts) {
  QSet<QString> names;
  for (const CompanionEntry::Text& text : texts) {
    if (names.contains(text.name)) {
      add(Rule::RepeatedKeyword, text.line,
          QStringLiteral("This replaces an earlier text of '%1'").arg(text.name));
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
    if (entry.hasVersion && entry.version != version) {
      continue;
    }
    isKnown = true;
    m_translated.insert({entry.name, version});
    for (const CompanionEntry::Text& prompt : entry.prompts) {
      if (!definition->parameterNames().contains(prompt.name)) {
        add(Rule::UnknownInCompanion, prompt.line,
            QStringLiteral("%1 version %2 has no parameter '%3'")
                .arg(entry.name)
                .arg(version)
                .arg(prompt.name));
      }
    }
    for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
      if (!definition->isInput(tag.name) && !definition->isOutput(tag.name)) {
        add(Rule::UnknownInCompanion, tag.line,
            QStringLiteral("%1 version %2 has no port '%3'").arg(entry.name).arg(version).arg(tag.name));
      }
    }
    if (isComplete) {
      checkCompleteness(entry, *definition);
    }
  }
  if (!isKnown) {
    add(Rule::UnknownInCompanion, entry.line,
        entry.hasVersion
            ? QStringLiteral("There is no transformer '%1' of version %2").arg(entry.name).arg(entry.version)
            : QStringLiteral("There is no transformer '%1'").arg(entry.name));
  }
}

void CompanionLint::checkCompleteness(const CompanionEntry& entry, const LintedDefinition& definition) {
  const auto need = [&](bool isThere, const QString& what) {
    if (!isThere) {
      add(Rule::MissingTranslation, entry.line,
          QStringLiteral("%1 version %2: %3 is not translated")
              .arg(entry.name)
              .arg(definition.fields().version)
              .arg(what));
    }
  };
  need(!entry.localizedName.isEmpty(), QStringLiteral("the name"));
  need(!isBlankText(entry.descriptionLines), QStringLiteral("the description"));
  need(!isBlankText(entry.tooltipLines), QStringLiteral("the tooltip"));
  need(!isBlankText(entry.changeLog), QStringLiteral("the change log"));
  QSet<QString> translated;
  for (const CompanionEntry::Text& prompt : entry.prompts) {
    if (!prompt.text.isEmpty()) {
      translated.insert(prompt.name);
    }
  }
  for (const LintedParameter& parameter : definition.parameters()) {
    need(parameter.prompt.isEmpty() || translated.contains(parameter.name),
         QStringLiteral("the prompt of '%1'").arg(parameter.name));
  }
  QSet<QString> describedPorts;
  for (const CompanionEntry::Text& tag : entry.tagDescriptions) {
    describedPorts.insert(tag.name);
  }
  for (const QString& port : definition.inputs() + definition.outputs()) {
    need(definition.fields().tagDescriptions.value(port).isEmpty() || describedPorts.contains(port),
         QStringLiteral("the description of port '%1'").arg(port));
  }
}
