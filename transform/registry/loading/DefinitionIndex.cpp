#include <transform/registry/loading/DefinitionIndex.h>
#include <transform/registry/loading/DefinitionKeywords.h>

#include <algorithm>
#include <iterator>

namespace {

const DefinitionKeyword* registrationKeyword(const DefinitionLines& lines) {
  static const std::vector<DefinitionKeyword> keywords = [] {
    std::vector<DefinitionKeyword> wanted;
    std::copy_if(definitionKeywords().begin(), definitionKeywords().end(), std::back_inserter(wanted),
                 [](const DefinitionKeyword& keyword) {
                   return (keyword.places & DefinitionKeyword::kRegistration) != 0;
                 });
    return wanted;
  }();
  for (const DefinitionKeyword& keyword : keywords) {
    if (lines.startsWith(keyword.word)) {
      return &keyword;
    }
  }
  return nullptr;
}

}  // namespace

void DefinitionIndex::read(const QByteArray& file) {
  m_definitions.clear();
  m_categories.clear();
  DefinitionLines lines;
  lines.open(file, true);
  IndexedDefinition current;
  qint64 start = -1;  // of the current definition's first line
  while (lines.next()) {
    if (lines.isSkipped()) {
      continue;
    }
    if (lines.startsWith(kCategoryDescriptionStart)) {
      readCategoryText(lines, m_categories);
      continue;
    }
    if (start < 0) {
      start = lines.offset();
    }
    if (lines.is(kTemplateStart)) {
      if (lines.readTemplate(kTemplateEnd, nullptr)) {
        current.bytes = QByteArray(file.constData() + start, static_cast<int>(lines.endOffset() - start));
        m_definitions.push_back(std::move(current));
        current = IndexedDefinition();
        start = -1;
      }
    } else if (lines.is(kDescriptionStart)) {
      lines.readBlock(kDescriptionEnd, nullptr);
    } else if (lines.is(kTooltipStart)) {
      lines.readBlock(kTooltipEnd, nullptr);
    } else if (lines.is(kChangeLogStart)) {
      lines.readBlock(kChangeLogEnd, nullptr);
    } else if (const DefinitionKeyword* keyword = registrationKeyword(lines)) {
      takeDefinitionValue(*keyword, lines.behind(keyword->word), current.facts);
    }
  }
  m_endsUnfinished = start >= 0;
  m_unfinishedName = current.facts.name;
}
