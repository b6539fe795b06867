// The keywords that templates and generated statements are made of.
#pragma once

#include <QLatin1String>

// Tokens of ports: the tag stands between the two parts.
constexpr QLatin1String kInputLinesToken("INPUT_LINES");
constexpr QLatin1String kInputTokenStart("INPUT_");
constexpr QLatin1String kInputTokenEnd("_LINES");
constexpr QLatin1String kOutputTokenStart("OUTPUT_");
constexpr QLatin1String kFeatureTypeTokenEnd("_FTYPE");
constexpr QLatin1String kFunctionsTokenEnd("_FUNCS");

// Tokens of the instance.
constexpr QLatin1String kUuidToken("ORX_UUID");
constexpr QLatin1String kEncodedNameToken("XFORMER_NAME_ENCODED");
constexpr QLatin1String kSchemaToken("XFORMER_SCHEMA");
constexpr QLatin1String kValueListToken("ORX_PARM_VAL_LIST");

constexpr QLatin1String kBracketValueMark(" {*} ");
