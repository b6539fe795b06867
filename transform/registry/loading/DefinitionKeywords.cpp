#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/loading/DefinitionKeywords.h>
#include <transform/registry/loading/DefinitionLines.h>

namespace {

using Fields = TransformerDefinition;

constexpr unsigned kHere = DefinitionKeyword::kDefinition;
constexpr unsigned kBoth = DefinitionKeyword::kDefinition | DefinitionKeyword::kCompanion;
constexpr unsigned kEarly = DefinitionKeyword::kDefinition | DefinitionKeyword::kRegistration;

DefinitionKeyword text(QLatin1String word, QString Fields::*field, unsigned places = kHere) {
  DefinitionKeyword keyword{word, KeywordKind::Text, places};
  keyword.text = field;
  return keyword;
}

DefinitionKeyword number(QLatin1String word, int Fields::*field, KeywordKind kind, unsigned places = kHere) {
  DefinitionKeyword keyword{word, kind, places};
  keyword.number = field;
  return keyword;
}

DefinitionKeyword flag(QLatin1String word, bool Fields::*field, unsigned places = kHere) {
  DefinitionKeyword keyword{word, KeywordKind::Flag, places};
  keyword.flag = field;
  return keyword;
}

DefinitionKeyword list(QLatin1String word, QStringList Fields::*field, KeywordKind kind = KeywordKind::List,
                       unsigned places = kHere) {
  DefinitionKeyword keyword{word, kind, places};
  keyword.list = field;
  return keyword;
}

}  // namespace

const std::vector<DefinitionKeyword>& definitionKeywords() {
  static const std::vector<DefinitionKeyword> keywords = {
      text(kTransformerName, &Fields::name, kBoth | kEarly),
      number(kVersion, &Fields::version, KeywordKind::Number, kBoth | kEarly),
      text(QLatin1String("CATEGORY:"), &Fields::category, kEarly),
      text(QLatin1String("PLUGIN_DIALOG:"), &Fields::pluginDialog),
      number(QLatin1String("FEATURE_HOLDING:"), &Fields::featureHolding, KeywordKind::Modes),
      list(QLatin1String("INPUT_TAGS:"), &Fields::inputTags, KeywordKind::InputList),
      list(QLatin1String("DYNAMIC_INPUT_TAGS:"), &Fields::dynamicInputTags, KeywordKind::EncodedList),
      text(QLatin1String("HIDDEN_INPUT_TAG:"), &Fields::hiddenInputTag),
      text(QLatin1String("HIDDEN_OUTPUT_TAG:"), &Fields::hiddenOutputTag),
      list(QLatin1String("OUTPUT_TAGS:"), &Fields::outputTags),
      list(QLatin1String("PRESERVES_ATTRIBUTES:"), &Fields::preservesAttributes),
      list(QLatin1String("ATTRIBUTES_ADDED:"), &Fields::attributesAdded),
      list(QLatin1String("ALIASES:"), &Fields::aliases, KeywordKind::List, kEarly),
      list(kParameterName, &Fields::parameterNames, KeywordKind::ParallelList, kBoth),
      list(kParameterType, &Fields::parameterTypes, KeywordKind::ParallelList),
      list(kParameterPrompt, &Fields::parameterPrompts, KeywordKind::ParallelList, kBoth),
      list(kParameterDefault, &Fields::parameterDefaults, KeywordKind::ParallelList),
      {kParameterLookup, KeywordKind::Lookup},
      text(QLatin1String("MULTIPROCESS:"), &Fields::multiProcess),
      list(QLatin1String("LIST_ACTION:"), &Fields::listActions, KeywordKind::ParallelList),
      flag(QLatin1String("NUKERS_REQUIRED:"), &Fields::nukersRequired),
      flag(QLatin1String("VISIBLE:"), &Fields::visible, kEarly),
      text(QLatin1String("REPLACED_BY:"), &Fields::replacedBy),
      list(QLatin1String("PARAMETER_MAPPING:"), &Fields::parameterMapping),
      list(QLatin1String("TAG_MAPPING"), &Fields::tagMapping),
      text(QLatin1String("DECORATION_NAME:"), &Fields::decorationName),
      flag(QLatin1String("DECORATION_LEFT:"), &Fields::decorationLeft),
      list(QLatin1String("CANVAS_PROPERTIES:"), &Fields::canvasProperties),
      {kTagDescription, KeywordKind::TagDescription, kBoth},
      list(QLatin1String("DEPENDENCY:"), &Fields::dependencyScripts, KeywordKind::ParallelList, kEarly),
      {kLocalizedName, KeywordKind::Text, DefinitionKeyword::kCompanion},
      {kCategoryName, KeywordKind::NamePair, DefinitionKeyword::kCompanion},
  };
  return keywords;
}

const DefinitionKeyword* findDefinitionKeyword(const QString& line, unsigned place) {
  if (line.isEmpty()) {
    return nullptr;
  }
  const QChar first = line.at(0);
  for (const DefinitionKeyword& keyword : definitionKeywords()) {
    if (first == QLatin1Char(*keyword.word.data()) && (keyword.places & place) &&
        line.startsWith(keyword.word)) {
      return &keyword;
    }
  }
  return nullptr;
}

const DefinitionKeyword* findDefinitionKeyword(const DefinitionLines& line, unsigned place) {
  for (const DefinitionKeyword& keyword : definitionKeywords()) {
    if ((keyword.places & place) && line.startsWith(keyword.word)) {
      return &keyword;
    }
  }
  return nullptr;
}

void takeDefinitionValue(const DefinitionKeyword& keyword, const QString& value,
                         TransformerDefinition& definition) {
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

QString keywordValue(const DefinitionKeyword& keyword, const QString& line) {
  return line.mid(keyword.word.size()).trimmed();
}

int featureHoldingBit(const QString& mode) {
  return mode == TransformerCfg::kNone    ? 1
         : mode == TransformerCfg::kGroup ? 2
         : mode == TransformerCfg::kAll   ? 4
                                          : 0;
}

int flagValue(const QString& value) {
  const QString word = value.toLower();
  if (word == QLatin1String("yes") || word == QLatin1String("true")) {
    return 1;
  }
  return word == QLatin1String("no") || word == QLatin1String("false") ? 0 : -1;
}

QStringList splitDefinitionList(const QString& value) {
  QStringList pieces = value.split(QLatin1Char(' '), Qt::SkipEmptyParts);
  for (QString& piece : pieces) {
    if (piece == kBlankEntry) {
      piece = QLatin1String("");
    }
  }
  return pieces;
}

bool splitTagDescription(const QString& value, QString& tag, QString& description) {
  QStringList pieces = splitDefinitionList(value);
  if (pieces.size() < 2) {
    return false;
  }
  tag = pieces.takeFirst();
  if (tag.endsWith(QLatin1Char(':'))) {
    tag.chop(1);
  }
  description = pieces.join(QLatin1Char(' '));
  return true;
}
