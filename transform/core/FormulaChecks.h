// Formulas inside values: those of expressions, the conditions of conditional values, and what is computed
// for parameters that are numbers.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

class GUIType;
class TransformParamCfg;

// What of a value of the type is read as a formula, decoded. What holds references to macros is left out:
// what it says is known when the mapping file runs.
ORX_EXPORT QStringList formulasIn(const GUIType& type, const QString& value);

// The message for the user about the first formula of the value that cannot be understood, whichever member
// or cell it stands in; empty when all can.
ORX_EXPORT QString findFormulaFault(const TransformParamCfg& parameter, const QString& value);
