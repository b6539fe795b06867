// The part of TransformerCfg that flattens an instance into one text and restores it: values only, never the
// definition.
#include <platform/qorxcore/Lists.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/TransformerCfg.h>

#include <utility>

namespace {

const QLatin1Char kSeparator(',');

const QLatin1String kNameKey("NAME");
const QLatin1String kVersionKey("VERSION");
const QLatin1String kParameterValuesKey("PARAMETER_VALUES");
const QLatin1String kInputFeatureTypesKey("INPUT_FEATURE_TYPES");
const QLatin1String kInputFiltersKey("INPUT_FILTERS");
const QLatin1String kInputAttributesKey("INPUT_ATTRS");
const QLatin1String kOutputFeatureTypesKey("OUTPUT_FEATURE_TYPES");
const QLatin1String kOutputFunctionsKey("OUTPUT_FUNCTIONS");

QString pack(const QStringList& list) {
  return QORXListToSdfString(list, kSeparator);
}

QStringList unpack(const QString& text) {
  return QORXSdfStringToList(text, kSeparator);
}

QString valueText(const QString& value) {
  return value;
}

QString valueText(const QStringList& value) {
  return pack(value);
}

// The table's entries by tag: those of the ports first, in their order, then any others by name.
template <typename Value>
QString packTable(const QHash<QString, Value>& table, const QStringList& tagOrder) {
  QStringList keys;
  for (const QString& tag : tagOrder) {
    if (table.contains(tag)) {
      keys.append(tag);
    }
  }
  if (keys.size() < table.size()) {
    const QSet<QString> known(keys.begin(), keys.end());
    QStringList others;
    for (auto key = table.keyBegin(); key != table.keyEnd(); ++key) {
      if (!known.contains(*key)) {
        others.append(*key);
      }
    }
    others.sort();
    keys += others;
  }
  QStringList elements;
  for (const QString& key : std::as_const(keys)) {
    elements << key << valueText(table.value(key));
  }
  return pack(elements);
}

// Key and value by turns; a last key without a value is left out.
std::vector<std::pair<QString, QString>> unpackPairs(const QString& text) {
  const QStringList elements = unpack(text);
  std::vector<std::pair<QString, QString>> pairs;
  for (int i = 0; i + 1 < elements.size(); i += 2) {
    pairs.emplace_back(elements[i], elements[i + 1]);
  }
  return pairs;
}

// A key that is there twice keeps its first place and its last value.
std::vector<std::pair<QString, QString>> unpackTable(const QString& text) {
  std::vector<std::pair<QString, QString>> entries;
  QHash<QString, std::size_t> places;
  for (const auto& [key, value] : unpackPairs(text)) {
    const auto place = places.constFind(key);
    if (place == places.constEnd()) {
      places.insert(key, entries.size());
      entries.emplace_back(key, value);
    } else {
      entries[*place].second = value;
    }
  }
  return entries;
}

// A tag that is there twice gets both lists.
void appendLists(const QString& text, QHash<QString, QStringList>& table) {
  for (const auto& [tag, packed] : unpackPairs(text)) {
    table[tag] += unpack(packed);
  }
}

}  // namespace

QString TransformerCfg::serialize() const {
  QStringList values;
  for (const TransformParamCfg& record : m_parameters.records()) {
    values << record.getName() << record.settable(record.getValue());
  }
  const QStringList inputs = allInputTags();
  QStringList outputs;
  getOutputTags(outputs);
  const QStringList elements = {
      kNameKey,
      getName(),
      kVersionKey,
      QString::number(getVersion()),
      kParameterValuesKey,
      pack(values),
      kInputFeatureTypesKey,
      packTable(m_ports.inputFeatureTypes, inputs),
      kInputFiltersKey,
      packTable(m_ports.inputFilters, inputs),
      kInputAttributesKey,
      packTable(getInputAttributes(), inputs),
      kOutputFeatureTypesKey,
      packTable(m_ports.outputFeatureTypes, outputs),
      kOutputFunctionsKey,
      packTable(m_ports.outputFunctions, outputs),
  };
  return pack(elements);
}

void TransformerCfg::deserialize(QHash<QString, QString>& fields) {
  if (fields.contains(kParameterValuesKey)) {
    for (const auto& [name, value] : unpackTable(fields.value(kParameterValuesKey))) {
      setParameterValue(name, value, false, false);
    }
  }
  appendLists(fields.value(kInputFeatureTypesKey), m_ports.inputFeatureTypes);
  appendLists(fields.value(kInputFiltersKey), m_ports.inputFilters);
  if (fields.contains(kInputAttributesKey)) {
    QHash<QString, QStringList> attributes;
    appendLists(fields.value(kInputAttributesKey), attributes);
    setInputAttributes(attributes);
  }
  for (const auto& [tag, featureType] : unpackTable(fields.value(kOutputFeatureTypesKey))) {
    m_ports.outputFeatureTypes.insert(tag, featureType);
  }
  appendLists(fields.value(kOutputFunctionsKey), m_ports.outputFunctions);
}
