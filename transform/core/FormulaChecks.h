// Formulas inside values: those of expressions, the conditions of conditional values, and what is computed
// for parameters that are numbers.
#pragma once

#include <platform/Export.h>
#include <transform/core/ParameterReferences.h>

#include <QString>
#include <QStringList>

class GUIType;
class TransformParamCfg;

// What of a value of the type is read as a formula, decoded, with the references that `expand` knows carried
// out. What still holds references to macros is left out: what it says is known when the mapping file runs.
ORX_EXPORT QStringList formulasIn(const GUIType& type, const QString& value,
                                  const ExpandReferences& expand = nullptr);

// Whether all formulas of the value can be understood, whichever member or cell they stand in. Otherwise
// `message` tells the user about the first that cannot.
ORX_EXPORT bool checkFormulas(const TransformParamCfg& parameter, const QString& value, QString& message,
                              const ExpandReferences& expand = nullptr);
