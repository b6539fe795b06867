#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionWalk.h>

#include <utility>

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

// What the walk over a file's lines tells the parser.
class DefinitionFileParser::Visitor {
 public:
  explicit Visitor(DefinitionFileParser& parser) : m_parser(parser) {}

  void begin(const DefinitionLines&) {}
  void header(const DefinitionLines& lines) {
    if (m_parser.m_keepsUnknownLines || findDefinitionKeyword(lines, DefinitionKeyword::kDefinition)) {
      m_parser.m_unfinished.header.push_back({lines.trimmed(), lines.number()});
    }
  }
  std::vector<DefinitionLine>* block(DefinitionBlock block) {
    DefinitionText& text = m_parser.m_unfinished;
    return block == DefinitionBlock::Description ? &text.description
           : block == DefinitionBlock::Tooltip   ? &text.tooltip
                                                 : &text.changeLog;
  }
  void blockRead(DefinitionBlock, int) {}
  std::vector<DefinitionLine>* templateBlock() { return &m_parser.m_unfinished.templateLines; }
  void templateRead(const DefinitionLines&) {
    DefinitionText next;
    next.filePath = m_parser.m_unfinished.filePath;
    m_parser.m_definitions.push_back(std::exchange(m_parser.m_unfinished, std::move(next)));
  }
  std::vector<CategoryText>& categories() { return m_parser.m_categories; }
  void open(int number) { m_parser.m_openBlockLine = number; }

 private:
  DefinitionFileParser& m_parser;
};

void DefinitionFileParser::read(DefinitionLines& lines, const QString& path) {
  m_unfinished.filePath = path;
  walkDefinitionLines(lines, DefinitionFileKind::Definitions, Visitor(*this));
}
