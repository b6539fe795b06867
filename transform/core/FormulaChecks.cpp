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

void add(QStringList& formulas, QString text, bool isEncoded, bool isCondition,
         const ExpandReferences& expand) {
  if (expand && beginsMacroReference(text)) {
    expand(text);
  }
  const QString decoded = isEncoded ? QORXWwjdDecode(text) : text;
  const bool isUnset = decoded.trimmed().isEmpty() || text == kUnusedValue || decoded == kUnusedValue;
  if ((isCondition || !isUnset) && !decoded.contains(kMacroOpen) && !decoded.contains(kDeferredOpen)) {
    formulas.append(decoded);
  }
}

}  // namespace

QStringList formulasIn(const GUIType& type, const QString& value, const ExpandReferences& expand) {
  const bool isExpression = type.getType().startsWith(kExpressionType);
  const bool isComputed = isExpression || ExpressionWriter::isComputed(type);
  QStringList formulas;
  if (!value.startsWith(kConditionalPrefix)) {
    if (isExpression || (isComputed && ExpressionWriter::needsWrapping(type, value))) {
      add(formulas, value, type.valueIsEncoded(), false, expand);
    }
    return formulas;
  }
  const QStringList parts = value.mid(kConditionalPrefix.size()).split(kPartSeparator);
  for (int i = 0; i < parts.size(); ++i) {
    const bool isResult = i % 2 == 1 || i + 1 == parts.size();
    if (isComputed || !isResult) {
      add(formulas, parts.at(i), true, !isResult, expand);
    }
  }
  return formulas;
}

bool checkFormulas(const TransformParamCfg& parameter, const QString& value, QString& message,
                   const ExpandReferences& expand) {
  bool isSound = true;
  forEachPart(parameter, value, [&](const GUIType& type, const QString& part) {
    const QStringList formulas = isSound ? formulasIn(type, part, expand) : QStringList();
    for (const QString& text : formulas) {
      const Formula formula(text);
      isSound = isSound && (formula.isValid() || formula.refuse(message));
    }
  });
  return isSound;
}
