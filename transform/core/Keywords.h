// The keywords of configurations, definitions and values that more than one place of the library knows.
#pragma once

#include <QLatin1String>
#include <QString>

// The value of a parameter that has none.
inline const QString kUnusedValue = QStringLiteral("<Unused>");
// The value of a group-by parameter that names no attributes. Told apart from the one above by its letters;
// each is matched exactly.
inline const QLatin1String kUnusedGroupBy("<UNUSED>");

// Whether a parameter with the value has none.
inline bool isUnsetValue(const QString& value) {
  return value.isEmpty() || value == kUnusedValue;
}
// The same where the value may be that of a group-by parameter.
inline bool isUnsetSetting(const QString& value) {
  return isUnsetValue(value) || value == kUnusedGroupBy;
}

// Parameters that the system adds to transformers.
inline const QLatin1String kIdentifierParameter("XFORMER_NAME");
inline const QLatin1String kProcessCountParameter("ORX_PROCESS_COUNT");
inline const QLatin1String kProcessCountDisplayParameter("ORX_PROCESS_COUNTDISP");
inline const QLatin1String kGroupsOrderedParameter("ORX_PROCESS_GROUPS_ORDERED");
inline const QLatin1String kNoParallelism("NO_PARALLELISM");
// The member of a multi-parameter that is written as it is.
inline const QLatin1String kControllerQueryFile("ORX_CONTROLLER_QUERY_FILE");

// Dynamic parameter groups.
inline const QLatin1String kDynamicGroupPrefix("DYNGROUP_");
inline const QLatin1String kDynamicGroupType("NAMEDGROUP NO_EDIT");

// Types of parameters, told by the beginning, the end or the whole of the type word.
inline const QLatin1String kMultiParameterType("MULTIPARAMETER");
inline const QLatin1String kTableType("GUI_LINE_TABLE");
inline const QLatin1String kAttributeType("ATTR");
// Before the name of an attribute where a value may also be a text.
inline const QLatin1Char kAttributeMark('&');
inline const QLatin1String kNewAttributeType("NEW_ATTR");
inline const QLatin1String kExpressionType("EXPRESSION");
inline const QLatin1String kTextType("TEXT");
inline const QLatin1String kTextEncodedType("TEXT_ENCODED");
inline const QLatin1String kTextEditType("TEXT_EDIT");
inline const QLatin1String kOrAttributeSuffix("_OR_ATTR");
inline const QLatin1String kOrAttributeEncodedSuffix("_OR_ATTR_ENCODED");
inline const QLatin1String kEncodedSuffix("_ENCODED");
inline const QLatin1String kAllowNew("ALLOW_NEW");

// What values are made of.
inline const QLatin1String kConditionalPrefix("ORX_CONDITIONAL:");
inline const QLatin1String kValueReference("@Value(");
// The same in the word encoding, as it is stored, and with its "@" left as it is, as it is read as well.
inline const QLatin1String kValueReferenceWord("<commercialat>Value<leftparenthesis>");
inline const QLatin1String kValueReferenceEncoded("@Value<leftparenthesis>");
inline const QLatin1String kEncodedLeftParenthesis("<leftparenthesis>");
inline const QLatin1String kEncodedRightParenthesis("<rightparenthesis>");
inline const QLatin1String kMacroOpen("$(");
inline const QLatin1String kDeferredOpen("$[");
inline const QLatin1String kListMark("{}");
inline const QLatin1String kListMemberMark("{}.");

// Tokens of definitions.
inline const QLatin1String kAllToken("<ALL>");
inline const QLatin1String kNoneToken("<NONE>");
