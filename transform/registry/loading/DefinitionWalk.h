// The walk over the lines of a definition file or a companion: what is skipped, where blocks, templates and
// descriptions of categories begin and end. Whoever reads such a file says where the lines go.
//
// A visitor has
//   begin(lines)              at each line that belongs to a definition, blocks and templates included
//   header(lines)             at each line outside of blocks
//   block(DefinitionBlock)    where the lines of a block that begins go; null passes them over
//   blockRead(DefinitionBlock, number)
//   templateBlock(), templateRead(lines)  likewise of a template that has its end
//   categories()              where the descriptions of categories go
//   open(number)              the file ends in the block that began on this line
#pragma once

#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/registry/loading/DefinitionText.h>

#include <algorithm>
#include <iterator>

enum class DefinitionBlock { Description, Tooltip, ChangeLog };

struct DefinitionBlockWords {
  DefinitionBlock block;
  QLatin1String start;
  QLatin1String end;
};

inline const DefinitionBlockWords kDefinitionBlocks[] = {
    {DefinitionBlock::Description, kDescriptionStart, kDescriptionEnd},
    {DefinitionBlock::Tooltip, kTooltipStart, kTooltipEnd},
    {DefinitionBlock::ChangeLog, kChangeLogStart, kChangeLogEnd},
};

inline const DefinitionBlockWords& wordsOf(DefinitionBlock block) {
  return kDefinitionBlocks[static_cast<int>(block)];
}

enum class DefinitionFileKind {
  Definitions,
  Companion,  // has no templates
};

template <class Visitor>
void walkDefinitionLines(DefinitionLines& lines, DefinitionFileKind kind, Visitor&& visitor) {
  while (lines.next()) {
    if (lines.isSkipped()) {
      continue;
    }
    const int number = lines.number();
    if (lines.startsWith(kCategoryDescriptionStart)) {
      if (!readCategoryText(lines, visitor.categories())) {
        visitor.open(number);
      }
      continue;
    }
    visitor.begin(lines);
    if (kind == DefinitionFileKind::Definitions && lines.is(kTemplateStart)) {
      if (lines.readTemplate(kTemplateEnd, visitor.templateBlock())) {
        visitor.templateRead(lines);
      } else {
        visitor.open(number);
      }
      continue;
    }
    const DefinitionBlockWords* words =
        std::find_if(std::begin(kDefinitionBlocks), std::end(kDefinitionBlocks),
                     [&](const DefinitionBlockWords& candidate) { return lines.is(candidate.start); });
    if (words == std::end(kDefinitionBlocks)) {
      visitor.header(lines);
      continue;
    }
    if (!lines.readBlock(words->end, visitor.block(words->block))) {
      visitor.open(number);
    }
    visitor.blockRead(words->block, number);
  }
}
