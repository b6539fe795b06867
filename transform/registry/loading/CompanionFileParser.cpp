#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionWalk.h>

bool CompanionFileParser::parse(QIODevice& device) {
  *this = CompanionFileParser();
  DefinitionLines lines;
  if (!lines.open(device)) {
    m_error = lines.errorString();
    return false;
  }
  read(lines);
  return true;
}

void CompanionFileParser::parse(const QByteArray& file) {
  *this = CompanionFileParser();
  DefinitionLines lines;
  lines.open(file, true);
  read(lines);
}

// What the walk over a file's lines tells the parser.
class CompanionFileParser::Visitor {
 public:
  explicit Visitor(CompanionFileParser& parser) : m_parser(parser) {}

  void begin(const DefinitionLines&) {}
  void header(const DefinitionLines& lines) {
    const QString line = lines.trimmed();
    if (!m_parser.takeLine(line, lines.number())) {
      m_parser.m_strayLines.push_back({line, lines.number()});
    }
  }
  std::vector<DefinitionLine>* block(DefinitionBlock) {
    m_texts.clear();
    return &m_texts;
  }
  void blockRead(DefinitionBlock block, int number) {
    if (m_parser.m_entries.empty()) {
      m_parser.m_strayLines.push_back({wordsOf(block).start, number});
      return;
    }
    CompanionEntry& entry = m_parser.m_entries.back();
    QStringList& target = block == DefinitionBlock::Description ? entry.descriptionLines
                          : block == DefinitionBlock::Tooltip   ? entry.tooltipLines
                                                                : entry.changeLog;
    target += textsOf(m_texts);
  }
  std::vector<DefinitionLine>* templateBlock() { return nullptr; }
  void templateRead(const DefinitionLines&) {}
  std::vector<CategoryText>& categories() { return m_parser.m_categoryDescriptions; }
  void open(int number) { m_parser.m_openBlockLine = number; }

 private:
  CompanionFileParser& m_parser;
  std::vector<DefinitionLine> m_texts;  // of the block under way
};

void CompanionFileParser::read(DefinitionLines& lines) {
  walkDefinitionLines(lines, DefinitionFileKind::Companion, Visitor(*this));
  m_isSoundUtf8 = lines.isSoundUtf8();
}

// False when the line means nothing.
bool CompanionFileParser::takeLine(const QString& line, int number) {
  const DefinitionKeyword* keyword = findDefinitionKeyword(line, DefinitionKeyword::kCompanion);
  if (!keyword) {
    return false;
  }
  const QString value = keywordValue(*keyword, line);
  if (keyword->word == kCategoryName) {
    const int comma = value.indexOf(QLatin1Char(','));
    const QString name = value.left(comma).trimmed();
    const QString localized = comma < 0 ? QString() : value.mid(comma + 1).trimmed();
    if (name.isEmpty() || localized.isEmpty()) {
      return false;
    }
    m_categoryNames.push_back({name, localized, number});
    return true;
  }
  if (keyword->word == kTransformerName) {
    m_entries.emplace_back();
    m_entries.back().name = value;
    m_entries.back().line = number;
    return true;
  }
  if (m_entries.empty()) {
    return false;
  }
  CompanionEntry& entry = m_entries.back();
  if (keyword->word == kVersion) {
    entry.version = value.toInt();
    entry.hasVersion = true;
  } else if (keyword->word == kLocalizedName) {
    entry.localizedName = value;
  } else if (keyword->word == kParameterName) {
    entry.prompts.push_back({value, QString(), number});
  } else if (keyword->word == kParameterPrompt) {
    if (entry.prompts.empty()) {
      return false;
    }
    entry.prompts.back().text = value;
  } else {
    CompanionEntry::Text description;
    description.line = number;
    if (!splitTagDescription(value, description.name, description.text)) {
      return false;
    }
    entry.tagDescriptions.push_back(std::move(description));
  }
  return true;
}
