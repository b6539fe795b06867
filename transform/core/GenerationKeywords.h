// The keywords that templates and generated statements are made of.
#pragma once

#include <QLatin1String>

// Tokens of ports: the tag stands between the two parts.
inline const QLatin1String kInputLinesToken("INPUT_LINES");
inline const QLatin1String kInputTokenStart("INPUT_");
inline const QLatin1String kInputTokenEnd("_LINES");
inline const QLatin1String kOutputTokenStart("OUTPUT_");
inline const QLatin1String kFeatureTypeTokenEnd("_FTYPE");
inline const QLatin1String kFunctionsTokenEnd("_FUNCS");

// Tokens of the instance.
inline const QLatin1String kUuidToken("ORX_UUID");
inline const QLatin1String kEncodedNameToken("XFORMER_NAME_ENCODED");
inline const QLatin1String kSchemaToken("XFORMER_SCHEMA");
inline const QLatin1String kValueListToken("ORX_PARM_VAL_LIST");

// The call that works a value out for each feature.
inline const QLatin1String kEvaluateCall("@EvaluateExpression(");
// The call of a procedure that looks a choice up.
inline const QLatin1String kProcedureCall("@Tcl2(");

inline const QLatin1String kBracketValueMark(" {*} ");
