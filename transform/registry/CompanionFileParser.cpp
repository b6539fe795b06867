#include <transform/registry/CompanionFileParser.h>
#include <transform/registry/DefinitionFileParser.h>
#include <transform/registry/DefinitionKeywords.h>
#include <transform/registry/DefinitionLines.h>

namespace {

bool takeKeyword(const QString& line, QLatin1String keyword, QString& value) {
  if (!line.startsWith(keyword))
    return false;
  value = line.mid(keyword.size()).trimmed();
  return true;
}

}  // namespace

CompanionFileParser::CompanionFileParser(Handlers handlers) : m_handlers(std::move(handlers)) {}

void CompanionFileParser::parse(QIODevice& device) {
  DefinitionLines lines(device);
  CompanionEntry entry;
  const auto finish = [&] {
    if (!entry.name.isEmpty())
      m_handlers.entry(entry);
    entry = CompanionEntry();
  };
  while (lines.next()) {
    if (lines.isSkipped())
      continue;
    const QString line = lines.trimmed();
    QString value;
    if (line.startsWith(kCategoryDescriptionStart)) {
      QStringList description;
      lines.readBlock(kCategoryDescriptionEnd, description);
      m_handlers.categoryDescription(line.mid(kCategoryDescriptionStart.size()).trimmed(), description);
    } else if (line == kDescriptionStart) {
      lines.readBlock(kDescriptionEnd, entry.descriptionLines);
    } else if (line == kTooltipStart) {
      lines.readBlock(kTooltipEnd, entry.tooltipLines);
    } else if (line == kChangeLogStart) {
      lines.readBlock(kChangeLogEnd, entry.changeLog);
    } else if (takeKeyword(line, kCategoryName, value)) {
      const int comma = value.indexOf(QLatin1Char(','));
      if (comma > 0)
        m_handlers.categoryName(value.left(comma).trimmed(), value.mid(comma + 1).trimmed());
    } else if (takeKeyword(line, kTransformerName, value)) {
      finish();
      entry.name = value;
      entry.line = lines.number();
    } else if (takeKeyword(line, kVersion, value)) {
      entry.version = value.toInt();
      entry.hasVersion = true;
    } else if (takeKeyword(line, kLocalizedName, value)) {
      entry.localizedName = value;
    } else if (takeKeyword(line, kParameterName, value)) {
      entry.prompts.emplace_back(value, QString());
    } else if (takeKeyword(line, kParameterPrompt, value)) {
      if (!entry.prompts.empty())
        entry.prompts.back().second = value;
    } else if (takeKeyword(line, kTagDescription, value)) {
      TransformerDefinition texts;
      if (DefinitionFileParser::takeHeaderLine(line, texts)) {
        for (auto text = texts.tagDescriptions.cbegin(); text != texts.tagDescriptions.cend(); ++text)
          entry.tagDescriptions.emplace_back(text.key(), text.value());
      }
    }
  }
  finish();
}
