// The keywords of definition files: one table for the parser, the checks and the documentation.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerDefinition.h>

#include <QLatin1String>

#include <vector>

// How the value behind a keyword is taken.
enum class KeywordKind {
  Text,            // as it stands; a later line replaces an earlier one
  Number,          // decimal; anything else is 0
  Flag,            // yes, true, no, false; anything else changes nothing
  List,            // split at blanks, "<BLANK>" is an empty entry; a later line appends
  EncodedList,     // a list whose entries are word-encoded
  InputList,       // a list from which "<NO_INPUT>" is removed
  Modes,           // the feature-holding bits
  ParallelList,    // one entry per line; the n-th entries of these keywords belong together
  Lookup,          // lookup line of the parameter named last
  TagDescription,  // a tag, then its description
};

struct DefinitionKeyword {
  QLatin1String word;  // as it stands at the beginning of the line, its colon included where it has one
  KeywordKind kind;
  QString TransformerDefinition::*text = nullptr;
  int TransformerDefinition::*number = nullptr;
  bool TransformerDefinition::*flag = nullptr;
  QStringList TransformerDefinition::*list = nullptr;
};

// In the order in which they are documented.
ORX_EXPORT const std::vector<DefinitionKeyword>& definitionKeywords();

// Words that stand alone on a line and enclose a block; kCategoryDescriptionStart is followed by the
// category's name.
inline const QLatin1String kTemplateStart("TEMPLATE_START");
inline const QLatin1String kTemplateEnd("TEMPLATE_END");
inline const QLatin1String kDescriptionStart("DESCRIPTION_START");
inline const QLatin1String kDescriptionEnd("DESCRIPTION_END");
inline const QLatin1String kTooltipStart("TOOLTIP_START");
inline const QLatin1String kTooltipEnd("TOOLTIP_END");
inline const QLatin1String kChangeLogStart("CHANGE_LOG_START");
inline const QLatin1String kChangeLogEnd("CHANGE_LOG_END");
inline const QLatin1String kCategoryDescriptionStart("CATEGORY_DESCRIPTION_START");
inline const QLatin1String kCategoryDescriptionEnd("CATEGORY_DESCRIPTION_END");

// Keywords that only localised companions know, beside TRANSFORMER_NAME:, VERSION:, PARAMETER_NAME: and
// PARAMETER_PROMPT:.
inline const QLatin1String kTransformerName("TRANSFORMER_NAME:");
inline const QLatin1String kVersion("VERSION:");
inline const QLatin1String kParameterName("PARAMETER_NAME:");
inline const QLatin1String kParameterPrompt("PARAMETER_PROMPT:");
inline const QLatin1String kLocalizedName("LOCALIZED_NAME:");
inline const QLatin1String kCategoryName("CATEGORY_NAME:");
inline const QLatin1String kTagDescription("TAG_DESCRIPTION");

// The pieces of a list value: split at blanks, empty pieces dropped, "<BLANK>" turned into an empty text.
ORX_EXPORT QStringList splitDefinitionList(const QString& value);
