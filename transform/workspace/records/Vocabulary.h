// Every element and attribute name of a workspace document, each held once.
#pragma once

#include <QString>
#include <QStringView>

// A constant keyword as UTF-16, usable by the XML parser and by QString alike; null-terminated.
struct Word {
  template <std::size_t N>
  constexpr Word(const char16_t (&literal)[N]) : text(literal), size(static_cast<int>(N) - 1) {}

  const char16_t* text;
  int size;

  const QChar* chars() const { return reinterpret_cast<const QChar*>(text); }
  QStringView view() const { return QStringView(text, size); }
  // Without a copy: the text is static.
  QString toQString() const { return QString::fromRawData(chars(), size); }
};

namespace words {

inline constexpr Word kWorkspace = u"WORKSPACE";
inline constexpr Word kDatasource = u"DATASOURCE";
inline constexpr Word kEtlTool = u"ETL_TOOL";
inline constexpr Word kTransformer = u"TRANSFORMER";
inline constexpr Word kDatasets = u"DATASETS";
inline constexpr Word kDataTypes = u"DATA_TYPES";
inline constexpr Word kGeomTypes = u"GEOM_TYPES";
inline constexpr Word kFeatureTypes = u"FEATURE_TYPES";
inline constexpr Word kOrxserver = u"ORXSERVER";
inline constexpr Word kSubdocuments = u"SUBDOCUMENTS";
inline constexpr Word kSubdocument = u"SUBDOCUMENT";
inline constexpr Word kLookupTables = u"LOOKUP_TABLES";
inline constexpr Word kGlobalParameters = u"GLOBAL_PARAMETERS";
inline constexpr Word kComments = u"COMMENTS";
inline constexpr Word kConstants = u"CONSTANTS";
inline constexpr Word kBookmarks = u"BOOKMARKS";
inline constexpr Word kTransformers = u"TRANSFORMERS";
inline constexpr Word kSubdocumentIos = u"SUBDOCUMENT_IOS";
inline constexpr Word kFeatLinks = u"FEAT_LINKS";
inline constexpr Word kBreakpoints = u"BREAKPOINTS";
inline constexpr Word kAttrLinks = u"ATTR_LINKS";
inline constexpr Word kDataset = u"DATASET";
inline constexpr Word kMetafileParameter = u"METAFILE_PARAMETER";
inline constexpr Word kDataType = u"DATA_TYPE";
inline constexpr Word kGeomType = u"GEOM_TYPE";
inline constexpr Word kFeatureType = u"FEATURE_TYPE";
inline constexpr Word kFeatAttribute = u"FEAT_ATTRIBUTE";
inline constexpr Word kNonGuiDeflineParm = u"NON_GUI_DEFLINE_PARM";
inline constexpr Word kDeflineParm = u"DEFLINE_PARM";
inline constexpr Word kGlobalParameter = u"GLOBAL_PARAMETER";
inline constexpr Word kConstant = u"CONSTANT";
inline constexpr Word kParameterConstant = u"PARAMETER_CONSTANT";
inline constexpr Word kComment = u"COMMENT";
inline constexpr Word kBookmark = u"BOOKMARK";
inline constexpr Word kBookmarkFeat = u"BOOKMARK_FEAT";
inline constexpr Word kOutputFeat = u"OUTPUT_FEAT";
inline constexpr Word kFeatCollapsed = u"FEAT_COLLAPSED";
inline constexpr Word kXformAttr = u"XFORM_ATTR";
inline constexpr Word kXformParm = u"XFORM_PARM";
inline constexpr Word kSubdocumentIo = u"SUBDOCUMENT_IO";
inline constexpr Word kFeatLink = u"FEAT_LINK";
inline constexpr Word kAttrLink = u"ATTR_LINK";
inline constexpr Word kBreakpoint = u"BREAKPOINT";
inline constexpr Word kServices = u"SERVICES";
inline constexpr Word kService = u"SERVICE";
inline constexpr Word kProperties = u"PROPERTIES";
inline constexpr Word kProperty = u"PROPERTY";
inline constexpr Word kRepository = u"REPOSITORY";
inline constexpr Word kItem = u"ITEM";
inline constexpr Word kDocument = u"DOCUMENT";
inline constexpr Word kModifications = u"MODIFICATIONS";
inline constexpr Word kModification = u"MODIFICATION";
inline constexpr Word kIsSource = u"IS_SOURCE";
inline constexpr Word kRole = u"ROLE";
inline constexpr Word kFormat = u"FORMAT";
inline constexpr Word kKeyword = u"KEYWORD";
inline constexpr Word kMultiGeomAllowed = u"MULTI_GEOM_ALLOWED";
inline constexpr Word kAttrMaxLength = u"ATTR_MAX_LENGTH";
inline constexpr Word kAttrCase = u"ATTR_CASE";
inline constexpr Word kAllowedFeatTypes = u"ALLOWED_FEAT_TYPES";
inline constexpr Word kWriteDefs = u"WRITE_DEFS";
inline constexpr Word kDeflineTemplate = u"DEFLINE_TEMPLATE";
inline constexpr Word kDeflineAttrs = u"DEFLINE_ATTRS";
inline constexpr Word kExposableAttrs = u"EXPOSABLE_ATTRS";
inline constexpr Word kDeflineParms = u"DEFLINE_PARMS";
inline constexpr Word kAttrIndexTypes = u"ATTR_INDEX_TYPES";
inline constexpr Word kAttrNameInvalidChars = u"ATTR_NAME_INVALID_CHARS";
inline constexpr Word kSupportsFeatureTypeFanout = u"SUPPORTS_FEATURE_TYPE_FANOUT";
inline constexpr Word kEnabled = u"ENABLED";
inline constexpr Word kDynamicFeatureTypesListOnMerge = u"DYNAMIC_FEATURE_TYPES_LIST_ON_MERGE";
inline constexpr Word kDatasetType = u"DATASET_TYPE";
inline constexpr Word kFeatureTypesList = u"FEATURE_TYPES_LIST";
inline constexpr Word kFeatTypeValidationScript = u"FEAT_TYPE_VALIDATION_SCRIPT";
inline constexpr Word kGenerateOrxBuildNum = u"GENERATE_ORX_BUILD_NUM";
inline constexpr Word kName = u"NAME";
inline constexpr Word kAlwaysPromptParms = u"ALWAYS_PROMPT_PARMS";
inline constexpr Word kValue = u"VALUE";
inline constexpr Word kFormatType = u"FORMAT_TYPE";
inline constexpr Word kOrxType = u"ORX_TYPE";
inline constexpr Word kNodeName = u"NODE_NAME";
inline constexpr Word kFeatureTypeName = u"FEATURE_TYPE_NAME";
inline constexpr Word kFeatureTypeNameQualifier = u"FEATURE_TYPE_NAME_QUALIFIER";
inline constexpr Word kIsEditable = u"IS_EDITABLE";
inline constexpr Word kIdentifier = u"IDENTIFIER";
inline constexpr Word kFeatGeomtype = u"FEAT_GEOMTYPE";
inline constexpr Word kPosition = u"POSITION";
inline constexpr Word kBoundingRect = u"BOUNDING_RECT";
inline constexpr Word kOrder = u"ORDER";
inline constexpr Word kCollapsed = u"COLLAPSED";
inline constexpr Word kParmsEdited = u"PARMS_EDITED";
inline constexpr Word kHiddenUserAttrs = u"HIDDEN_USER_ATTRS";
inline constexpr Word kReadSelectAttrs = u"READ_SELECT_ATTRS";
inline constexpr Word kMergeFilter = u"MERGE_FILTER";
inline constexpr Word kMergeFilterType = u"MERGE_FILTER_TYPE";
inline constexpr Word kMergeFilterCaseSensitive = u"MERGE_FILTER_CASE_SENSITIVE";
inline constexpr Word kDynamicSchema = u"DYNAMIC_SCHEMA";
inline constexpr Word kSchemaAttributeSource = u"SCHEMA_ATTRIBUTE_SOURCE";
inline constexpr Word kDynamicSchemaSources = u"DYNAMIC_SCHEMA_SOURCES";
inline constexpr Word kDynamicSchemaFeatureType = u"DYNAMIC_SCHEMA_FEATURE_TYPE";
inline constexpr Word kDynamicSchemaFeatureTypeName = u"DYNAMIC_SCHEMA_FEATURE_TYPE_NAME";
inline constexpr Word kDynamicSchemaDefinition = u"DYNAMIC_SCHEMA_DEFINITION";
inline constexpr Word kDynamicSchemaDefinitionName = u"DYNAMIC_SCHEMA_DEFINITION_NAME";
inline constexpr Word kDynamicSchemaGeometry = u"DYNAMIC_SCHEMA_GEOMETRY";
inline constexpr Word kDynamicSchemaGeometryName = u"DYNAMIC_SCHEMA_GEOMETRY_NAME";
inline constexpr Word kDynamicSchemaAttributesToRemove = u"DYNAMIC_SCHEMA_ATTRIBUTES_TO_REMOVE";
inline constexpr Word kFanout = u"FANOUT";
inline constexpr Word kFanoutIdAttr = u"FANOUT_ID_ATTR";
inline constexpr Word kMerge = u"MERGE";
inline constexpr Word kAttrName = u"ATTR_NAME";
inline constexpr Word kAttrType = u"ATTR_TYPE";
inline constexpr Word kExposableAttr = u"EXPOSABLE_ATTR";
inline constexpr Word kAttrHasPort = u"ATTR_HAS_PORT";
inline constexpr Word kAttrValue = u"ATTR_VALUE";
inline constexpr Word kAttrIndexType = u"ATTR_INDEX_TYPE";
inline constexpr Word kAttrValueType = u"ATTR_VALUE_TYPE";
inline constexpr Word kParmName = u"PARM_NAME";
inline constexpr Word kParmValue = u"PARM_VALUE";
inline constexpr Word kGuiLine = u"GUI_LINE";
inline constexpr Word kDefaultValue = u"DEFAULT_VALUE";
inline constexpr Word kIsStandAlone = u"IS_STAND_ALONE";
inline constexpr Word kConstValue = u"CONST_VALUE";
inline constexpr Word kCommentValue = u"COMMENT_VALUE";
inline constexpr Word kTopLeft = u"TOP_LEFT";
inline constexpr Word kBottomRight = u"BOTTOM_RIGHT";
inline constexpr Word kFollowAnchor = u"FOLLOW_ANCHOR";
inline constexpr Word kInfoNode = u"INFO_NODE";
inline constexpr Word kColour = u"COLOUR";
inline constexpr Word kSizePolicy = u"SIZE_POLICY";
inline constexpr Word kAnchoredNode = u"ANCHORED_NODE";
inline constexpr Word kDescription = u"DESCRIPTION";
inline constexpr Word kUncollapsedSize = u"UNCOLLAPSED_SIZE";
inline constexpr Word kSticky = u"STICKY";
inline constexpr Word kNavBehavior = u"NAV_BEHAVIOR";
inline constexpr Word kContents = u"CONTENTS";
inline constexpr Word kSourceNode = u"SOURCE_NODE";
inline constexpr Word kSourcePortDesc = u"SOURCE_PORT_DESC";
inline constexpr Word kType = u"TYPE";
inline constexpr Word kVersion = u"VERSION";
inline constexpr Word kLastParmEdit = u"LAST_PARM_EDIT";
inline constexpr Word kInputFtOrder = u"INPUT_FT_ORDER";
inline constexpr Word kOutputFtOrder = u"OUTPUT_FT_ORDER";
inline constexpr Word kIsUserCreated = u"IS_USER_CREATED";
inline constexpr Word kFeatIndex = u"FEAT_INDEX";
inline constexpr Word kAttrIsEnabled = u"ATTR_IS_ENABLED";
inline constexpr Word kXformerName = u"XFORMER_NAME";
inline constexpr Word kCustomPrompt = u"CUSTOM_PROMPT";
inline constexpr Word kAlwaysPromptParm = u"ALWAYS_PROMPT_PARM";
inline constexpr Word kPublished = u"PUBLISHED";
inline constexpr Word kAttrMode = u"ATTR_MODE";
inline constexpr Word kTargetNode = u"TARGET_NODE";
inline constexpr Word kTargetPortDesc = u"TARGET_PORT_DESC";
inline constexpr Word kExecutionIdx = u"EXECUTION_IDX";
inline constexpr Word kHidden = u"HIDDEN";
inline constexpr Word kExtraPoints = u"EXTRA_POINTS";
inline constexpr Word kCondition = u"CONDITION";
inline constexpr Word kTestClause = u"TEST_CLAUSE";
inline constexpr Word kBoolOp = u"BOOL_OP";
inline constexpr Word kCompositeTest = u"COMPOSITE_TEST";
inline constexpr Word kHitcount = u"HITCOUNT";
inline constexpr Word kAction = u"ACTION";
inline constexpr Word kCategory = u"CATEGORY";
inline constexpr Word kUid = u"UID";
inline constexpr Word kDisableVisualizers = u"DISABLE_VISUALIZERS";
inline constexpr Word kGroupBy = u"GROUP_BY";
inline constexpr Word kTrue = u"true";
inline constexpr Word kFalse = u"false";
inline constexpr Word kLoop = u"loop";
inline constexpr Word kServer = u"ORX_SERVER";
inline constexpr Word kReader = u"READER";
inline constexpr Word kWriter = u"WRITER";
inline constexpr Word kSubDocumentTransformer = u"SubDocumentTransformer";
inline constexpr Word kInspector = u"Inspector";

}  // namespace words
