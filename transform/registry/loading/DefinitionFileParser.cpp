#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionKeywords.h>

namespace {

void pad(QStringList& list, int size) {
  while (list.size() < size) {
    list.append(QString());
  }
}

}  // namespace

TransformerDefinition DefinitionFileParser::interpret(const DefinitionText& text) {
  TransformerDefinition definition;
  definition.filePath = text.filePath;
  for (const DefinitionLine& line : text.header) {
    if (const DefinitionKeyword* keyword = findDefinitionKeyword(line.text, DefinitionKeyword::kDefinition)) {
      takeDefinitionValue(*keyword, keywordValue(*keyword, line.text), definition);
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

TransformerDefinition DefinitionFileParser::definitionAlone(const QByteArray& bytes, const QString& path) {
  DefinitionLines lines;
  lines.open(bytes, false);
  DefinitionFileParser parser;
  parser.m_keepsUnknownLines = false;  // there may be any number of them
  parser.read(lines, path);
  return parser.m_definitions.empty() ? TransformerDefinition() : interpret(parser.m_definitions.front());
}

bool DefinitionFileParser::parse(QIODevice& device, const QString& path) {
  *this = DefinitionFileParser();
  DefinitionLines lines;
  if (!lines.open(device)) {
    m_error = lines.errorString();
    return false;
  }
  read(lines, path);
  m_isSoundUtf8 = lines.isSoundUtf8();
  return true;
}

void DefinitionFileParser::read(DefinitionLines& lines, const QString& path) {
  DefinitionText& current = m_unfinished;
  current.filePath = path;
  while (lines.next()) {
    if (lines.isSkipped()) {
      continue;
    }
    const int number = lines.number();
    bool isClosed = true;
    if (lines.is(kTemplateStart)) {
      isClosed = lines.readTemplate(kTemplateEnd, &current.templateLines);
      if (isClosed) {
        m_definitions.push_back(std::move(current));
        current = DefinitionText();
        current.filePath = path;
      }
    } else if (lines.is(kDescriptionStart)) {
      isClosed = lines.readBlock(kDescriptionEnd, &current.description);
    } else if (lines.is(kTooltipStart)) {
      isClosed = lines.readBlock(kTooltipEnd, &current.tooltip);
    } else if (lines.is(kChangeLogStart)) {
      isClosed = lines.readBlock(kChangeLogEnd, &current.changeLog);
    } else if (lines.startsWith(kCategoryDescriptionStart)) {
      isClosed = readCategoryText(lines, m_categories);
    } else if (m_keepsUnknownLines || findDefinitionKeyword(lines, DefinitionKeyword::kDefinition)) {
      current.header.push_back({lines.trimmed(), number});
    }
    if (!isClosed) {
      m_openBlockLine = number;
    }
  }
}
