// The part of TransformerCfg that reads and changes parameters.
#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/parameters/DynamicGroups.h>
#include <transform/core/parameters/ParameterDisplay.h>

#include <algorithm>

namespace {

// An identifier longer than the first number is cut to the second.
constexpr int kLongestIdentifier = 1024;
constexpr int kCutIdentifier = 1023;

const QLatin1String kStoredDirection("STORED");

const QLatin1String kConstant("CONSTANT");
const QLatin1String kAttribute("ATTRIBUTE");
const QLatin1String kParameter("PARAMETER");
const QLatin1String kExpression("EXPRESSION");
const QLatin1String kConditional("CONDITIONAL");

bool isLabel(const GUIType& type) {
  static const QLatin1String labels[] = {QLatin1String("DISCLOSUREGROUP"), QLatin1String("DIVIDER"),
                                         QLatin1String("GROUP"), QLatin1String("MESSAGE"), kDynamicGroupType};
  return std::find(std::begin(labels), std::end(labels), type.getType()) != std::end(labels);
}

bool isComposite(const TransformParamCfg& record) {
  return record.isMultiParameter() || record.isTable();
}

}  // namespace

bool TransformerCfg::hasParameter(const QString& name) const {
  return m_parameters.indexOf(name) >= 0;
}

TransformParamCfg* TransformerCfg::getParameterByMacroName(const QString& name) {
  const int index = m_parameters.indexOfMacro(name);
  return index < 0 ? nullptr : &m_parameters.records()[static_cast<std::size_t>(index)];
}

const TransformParamCfg* TransformerCfg::getParameterByMacroName(const QString& name) const {
  const int index = m_parameters.indexOfMacro(name);
  return index < 0 ? nullptr : &m_parameters.records()[static_cast<std::size_t>(index)];
}

const GUIType& TransformerCfg::typeOfValue(const QString& name) const {
  const TransformParamCfg* record = getParameterByMacroName(name);
  if (!record || !isMemberOf(*record, name)) {
    return getParameterGUIType(name);
  }
  const GUIType* member = record->members().find(name);
  return member ? *member : GUIType::kNullGuiType;
}

// --- values
// ---------------------------------------------------------------------------------------------------

QString TransformerCfg::getParameterValue(const QString& parameter, UnpackLevel level) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record) {
    return QString();
  }
  const QString value = storedValue(*record, parameter);
  return m_listener ? m_listener->unpackValue(*this, value, typeOfValue(parameter).valueIsEncoded(), level)
                    : value;
}

bool TransformerCfg::setParameterValue(const QString& name, const QString& value, bool notify) {
  return setParameterValue(name, value, notify, true);
}

bool TransformerCfg::setParameterValue(const QString& name, const QString& value, bool notify,
                                       bool tellListener) {
  TransformParamCfg* record = getParameterByMacroName(name);
  if (!record) {
    return false;
  }
  QString stored =
      name == kIdentifierParameter && value.size() > kLongestIdentifier ? value.left(kCutIdentifier) : value;
  stored = withAttributeReference(typeOfValue(name), stored);
  if (notify && m_listener) {
    stored = m_listener->rewriteValue(*this, name, stored);
    // The listener may have changed the parameters themselves.
    record = getParameterByMacroName(name);
    if (!record) {
      return false;
    }
  }
  const QString oldValue = storedValue(*record, name);
  if (!applyParameterValue(name, stored)) {
    return false;
  }
  record = getParameterByMacroName(name);
  const QString newValue = record ? storedValue(*record, name) : stored;
  onParameterChanged(name);
  if (m_listener && tellListener) {
    m_listener->parameterChanged(*this, name, oldValue, newValue);
  }
  return true;
}

bool TransformerCfg::applyParameterValue(const QString& parameter, const QString& value) {
  TransformParamCfg* record = getParameterByMacroName(parameter);
  if (!record) {
    return false;
  }
  // What is shown of the process count follows it, whatever a document says.
  if (parameter == kProcessCountDisplayParameter && hasParameter(kProcessCountParameter)) {
    return true;
  }
  storeValue(*record, parameter, value);
  if (parameter == kProcessCountParameter) {
    if (TransformParamCfg* shown = getParameterByMacroName(kProcessCountDisplayParameter)) {
      shown->setValue(record->choices().toShown(record->getValue()));
    }
  }
  return true;
}

QString TransformerCfg::getParameterDisplayValue(const QString& parameter, UnpackLevel level) const {
  const bool isDecoded = m_listener && level == UnpackLevel::Decoded;
  return displayString(parameter, getParameterValue(parameter, level), false, isDecoded);
}

QString TransformerCfg::formatParamDisplayString(const QString& name, const QString& value,
                                                 bool withPrompt) const {
  return displayString(name, value, withPrompt, false);
}

QString TransformerCfg::displayString(const QString& name, const QString& value, bool withPrompt,
                                      bool isDecoded) const {
  const TransformParamCfg* record = getParameterByMacroName(name);
  if (!record) {
    return value;
  }
  const GUIType& type = typeOfValue(name);
  const QString text = isMemberOf(*record, name) ? displayText(type, ChoiceList(type), value, isDecoded)
                                                 : displayText(*record, value, isDecoded);
  const QString& prompt = type.getDescription();
  return withPrompt && !prompt.isEmpty() ? prompt + QLatin1String(": ") + text : text;
}

QStringList TransformerCfg::getParameterTableValuesAsParts(const QString& name, UnpackLevel level) const {
  const TransformParamCfg* record = getParameterByMacroName(name);
  if (!record || !record->isTable()) {
    return QStringList();
  }
  const MemberList& columns = record->members();
  const QString value = getParameterValue(name, std::min(level, UnpackLevel::Resolved));
  QStringList cells = QORXSdfStringToList(value, columns.separator());
  if (level == UnpackLevel::Decoded && !columns.members().empty()) {
    const int count = static_cast<int>(columns.members().size());
    for (int i = 0; i < cells.size(); ++i) {
      if (columns.members()[static_cast<std::size_t>(i % count)].valueIsEncoded()) {
        cells[i] = QORXWwjdDecode(cells[i]);
      }
    }
  }
  return cells;
}

// --- types
// ----------------------------------------------------------------------------------------------------

const GUIType& TransformerCfg::getParameterGUIType(const QString& parameter) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  return record ? *record : GUIType::kNullGuiType;
}

QString TransformerCfg::getParameterType(const QString& name) const {
  return getParameterGUIType(name).getType();
}

const QString& TransformerCfg::getParameterPrompt(const QString& name) const {
  static const QString none;
  const TransformParamCfg* record = getParameterByMacroName(name);
  return record ? record->getDescription() : none;
}

void TransformerCfg::setParameterPrompt(const QString& name, const QString& prompt) {
  if (TransformParamCfg* record = getParameterByMacroName(name)) {
    record->setDescription(prompt);
  }
}

QString TransformerCfg::getGuiLine(const QString& parameter) const {
  return typeOfValue(parameter).getAsString();
}

bool TransformerCfg::getParameterLookupTable(const QString& name, const QString& direction,
                                             QHash<QString, QString>& table) const {
  table.clear();
  const int index = m_parameters.indexOf(name);
  if (index < 0) {
    return false;
  }
  const ChoiceList& choices = m_parameters.records()[static_cast<std::size_t>(index)].choices();
  if (!choices.hasLookup()) {
    return false;
  }
  const bool byStored = direction == kStoredDirection;
  for (const auto& [shown, stored] : choices.entries()) {
    const QString& key = byStored ? stored : shown;
    if (!table.contains(key)) {
      table.insert(key, byStored ? shown : stored);
    }
  }
  return true;
}

bool TransformerCfg::canEditParm(const QString& name) const {
  const GUIType& type = typeOfValue(name);
  return !type.isNull() && !type.getDescription().isEmpty() && !isLabel(type);
}

bool TransformerCfg::getShowParameter(const QString& parameter) const {
  return !typeOfValue(parameter).getDescription().isEmpty();
}

bool TransformerCfg::isValueEncoded(const QString& name) const {
  return typeOfValue(name).valueIsEncoded();
}

bool TransformerCfg::parameterSupportsAttributeReference(const QString& parameter) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  if (record && isComposite(*record) && !isMemberOf(*record, parameter)) {
    const std::vector<GUIType>& members = record->members().members();
    return std::any_of(members.begin(), members.end(), takesAttributeReference);
  }
  return takesAttributeReference(typeOfValue(parameter));
}

bool TransformerCfg::canCreateGlobalParameter(const QString& parameter) const {
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  return record && parameter != kIdentifierParameter && canEditParm(parameter) &&
         (isMemberOf(*record, parameter) || !isComposite(*record));
}

QStringList TransformerCfg::getSupportedValueTypes(const QString& parameter) const {
  QStringList types;
  if (!canEditParm(parameter)) {
    return types;
  }
  const bool takesReference = parameterSupportsAttributeReference(parameter);
  const bool namesAttribute = typeOfValue(parameter).getType().startsWith(kAttributeType);
  if (!namesAttribute) {
    types.append(kConstant);
  }
  if (namesAttribute || takesReference) {
    types.append(kAttribute);
  }
  if (canCreateGlobalParameter(parameter)) {
    types.append(kParameter);
  }
  if (takesReference) {
    types.append(kExpression);
    types.append(kConditional);
  }
  return types;
}

// --- adding and removing
// --------------------------------------------------------------------------------------

void TransformerCfg::addParameter(const TransformParamCfg& parameter) {
  const int index = m_parameters.indexOf(parameter.getName());
  if (index < 0) {
    m_parameters.append(parameter);
    return;
  }
  TransformParamCfg& record = m_parameters.records()[static_cast<std::size_t>(index)];
  const QString value = record.getValue();
  record = parameter;
  record.setValue(record.settable(value));
}

bool TransformerCfg::removeParameter(const QString& name) {
  return m_parameters.remove(name);
}

void TransformerCfg::setDynparamsParameters(const QStringList& names) {
  m_dynamicParameterNames = names;
  for (const QString& name : names) {
    updateDynamicParameterGroups(*this, m_parameters, name);
  }
}

void TransformerCfg::onParameterChanged(const QString& parameter) {
  if (m_dynamicParameterNames.contains(parameter)) {
    updateDynamicParameterGroups(*this, m_parameters, parameter);
  }
}
