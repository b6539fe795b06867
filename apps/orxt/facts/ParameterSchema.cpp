#include <apps/orxt/facts/ParameterSchema.h>
#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>

#include <QJsonArray>

namespace {

const QString kType = QStringLiteral("type");
const QString kDefault = QStringLiteral("default");
const QString kAnyOf = QStringLiteral("anyOf");
const QString kTitle = QStringLiteral("title");
const QString kConst = QStringLiteral("const");
const QString kEnum = QStringLiteral("enum");
const QString kItems = QStringLiteral("items");
const QString kProperties = QStringLiteral("properties");
const QString kClosed = QStringLiteral("additionalProperties");
const QString kComputed = QStringLiteral("computed");
const QString kJsonText = QStringLiteral("string");
const QString kListType = QStringLiteral("array");
const QString kObjectType = QStringLiteral("object");

const QLatin1Char kListSeparator(' ');
const QLatin1Char kConfigSeparator('%');

// What the type word says without what may take a value's place and how it is kept.
QString plainWord(const GUIType& type) {
  QString word = type.getType();
  if (word.endsWith(kEncodedSuffix))
    word.chop(kEncodedSuffix.size());
  if (word.endsWith(kOrAttributeSuffix))
    word.chop(kOrAttributeSuffix.size());
  return word;
}

bool isWhole(const QString& word) {
  return word == QLatin1String("INT") || word == QLatin1String("INTEGER");
}

bool isSlider(const QString& word) {
  return word == QLatin1String("RANGE_SLIDER");
}

bool isNumber(const QString& word) {
  return word == QLatin1String("FLOAT") || isSlider(word);
}

bool isNameList(const QString& word) {
  return word == QLatin1String("ATTR_LIST") || word == QLatin1String("FEATURE_TYPE_LIST");
}

QJsonObject choiceSchema(const ChoiceList& choices) {
  if (choices.isEmpty())
    return {{kType, kJsonText}};
  QJsonArray entries;
  for (const auto& [shown, stored] : choices.entries()) {
    if (choices.hasLookup())
      entries.append(QJsonObject{{kConst, stored}, {kTitle, shown}});
    else if (!entries.contains(stored))
      entries.append(stored);
  }
  return choices.hasLookup() ? QJsonObject{{kAnyOf, entries}} : QJsonObject{{kEnum, entries}};
}

QJsonObject numberSchema(const GUIType& type, const QString& word) {
  QJsonObject schema{{kType, isWhole(word) ? QStringLiteral("integer") : QStringLiteral("number")}};
  if (isSlider(word)) {
    const QStringList limits = ORX_splitConfig(type.getConfigToken(), kConfigSeparator);
    const char* const keys[] = {"minimum", "maximum"};
    for (int i = 0; i < 2 && i < limits.size(); ++i) {
      bool ok = false;
      const double limit = limits.at(i).toDouble(&ok);
      if (ok)
        schema.insert(QLatin1String(keys[i]), limit);
    }
  }
  return schema;
}

// `word` is no member list. A type that cannot be said more closely is a text.
QJsonObject simpleSchema(const GUIType& type, const QString& word, const ChoiceList& choices) {
  if (isWhole(word) || isNumber(word))
    return numberSchema(type, word);
  if (ORX_isListBoxType(type)) {
    return {{kType, kListType}, {kItems, choiceSchema(choices)}, {QStringLiteral("uniqueItems"), true}};
  }
  if (ORX_isChoiceType(type))
    return choiceSchema(choices);
  if (isNameList(word))
    return {{kType, kListType}, {kItems, QJsonObject{{kType, kJsonText}}}};
  if (word == QLatin1String("CHECKBOX")) {
    QStringList states = ORX_splitConfig(type.getConfigToken(), kConfigSeparator);
    if (states.isEmpty())
      states = QStringList{QStringLiteral("YES"), QStringLiteral("NO")};
    states.removeDuplicates();
    return {{kEnum, QJsonArray::fromStringList(states)}};
  }
  return {{kType, kJsonText}};
}

QJsonValue simpleValue(const GUIType& type, const QString& word, const ChoiceList& choices,
                       const QString& text) {
  const auto decoded = [&](const QString& piece) {
    return type.valueIsEncoded() ? QORXWwjdDecode(piece) : piece;
  };
  if (isWhole(word) || isNumber(word)) {
    bool ok = false;
    const double number = text.toDouble(&ok);
    return ok ? QJsonValue(number) : QJsonValue(text);
  }
  if (isNameList(word) || ORX_isListBoxType(type)) {
    QJsonArray list;
    for (const QString& piece : QORXStringToList(text, kListSeparator))
      list.append(isNameList(word) ? decoded(piece) : choices.toStored(piece));
    return list;
  }
  return ORX_isChoiceType(type) ? choices.toStored(text) : decoded(text);
}

QJsonObject withComputed(const QJsonObject& schema, bool takesComputed) {
  // A text holds anything already.
  if (!takesComputed || schema.value(kType).toString() == kJsonText)
    return schema;
  return {{kAnyOf,
           QJsonArray{schema, QJsonObject{{QStringLiteral("$ref"), QStringLiteral("#/$defs/computed")}}}}};
}

void forbidEmpty(QJsonObject& schema) {
  if (schema.value(kType) == kJsonText)
    schema.insert(QStringLiteral("minLength"), 1);
  else if (schema.value(kType) == kListType)
    schema.insert(QStringLiteral("minItems"), 1);
}

void describe(QJsonObject& schema, const GUIType& type) {
  if (!type.getDescription().isEmpty())
    schema.insert(kTitle, type.getDescription());
  schema.insert(QStringLiteral("$comment"), type.getTypeText());
}

QJsonObject memberSchema(const GUIType& member, const QString& part) {
  const QString word = plainWord(member);
  const ChoiceList choices(member);
  QJsonObject schema = withComputed(simpleSchema(member, word, choices), member.mayHoldAttributeReference());
  describe(schema, member);
  if (!isUnsetSetting(part))
    schema.insert(kDefault, simpleValue(member, word, choices, part));
  return schema;
}

// An object with a property for each member; `value` is packed as the record keeps it.
QJsonObject membersSchema(const TransformParamCfg& parameter, const QString& value) {
  QJsonObject properties;
  for (const GUIType& member : parameter.members().members()) {
    properties.insert(member.getName(),
                      memberSchema(member, parameter.members().memberValue(value, member.getName())));
  }
  return {{kType, kObjectType}, {kProperties, properties}, {kClosed, false}};
}

QJsonObject membersValue(const TransformParamCfg& parameter, const QString& value) {
  QJsonObject result;
  for (const GUIType& member : parameter.members().members()) {
    const QString part = parameter.members().memberValue(value, member.getName());
    if (!isUnsetSetting(part)) {
      result.insert(member.getName(), simpleValue(member, plainWord(member), ChoiceList(member), part));
    }
  }
  return result;
}

QJsonArray rowsValue(const TransformParamCfg& parameter, const QString& value) {
  const std::vector<GUIType>& columns = parameter.members().members();
  QJsonArray rows;
  QJsonObject row;
  std::size_t column = 0;
  for (const QString& cell : QORXSdfStringToList(value, parameter.members().separator())) {
    if (columns.empty())
      break;
    const GUIType& type = columns[column];
    if (!isUnsetSetting(cell))
      row.insert(type.getName(), simpleValue(type, plainWord(type), ChoiceList(type), cell));
    column = (column + 1) % columns.size();
    if (column == 0) {
      rows.append(row);
      row = QJsonObject();
    }
  }
  return rows;
}

}  // namespace

bool ParameterSchema::hasValue(const TransformParamCfg& parameter) const {
  return m_transformer.canEditParm(parameter.getName());
}

bool ParameterSchema::isRequired(const TransformParamCfg& parameter) const {
  // The workspace names its transformers itself.
  return !parameter.getFlag(kGUITypeOptional) && !parameter.getFlag(kGUITypeOmittable) &&
         parameter.getDefaultValue().isEmpty() && parameter.getName() != kIdentifierParameter;
}

QJsonObject ParameterSchema::property(const TransformParamCfg& parameter) const {
  const QString word = plainWord(parameter);
  const QString& value = parameter.getDefaultValue();
  QJsonObject schema;
  QJsonValue defaultValue;
  if (parameter.isMultiParameter()) {
    schema = membersSchema(parameter, value);
    defaultValue = membersValue(parameter, value);
  } else if (parameter.isTable()) {
    schema = {{kType, kListType}, {kItems, membersSchema(parameter, QString())}};
    if (isRequired(parameter))
      forbidEmpty(schema);
    defaultValue = rowsValue(parameter, value);
  } else {
    schema = simpleSchema(parameter, word, parameter.choices());
    if (isRequired(parameter))
      forbidEmpty(schema);
    schema = withComputed(schema, m_transformer.getSupportedValueTypes(parameter.getName()).size() > 1);
    defaultValue = simpleValue(parameter, word, parameter.choices(), value);
  }
  describe(schema, parameter);
  if (!isUnsetSetting(value))
    schema.insert(kDefault, defaultValue);
  return schema;
}

QJsonObject ParameterSchema::schema() const {
  QJsonObject properties;
  QJsonArray required;
  for (const QString& name : m_transformer.getParameters()) {
    const TransformParamCfg* parameter = m_transformer.getParameterByMacroName(name);
    if (!parameter || !hasValue(*parameter))
      continue;
    properties.insert(name, property(*parameter));
    if (isRequired(*parameter))
      required.append(name);
  }
  const QJsonObject computed{
      {kType, kJsonText},
      {QStringLiteral("description"),
       QStringLiteral("A reference to a parameter or attribute, an expression or a conditional value")},
      {QStringLiteral("pattern"),
       QStringLiteral("\\$\\(|\\$\\[|(@|<commercialat>)[A-Za-z]|^ORX_CONDITIONAL:")}};
  return {
      {QStringLiteral("$schema"), QStringLiteral("https://json-schema.org/draft/2020-12/schema")},
      {QStringLiteral("$defs"), QJsonObject{{kComputed, computed}}},
      {kTitle, QStringLiteral("%1, version %2").arg(m_transformer.getName()).arg(m_transformer.getVersion())},
      {QStringLiteral("description"), m_transformer.getDescriptionLines().join(QLatin1Char('\n'))},
      {kType, kObjectType},
      {kProperties, properties},
      {QStringLiteral("required"), required},
      {kClosed, false}};
}
