#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionKeywords.h>

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

void CompanionFileParser::read(DefinitionLines& lines) {
  while (lines.next()) {
    if (lines.isSkipped()) {
      continue;
    }
    const QString line = lines.trimmed();
    const int number = lines.number();
    if (line.startsWith(kCategoryDescriptionStart)) {
      if (!readCategoryText(lines, m_categoryDescriptions)) {
        m_openBlockLine = number;
      }
      continue;
    }
    QStringList CompanionEntry::*block = line == kDescriptionStart ? &CompanionEntry::descriptionLines
                                         : line == kTooltipStart   ? &CompanionEntry::tooltipLines
                                         : line == kChangeLogStart ? &CompanionEntry::changeLog
                                                                   : nullptr;
    if (!block) {
      if (!takeLine(line, number)) {
        m_strayLines.push_back({line, number});
      }
      continue;
    }
    std::vector<DefinitionLine> texts;
    if (!lines.readBlock(line == kDescriptionStart ? kDescriptionEnd
                         : line == kTooltipStart   ? kTooltipEnd
                                                   : kChangeLogEnd,
                         &texts)) {
      m_openBlockLine = number;
    }
    if (m_entries.empty()) {
      m_strayLines.push_back({line, number});
      continue;
    }
    for (const DefinitionLine& text : texts) {
      (m_entries.back().*block).append(text.text);
    }
  }
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
