#include <platform/qorxcore/WordEncoding.h>
#include <transform/registry/DefinitionFileParser.h>
#include <transform/registry/DefinitionKeywords.h>

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
      const int flag = flagValue(value);
      if (flag >= 0) {
        definition.*keyword.flag = flag != 0;
      }
      break;
    }
    case KeywordKind::List:
      definition.*keyword.list += splitDefinitionList(value);
      break;
    case KeywordKind::EncodedList:
      for (const QString& entry : splitDefinitionList(value)) {
        (definition.*keyword.list).append(QORXWwjdDecode(entry));
      }
      break;
    case KeywordKind::InputList:
      for (const QString& entry : splitDefinitionList(value)) {
        if (entry != kNoInput) {
          (definition.*keyword.list).append(entry);
        }
      }
      break;
    case KeywordKind::Modes:
      for (const QString& mode : splitDefinitionList(value)) {
        definition.*keyword.number |= featureHoldingBit(mode);
      }
      break;
    case KeywordKind::ParallelList:
      (definition.*keyword.list).append(value);
      break;
    case KeywordKind::Lookup:
      if (!definition.parameterNames.isEmpty()) {
        definition.parameterLookups[definition.parameterNames.last()].append(value);
      }
      break;
    case KeywordKind::TagDescription: {
      QString tag;
      QString description;
      if (splitTagDescription(value, tag, description)) {
        definition.tagDescriptions.insert(tag, description);
      }
      break;
    }
    case KeywordKind::NamePair:
      break;
  }
}

void pad(QStringList& list, int size) {
  while (list.size() < size) {
    list.append(QString());
  }
}

}  // namespace

QStringList textsOf(const std::vector<DefinitionLine>& lines) {
  QStringList result;
  result.reserve(static_cast<int>(lines.size()));
  for (const DefinitionLine& line : lines) {
    result.append(line.text);
  }
  return result;
}

int DefinitionText::firstLine() const {
  int first = 0;
  for (const auto* lines : {&header, &templateLines, &description, &tooltip, &changeLog}) {
    if (!lines->empty() && (first == 0 || lines->front().number < first)) {
      first = lines->front().number;
    }
  }
  return first;
}

TransformerDefinition DefinitionFileParser::interpret(const DefinitionText& text) {
  TransformerDefinition definition;
  definition.filePath = text.filePath;
  for (const DefinitionLine& line : text.header) {
    if (const DefinitionKeyword* keyword = findDefinitionKeyword(line.text, DefinitionKeyword::kDefinition)) {
      takeValue(*keyword, keywordValue(*keyword, line.text), definition);
    }
  }
  pad(definition.parameterDefaults, definition.parameterNames.size());
  pad(definition.parameterPrompts, definition.parameterNames.size());
  definition.templateLines = textsOf(text.templateLines);
  definition.descriptionLines = textsOf(text.description);
  definition.tooltipLines = textsOf(text.tooltip);
  definition.changeLog = textsOf(text.changeLog);
  return definition;
}

bool DefinitionFileParser::parse(QIODevice& device, const QString& path) {
  *this = DefinitionFileParser();
  DefinitionLines lines;
  if (!lines.open(device)) {
    m_error = lines.errorString();
    return false;
  }
  DefinitionText& current = m_unfinished;
  current.filePath = path;
  while (lines.next()) {
    if (lines.isSkipped()) {
      continue;
    }
    const QString line = lines.trimmed();
    const int number = lines.number();
    if (current.isEmpty()) {
      current.offset = lines.offset();
    }
    bool isClosed = true;
    if (line.startsWith(kCategoryDescriptionStart)) {
      CategoryText category{line.mid(kCategoryDescriptionStart.size()).trimmed(), {}, number};
      isClosed = lines.readBlock(kCategoryDescriptionEnd, category.lines);
      m_categories.push_back(std::move(category));
    } else if (line == kTemplateStart) {
      isClosed = lines.readTemplate(kTemplateEnd, current.templateLines);
      if (isClosed) {
        current.size = lines.endOffset() - current.offset;
        m_definitions.push_back(std::move(current));
        current = DefinitionText();
        current.filePath = path;
      }
    } else if (line == kDescriptionStart) {
      isClosed = lines.readBlock(kDescriptionEnd, current.description);
    } else if (line == kTooltipStart) {
      isClosed = lines.readBlock(kTooltipEnd, current.tooltip);
    } else if (line == kChangeLogStart) {
      isClosed = lines.readBlock(kChangeLogEnd, current.changeLog);
    } else {
      current.header.push_back({line, number});
    }
    if (!isClosed) {
      m_openBlockLine = number;
    }
  }
  m_isSoundUtf8 = lines.isSoundUtf8();
  return true;
}
