#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/Formula.h>
#include <transform/core/FormulaChecks.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/text/MacroText.h>

namespace {

const QLatin1Char kPartSeparator(';');

enum class Role { Expression, Condition, Number, NumberOfCondition };

struct FormulaText {
  QString text;
  Role role;
};

void add(std::vector<FormulaText>& formulas, QString text, bool isEncoded, Role role,
         const ExpandReferences& expand) {
  if (expand && beginsMacroReference(text)) {
    expand(text);
  }
  const QString decoded = isEncoded ? QORXWwjdDecode(text) : text;
  // In a condition a part without a value is an empty one.
  const bool isPart = role == Role::Condition || role == Role::NumberOfCondition;
  const bool isUnset = decoded.trimmed().isEmpty() || (!isPart && decoded == kUnusedValue);
  if ((role == Role::Condition || !isUnset) && !decoded.contains(kMacroOpen) &&
      !decoded.contains(kDeferredOpen)) {
    formulas.push_back({decoded, role});
  }
}

std::vector<FormulaText> textsIn(const GUIType& type, const QString& value, const ExpandReferences& expand) {
  const bool isExpression = type.getType().startsWith(kExpressionType);
  const bool isComputed = isExpression || ExpressionWriter::isComputed(type);
  std::vector<FormulaText> formulas;
  if (!value.startsWith(kConditionalPrefix)) {
    if (isExpression || (isComputed && ExpressionWriter::needsWrapping(type, value))) {
      add(formulas, value, type.valueIsEncoded(), isExpression ? Role::Expression : Role::Number, expand);
    }
    return formulas;
  }
  const QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    const bool isResult = i % 2 == 1 || i + 1 == parts.size();
    if (isComputed || !isResult) {
      const Role result = isExpression ? Role::Expression : Role::NumberOfCondition;
      add(formulas, parts.at(i), true, isResult ? result : Role::Condition, expand);
    }
  }
  return formulas;
}

}  // namespace

QStringList formulasIn(const GUIType& type, const QString& value, const ExpandReferences& expand) {
  QStringList formulas;
  for (const FormulaText& formula : textsIn(type, value, expand)) {
    formulas.append(formula.text);
  }
  return formulas;
}

bool checkFormulas(const TransformParamCfg& parameter, const QString& value, QString& message,
                   const ExpandReferences& expand) {
  bool isSound = true;
  forEachPart(parameter, value, [&](const GUIType& type, const QString& part) {
    if (!isSound) {
      return;
    }
    for (const auto& [text, role] : textsIn(type, part, expand)) {
      const Formula formula(text);
      const bool isNumber = role == Role::Number || role == Role::NumberOfCondition;
      isSound = isSound && (formula.isValid() || formula.refuse(message)) &&
                (!isNumber || formula.mayGiveNumber(message));
    }
  });
  return isSound;
}
