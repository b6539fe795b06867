#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Formula.h>
#include <transform/core/FormulaChecks.h>
#include <transform/core/Keywords.h>
#include <transform/specialised/conditions/ExpressionEvaluatorCfg.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/TextHelpers.h>

namespace {

const QLatin1String kExpression("EXPRESSION");
const QLatin1String kResultType("FLOAT");

}  // namespace

bool ExpressionEvaluatorCfg::validateParameter(const QString& parameter, QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  const TransformParamCfg* record = getParameterByMacroName(parameter);
  return parameter != kExpression || !record ||
         checkFormulas(*record, getParameterValue(parameter, UnpackLevel::Resolved), message);
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
