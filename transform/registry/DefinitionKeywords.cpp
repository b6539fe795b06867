#include <transform/registry/DefinitionKeywords.h>

namespace {

using Fields = TransformerDefinition;

DefinitionKeyword text(const char* word, QString Fields::*field) {
  DefinitionKeyword keyword{QLatin1String(word), KeywordKind::Text};
  keyword.text = field;
  return keyword;
}

DefinitionKeyword number(const char* word, int Fields::*field, KeywordKind kind = KeywordKind::Number) {
  DefinitionKeyword keyword{QLatin1String(word), kind};
  keyword.number = field;
  return keyword;
}

DefinitionKeyword flag(const char* word, bool Fields::*field) {
  DefinitionKeyword keyword{QLatin1String(word), KeywordKind::Flag};
  keyword.flag = field;
  return keyword;
}

DefinitionKeyword list(const char* word, QStringList Fields::*field, KeywordKind kind = KeywordKind::List) {
  DefinitionKeyword keyword{QLatin1String(word), kind};
  keyword.list = field;
  return keyword;
}

}  // namespace

const std::vector<DefinitionKeyword>& definitionKeywords() {
  static const std::vector<DefinitionKeyword> keywords = {
      text("TRANSFORMER_NAME:", &Fields::name),
      number("VERSION:", &Fields::version),
      text("CATEGORY:", &Fields::category),
      text("PLUGIN_DIALOG:", &Fields::pluginDialog),
      number("FEATURE_HOLDING:", &Fields::featureHolding, KeywordKind::Modes),
      list("INPUT_TAGS:", &Fields::inputTags, KeywordKind::InputList),
      list("DYNAMIC_INPUT_TAGS:", &Fields::dynamicInputTags, KeywordKind::EncodedList),
      text("HIDDEN_INPUT_TAG:", &Fields::hiddenInputTag),
      text("HIDDEN_OUTPUT_TAG:", &Fields::hiddenOutputTag),
      list("OUTPUT_TAGS:", &Fields::outputTags),
      list("PRESERVES_ATTRIBUTES:", &Fields::preservesAttributes),
      list("ATTRIBUTES_ADDED:", &Fields::attributesAdded),
      list("ALIASES:", &Fields::aliases),
      list("PARAMETER_NAME:", &Fields::parameterNames, KeywordKind::ParallelList),
      list("PARAMETER_TYPE:", &Fields::parameterTypes, KeywordKind::ParallelList),
      list("PARAMETER_PROMPT:", &Fields::parameterPrompts, KeywordKind::ParallelList),
      list("PARAMETER_DEFAULT:", &Fields::parameterDefaults, KeywordKind::ParallelList),
      {QLatin1String("PARAMETER_LOOKUP:"), KeywordKind::Lookup},
      text("MULTIPROCESS:", &Fields::multiProcess),
      list("LIST_ACTION:", &Fields::listActions, KeywordKind::ParallelList),
      flag("NUKERS_REQUIRED:", &Fields::nukersRequired),
      flag("VISIBLE:", &Fields::visible),
      text("REPLACED_BY:", &Fields::replacedBy),
      list("PARAMETER_MAPPING:", &Fields::parameterMapping),
      list("TAG_MAPPING", &Fields::tagMapping),
      text("DECORATION_NAME:", &Fields::decorationName),
      flag("DECORATION_LEFT:", &Fields::decorationLeft),
      list("CANVAS_PROPERTIES:", &Fields::canvasProperties),
      {kTagDescription, KeywordKind::TagDescription},
      list("DEPENDENCY:", &Fields::dependencyScripts, KeywordKind::ParallelList),
  };
  return keywords;
}

QStringList splitDefinitionList(const QString& value) {
  QStringList pieces = value.split(QLatin1Char(' '), Qt::SkipEmptyParts);
  for (QString& piece : pieces) {
    if (piece == QLatin1String("<BLANK>"))
      piece.clear();
  }
  return pieces;
}
