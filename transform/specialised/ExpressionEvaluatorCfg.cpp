#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/specialised/ExpressionEvaluatorCfg.h>
#include <transform/specialised/values/Formula.h>
#include <transform/specialised/values/SpecialisedValues.h>
#include <transform/text/TextHelpers.h>

namespace {

const QLatin1String kExpression("EXPRESSION");
const QLatin1String kResultType("FLOAT");
const QLatin1Char kPartSeparator(';');

// The formulas that a value is made of, encoded.
QStringList formulasOf(const QString& value) {
  return value.startsWith(kConditionalPrefix)
             ? value.mid(kConditionalPrefix.size()).split(kPartSeparator, Qt::SkipEmptyParts)
             : QStringList(value);
}

}  // namespace

TransformerCfg* ExpressionEvaluatorCfg::getCopy() const {
  return copyAs(*this);
}

bool ExpressionEvaluatorCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  const QString value = getParameterValue(parameter, UnpackLevel::Resolved);
  if (parameter != kExpression || isUnsetValue(value)) {
    return true;
  }
  for (const QString& part : formulasOf(value)) {
    const Formula formula(QORXWwjdDecode(part));
    if (!refersToMacros(part) && !formula.isValid()) {
      message = formula.faultMessage();
      return false;
    }
  }
  return true;
}

QString ExpressionEvaluatorCfg::getParameterValueForMappingFile(const QString& name,
                                                                const TransformParamCfg* parameter,
                                                                MFBuffer& buffer) const {
  const QString value = stripBasicStringInfo(getParameterValue(name));
  return name == kExpression && !isUnsetValue(value)
             ? wrapInEvaluateExpression(value, name, kResultType, true)
             : TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
}

void ExpressionEvaluatorCfg::autoUpgradeTransformer() {
  const QString value = getParameterValue(kExpression);
  if (isUnsetValue(value) || refersToMacros(value) || value.startsWith(kConditionalPrefix)) {
    return;
  }
  const QString text = QORXWwjdDecode(value);
  const QString upgraded = Formula::withOwnOperators(text);
  // Only what nobody could read is changed, and only for the better.
  if (!Formula(text).isValid() && Formula(upgraded).isValid()) {
    applyParameterValue(kExpression, QORXWwjdEncode(upgraded));
    setAutoUpgraded(true);
  }
}
