#include <transform/core/TransformParamCfg.h>

struct TransformParamCfg::LookupData {
  ChoiceList choices;
  MemberList members;
};

TransformParamCfg::TransformParamCfg(const GUIType& type, const QStringList& lookupLines)
    : GUIType(type), m_lookupLines(lookupLines) {
  rebuildLookupData();
}

bool TransformParamCfg::losesMark(const QString& value) const {
  return value.startsWith(kAttributeMark) && getType().startsWith(kAttributeType);
}

void TransformParamCfg::setValue(const QString& value) {
  m_value = losesMark(value) ? value.mid(1) : value;
}

QString TransformParamCfg::settable(const QString& value) const {
  return losesMark(value) ? kAttributeMark + value : value;
}

QString TransformParamCfg::getTypeWithConfig() const {
  const QString& config = getConfigToken();
  if (config.isEmpty() || config == QLatin1String("\"\"")) {
    return getType();
  }
  return getType() + QLatin1Char(' ') + config;
}

void TransformParamCfg::setTypeFromGUILine(const QString& line) {
  const GUIType promptLine = GUIType::fromGuiLine(line);
  const QString typeText = promptLine.isNull() ? line : promptLine.getTypeText();
  const QString before = getTypeWithConfig();
  GUIType::operator=(GUIType::fromTransformerTypeString(typeText, getName(), getDescription()));
  // The lookups of the definition belong to the entries of its own type.
  if (getTypeWithConfig() != before) {
    m_lookupLines.clear();
  }
  rebuildLookupData();
}

const ChoiceList& TransformParamCfg::choices() const {
  static const ChoiceList none;
  return m_lookupData ? m_lookupData->choices : none;
}

const MemberList& TransformParamCfg::members() const {
  static const MemberList none;
  return m_lookupData ? m_lookupData->members : none;
}

bool TransformParamCfg::isMultiParameter() const {
  return getType().startsWith(kMultiParameterType);
}

bool TransformParamCfg::isTable() const {
  return getType().startsWith(kTableType);
}

void TransformParamCfg::rebuildLookupData() {
  const bool isChoice = ORX_isChoiceType(*this);
  if (!isChoice && !isMultiParameter() && !isTable()) {
    m_lookupData.reset();
    return;
  }
  auto data = std::make_shared<LookupData>();
  if (isChoice) {
    data->choices = ChoiceList(*this);
    for (const QString& line : std::as_const(m_lookupLines)) {
      data->choices.addLookup(line);
    }
  } else {
    data->members = MemberList(*this);
  }
  m_lookupData = std::move(data);
}
