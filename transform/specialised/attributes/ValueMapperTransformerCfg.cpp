#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/GenerationKeywords.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/attributes/ValueMapperTransformerCfg.h>
#include <transform/specialised/shared/FactoryOption.h>
#include <transform/specialised/shared/ParameterTable.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QSet>

namespace messages = orx::messages;

namespace {

const QLatin1String kMapping("MAPPING");
const QLatin1String kDirection("DIRECTION");
const QLatin1String kBackward("BACKWARD");
const QLatin1String kMapKey("MAP");

enum Column { kLeft, kRight, kColumns };

// As a word of a statement. Cells are encoded, or calls of functions, unless they were not stored as they
// should be.
QString word(const QString& cell) {
  return cell.startsWith(kEvaluateCall) ? cell : quotifyStringForMF(cell);
}

}  // namespace

bool ValueMapperTransformerCfg::looksUpRight() const {
  const TransformParamCfg* direction = getParameterByMacroName(kDirection);
  return direction &&
         direction->choices().toStored(getParameterValue(kDirection, UnpackLevel::Resolved)) == kBackward;
}

bool ValueMapperTransformerCfg::parameterSupportsAttributeReference(const QString& parameter) const {
  return (parameter != kMapping || !looksUpRight()) &&
         TransformerCfg::parameterSupportsAttributeReference(parameter);
}

bool ValueMapperTransformerCfg::canCreateGlobalParameter(const QString& parameter) const {
  return parameter != kDirection && TransformerCfg::canCreateGlobalParameter(parameter);
}

QStringList ValueMapperTransformerCfg::getSupportedValueTypes(const QString& parameter) const {
  QStringList types = TransformerCfg::getSupportedValueTypes(parameter);
  if (parameter == kMapping) {
    types.removeAll(QStringLiteral("EXPRESSION"));
    types.removeAll(QStringLiteral("CONDITIONAL"));
  }
  return types;
}

bool ValueMapperTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  if (parameter != kMapping) {
    return true;
  }
  const ParameterTable mapping(*this, kMapping, kColumns, UnpackLevel::Resolved);
  const int lookedUp = looksUpRight() ? kRight : kLeft;
  QSet<QString> known;
  for (int row = 0; row < mapping.rowCount(); ++row) {
    const QString cell = mapping.cell(row, lookedUp);
    const QString value = QORXWwjdDecode(cell);
    if (beginsValueReference(cell) || cell.startsWith(kConditionalPrefix)) {
      return orx::refuse(message, messages::kDiffersByFeature, {mapping.prompt(lookedUp)});
    }
    if (known.contains(value)) {
      return orx::refuse(message, messages::kMappedTwice, {value});
    }
    known.insert(value);
  }
  return true;
}

void ValueMapperTransformerCfg::autoUpgradeTransformer() {
  ParameterTable mapping(*this, kMapping, kColumns);
  mapping.replaceAttributeMarks();
  mapping.upgrade(*this, kMapping);
}

bool ValueMapperTransformerCfg::doInstantiate(MFBuffer& buffer, bool inlineFlag) {
  const TransformParamCfg* record = getParameterByMacroName(kMapping);
  const ParameterTable mapping(record, getParameterValueForMappingFile(kMapping, record, buffer), kColumns);
  if (!TransformerCfg::doInstantiate(buffer, inlineFlag)) {
    return false;
  }
  const int from = looksUpRight() ? kRight : kLeft;
  for (int row = 0; row < mapping.rowCount(); ++row) {
    const QString pair = word(mapping.cell(row, from)) + QLatin1Char(' ') +
                         word(mapping.cell(row, from == kLeft ? kRight : kLeft));
    if (!writeFactoryOption(*this, kMapKey, pair, buffer)) {
      return false;
    }
  }
  return true;
}
