#include <platform/qorxcore/qorxcore.h>
#include <transform/registry/DefinitionFileParser.h>
#include <transform/registry/DefinitionKeywords.h>
#include <transform/registry/DefinitionLines.h>

namespace {

void takeValue(const DefinitionKeyword& keyword, const QString& value, TransformerDefinition& definition) {
  switch (keyword.kind) {
    case KeywordKind::Text:
      definition.*keyword.text = value;
      break;
    case KeywordKind::Number:
      definition.*keyword.number = value.toInt();
      break;
    case KeywordKind::Flag: {
      const QString word = value.toLower();
      if (word == QLatin1String("yes") || word == QLatin1String("true"))
        definition.*keyword.flag = true;
      else if (word == QLatin1String("no") || word == QLatin1String("false"))
        definition.*keyword.flag = false;
      break;
    }
    case KeywordKind::List:
      definition.*keyword.list += splitDefinitionList(value);
      break;
    case KeywordKind::EncodedList:
      for (const QString& entry : splitDefinitionList(value))
        (definition.*keyword.list).append(QORXWwjdDecode(entry));
      break;
    case KeywordKind::InputList:
      definition.*keyword.list += splitDefinitionList(value);
      (definition.*keyword.list).removeAll(QStringLiteral("<NO_INPUT>"));
      break;
    case KeywordKind::Modes:
      for (const QString& mode : splitDefinitionList(value)) {
        if (mode == QLatin1String("NONE"))
          definition.*keyword.number |= 1;
        else if (mode == QLatin1String("GROUPED"))
          definition.*keyword.number |= 2;
        else if (mode == QLatin1String("ALL"))
          definition.*keyword.number |= 4;
      }
      break;
    case KeywordKind::ParallelList:
      (definition.*keyword.list).append(value);
      break;
    case KeywordKind::Lookup:
      if (!definition.parameterNames.isEmpty())
        definition.parameterLookups[definition.parameterNames.last()].append(value);
      break;
    case KeywordKind::TagDescription: {
      QStringList pieces = value.split(QLatin1Char(' '), Qt::SkipEmptyParts);
      if (pieces.size() < 2)
        break;
      QString tag = pieces.takeFirst();
      if (tag.endsWith(QLatin1Char(':')))
        tag.chop(1);
      definition.tagDescriptions.insert(tag, pieces.join(QLatin1Char(' ')));
      break;
    }
  }
}

void pad(QStringList& list, int size) {
  while (list.size() < size)
    list.append(QString());
}

}  // namespace

DefinitionFileParser::DefinitionFileParser(DefinitionHandler onDefinition, CategoryHandler onCategory)
    : m_onDefinition(std::move(onDefinition)), m_onCategory(std::move(onCategory)) {}

bool DefinitionFileParser::takeHeaderLine(const QString& line, TransformerDefinition& definition) {
  bool matched = false;
  for (const DefinitionKeyword& keyword : definitionKeywords()) {
    if (!line.startsWith(keyword.word))
      continue;
    takeValue(keyword, line.mid(keyword.word.size()).trimmed(), definition);
    matched = true;
  }
  return matched;
}

void DefinitionFileParser::parse(QIODevice& device, const QString& path) {
  DefinitionLines lines(device);
  TransformerDefinition definition;
  while (lines.next()) {
    if (lines.isSkipped())
      continue;
    const QString& line = lines.trimmed();
    if (line.startsWith(kCategoryDescriptionStart)) {
      const QString category = line.mid(kCategoryDescriptionStart.size()).trimmed();
      QStringList description;
      lines.readBlock(kCategoryDescriptionEnd, description);
      m_onCategory(category, description);
    } else if (line == kTemplateStart) {
      if (!lines.readTemplate(definition.templateLines))
        return;  // without an end there is no definition
      pad(definition.parameterDefaults, definition.parameterNames.size());
      pad(definition.parameterPrompts, definition.parameterNames.size());
      definition.filePath = path;
      m_onDefinition(std::move(definition));
      definition = TransformerDefinition();
    } else if (line == kDescriptionStart) {
      lines.readBlock(kDescriptionEnd, definition.descriptionLines);
    } else if (line == kTooltipStart) {
      lines.readBlock(kTooltipEnd, definition.tooltipLines);
    } else if (line == kChangeLogStart) {
      lines.readBlock(kChangeLogEnd, definition.changeLog);
    } else {
      takeHeaderLine(line, definition);
    }
  }
}
