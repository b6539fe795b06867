// The keywords of configurations, definitions and values that more than one place of the library knows.
#pragma once

#include <QLatin1String>
#include <QString>

// The value of a parameter that has none.
inline const QString kUnusedValue = QStringLiteral("<Unused>");
// The value of a group-by parameter that names no attributes. Told apart from the one above by its letters;
// each is matched exactly.
constexpr QLatin1String kUnusedGroupBy("<UNUSED>");

// Parameters that the system adds to transformers.
constexpr QLatin1String kIdentifierParameter("XFORMER_NAME");
constexpr QLatin1String kProcessCountParameter("ORX_PROCESS_COUNT");
constexpr QLatin1String kProcessCountDisplayParameter("ORX_PROCESS_COUNTDISP");
constexpr QLatin1String kGroupsOrderedParameter("ORX_PROCESS_GROUPS_ORDERED");
constexpr QLatin1String kNoParallelism("NO_PARALLELISM");
// The member of a multi-parameter that is written as it is.
constexpr QLatin1String kControllerQueryFile("ORX_CONTROLLER_QUERY_FILE");

// Dynamic parameter groups.
constexpr QLatin1String kDynamicGroupPrefix("DYNGROUP_");
constexpr QLatin1String kDynamicGroupType("NAMEDGROUP NO_EDIT");

// Types of parameters, told by the beginning, the end or the whole of the type word.
constexpr QLatin1String kMultiParameterType("MULTIPARAMETER");
constexpr QLatin1String kTableType("GUI_LINE_TABLE");
constexpr QLatin1String kAttributeType("ATTR");
constexpr QLatin1String kNewAttributeType("NEW_ATTR");
constexpr QLatin1String kTextType("TEXT");
constexpr QLatin1String kTextEncodedType("TEXT_ENCODED");
constexpr QLatin1String kTextEditType("TEXT_EDIT");
constexpr QLatin1String kOrAttributeSuffix("_OR_ATTR");
constexpr QLatin1String kOrAttributeEncodedSuffix("_OR_ATTR_ENCODED");
constexpr QLatin1String kEncodedSuffix("_ENCODED");
constexpr QLatin1String kAllowNew("ALLOW_NEW");

// What values are made of.
constexpr QLatin1String kConditionalPrefix("ORX_CONDITIONAL:");
constexpr QLatin1String kValueReference("@Value(");
// The same in the word encoding, as it is stored, and with its "@" left as it is, as it is read as well.
constexpr QLatin1String kValueReferenceWord("<commercialat>Value<leftparenthesis>");
constexpr QLatin1String kValueReferenceEncoded("@Value<leftparenthesis>");
constexpr QLatin1String kEncodedLeftParenthesis("<leftparenthesis>");
constexpr QLatin1String kEncodedRightParenthesis("<rightparenthesis>");
constexpr QLatin1String kMacroOpen("$(");
constexpr QLatin1String kDeferredOpen("$[");
constexpr QLatin1String kListMark("{}");
constexpr QLatin1String kListMemberMark("{}.");

// Tokens of definitions.
constexpr QLatin1String kAllToken("<ALL>");
constexpr QLatin1String kNoneToken("<NONE>");
