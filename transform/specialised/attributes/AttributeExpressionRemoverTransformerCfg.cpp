#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/StoredValue.h>
#include <transform/findings/Refusal.h>
#include <transform/specialised/attributes/AttributeExpressionRemoverTransformerCfg.h>
#include <transform/specialised/shared/SpecialisedValues.h>
#include <transform/text/MessageNumbers.h>

namespace messages = orx::messages;

namespace {

const QLatin1String kExpression("EXPRESSION");
const QLatin1String kMode("MODE");
const QLatin1String kIgnoreCase("IGNORE_CASE");
const QLatin1String kKeep("KEEP");
const QLatin1String kYes("YES");
// The name of its type belongs to every feature.
const QLatin1String kFeatureTypeAttribute("orx_feature_type");

}  // namespace

bool AttributeExpressionRemoverTransformerCfg::parmValueAffectsOutputAttrs(const QString& parameter) const {
  return parameter == kExpression || parameter == kMode || parameter == kIgnoreCase ||
         TransformerCfg::parmValueAffectsOutputAttrs(parameter);
}

bool AttributeExpressionRemoverTransformerCfg::findExpression(QRegularExpression& expression) const {
  const QString value = getParameterValue(kExpression, UnpackLevel::Resolved);
  if (isUnsetValue(value) || isOpenValue(value)) {
    return false;
  }
  const bool ignoresCase = getParameterValue(kIgnoreCase, UnpackLevel::Resolved) == kYes;
  const QString pattern = QORXWwjdDecode(value);
  const auto options =
      ignoresCase ? QRegularExpression::CaseInsensitiveOption : QRegularExpression::NoPatternOption;
  if (expression.pattern() != pattern || expression.patternOptions() != options) {
    expression = QRegularExpression(pattern, options);
  }
  return true;
}

bool AttributeExpressionRemoverTransformerCfg::validateParameter(const QString& parameter,
                                                                 QString& message) const {
  if (!TransformerCfg::validateParameter(parameter, message)) {
    return false;
  }
  const QString value =
      parameter == kExpression ? getParameterValue(kExpression, UnpackLevel::Resolved) : QString();
  for (const QString& possible : possibleValues(value)) {
    const QString pattern = QORXWwjdDecode(possible);
    if (!isUnsetValue(possible) && !isOpenValue(possible) && !QRegularExpression(pattern).isValid()) {
      return orx::refuse(message, messages::kBadPattern, {pattern});
    }
  }
  return true;
}

bool AttributeExpressionRemoverTransformerCfg::isRemoved(const QString& attribute) const {
  if (attribute == kFeatureTypeAttribute || !findExpression(m_expression) || !m_expression.isValid()) {
    return false;
  }
  const TransformParamCfg* mode = getParameterByMacroName(kMode);
  const bool keeps =
      mode && mode->choices().toStored(getParameterValue(kMode, UnpackLevel::Resolved)) == kKeep;
  return m_expression.match(attribute).hasMatch() != keeps;
}

void AttributeExpressionRemoverTransformerCfg::transformAttr(const QString& attribute, QStringList& result,
                                                             const QString& inputTag,
                                                             const QString& outputTag) const {
  if (!isRemoved(attribute)) {
    TransformerCfg::transformAttr(attribute, result, inputTag, outputTag);
  }
}
