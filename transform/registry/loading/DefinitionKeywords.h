// The keywords of definition files and localised companions: one table for the parsers, the checks and the
// documentation.
#pragma once

#include <transform/core/TransformerDefinition.h>

#include <QLatin1String>

#include <vector>

class DefinitionLines;

// How the value behind a keyword is taken.
enum class KeywordKind {
  Text,            // as it stands; a later line replaces an earlier one
  Number,          // decimal; anything else is 0
  Flag,            // yes, true, no, false; anything else changes nothing
  List,            // split at blanks, "<BLANK>" is an empty entry; a later line appends
  EncodedList,     // a list whose entries are word-encoded
  InputList,       // a list from which "<NO_INPUT>" is removed
  Modes,           // the feature-holding bits
  ParallelList,    // one entry per line; the n-th entries of the parameters' keywords belong together
  Lookup,          // lookup line of the parameter named last
  TagDescription,  // a tag, then its description
  NamePair,        // a category's name, a comma, its localised name
};

struct DefinitionKeyword {
  enum Place : unsigned {
    kDefinition = 1,
    kCompanion = 2,
    kRegistration = 4,  // in a definition, and needed before anyone asks for it
  };

  QLatin1String word;  // as it stands at the beginning of the line, its colon included where it has one
  KeywordKind kind;
  unsigned places = kDefinition;  // in which files it means something
  // The field that a definition's value goes to; at most one is set.
  QString TransformerDefinition::*text = nullptr;
  int TransformerDefinition::*number = nullptr;
  bool TransformerDefinition::*flag = nullptr;
  QStringList TransformerDefinition::*list = nullptr;
};

// In the order in which they are documented. None begins with another.
const std::vector<DefinitionKeyword>& definitionKeywords();
// The keyword that the line begins with and that means something in that kind of file; null without one.
const DefinitionKeyword* findDefinitionKeyword(const QString& line, unsigned place);
const DefinitionKeyword* findDefinitionKeyword(const DefinitionLines& line, unsigned place);
// Puts a definition's value where the keyword says.
void takeDefinitionValue(const DefinitionKeyword& keyword, const QString& value,
                         TransformerDefinition& definition);
// What stands behind the keyword, trimmed.
QString keywordValue(const DefinitionKeyword& keyword, const QString& line);

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

// Keywords that the code names.
inline const QLatin1String kTransformerName("TRANSFORMER_NAME:");
inline const QLatin1String kVersion("VERSION:");
inline const QLatin1String kParameterName("PARAMETER_NAME:");
inline const QLatin1String kParameterType("PARAMETER_TYPE:");
inline const QLatin1String kParameterPrompt("PARAMETER_PROMPT:");
inline const QLatin1String kParameterDefault("PARAMETER_DEFAULT:");
inline const QLatin1String kParameterLookup("PARAMETER_LOOKUP:");
inline const QLatin1String kLocalizedName("LOCALIZED_NAME:");
inline const QLatin1String kCategoryName("CATEGORY_NAME:");
inline const QLatin1String kTagDescription("TAG_DESCRIPTION");

// Words inside values.
inline const QLatin1String kBlankEntry("<BLANK>");
inline const QLatin1String kNoInput("<NO_INPUT>");

// The feature-holding bit of a mode; 0 for a word that is none.
int featureHoldingBit(const QString& mode);
// The value of a flag: 1, 0, or -1 for a word that is none.
int flagValue(const QString& value);
// The pieces of a list value: split at blanks, empty pieces dropped, "<BLANK>" turned into an empty text.
QStringList splitDefinitionList(const QString& value);
// Takes apart the value of a tag description. False when it has no description.
bool splitTagDescription(const QString& value, QString& tag, QString& description);
