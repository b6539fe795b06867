// One table per kind of element: names, kinds, defaults and order of its attributes and children. Reader,
// writer, comparison and loss report all work from these, so that they cannot drift apart.
//
// `layout` says how the writer lays the element out: each attribute on a line of its own, or all on one line.
#pragma once

#include <transform/workspace/WorkspaceRecords.h>
#include <transform/workspace/records/RecordRules.h>

enum class Layout { Lines, OneLine };

namespace tables {

using rules::attribute;
using rules::inOrder;
using rules::special;

struct MetafileParameter {
  using Record = MetafileParameterStruct;
  static constexpr Word element = words::kMetafileParameter;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes =
      inOrder(attribute(words::kName, &Record::name), attribute(words::kValue, &Record::value));
  static constexpr auto children = std::make_tuple();
};

struct Dataset {
  using Record = DatasetStruct;
  static constexpr Word element = words::kDataset;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes =
      inOrder(attribute(words::kIsSource, &Record::isSource), attribute(words::kRole, &Record::role),
              attribute(words::kFormat, &Record::format), attribute(words::kDataset, &Record::dataset),
              attribute(words::kKeyword, &Record::keyword),
              attribute(words::kMultiGeomAllowed, &Record::multiGeomAllowed),
              attribute(words::kAttrMaxLength, &Record::attrMaxLength),
              attribute(words::kAttrCase, &Record::attrCase),
              attribute(words::kAllowedFeatTypes, &Record::allowedFeatTypes),
              attribute(words::kWriteDefs, &Record::writeDefs),
              attribute(words::kDeflineTemplate, &Record::deflineTemplate),
              attribute(words::kDeflineAttrs, &Record::deflineAttrs),
              attribute(words::kExposableAttrs, &Record::exposableAttrs),
              attribute(words::kDeflineParms, &Record::deflineParms),
              attribute(words::kAttrIndexTypes, &Record::attrIndexTypes),
              attribute(words::kAttrNameInvalidChars, &Record::attrNameInvalidChars),
              attribute(words::kSupportsFeatureTypeFanout, &Record::supportsFeatureTypeFanout),
              attribute(words::kEnabled, &Record::enabled),
              attribute(words::kDynamicFeatureTypesListOnMerge, &Record::dynamicFeatureTypesListOnMerge),
              attribute(words::kDatasetType, &Record::datasetType),
              attribute(words::kFeatureTypesList, &Record::featureTypesList),
              attribute(words::kFeatTypeValidationScript, &Record::featTypeValidationScript),
              attribute(words::kGenerateOrxBuildNum, &Record::generateOrxBuildNum),
              attribute(words::kName, &Record::name),
              attribute(words::kAlwaysPromptParms, &Record::alwaysPromptParms, Emission::Never));
  static constexpr auto children =
      std::make_tuple(ChildRule<Record, MetafileParameter>{&Record::metafileParameters});
};

struct DataType {
  using Record = DataTypeStruct;
  static constexpr Word element = words::kDataType;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIsSource, &Record::isSource), attribute(words::kFormatType, &Record::formatType),
      attribute(words::kOrxType, &Record::orxType), attribute(words::kFormat, &Record::format));
  static constexpr auto children = std::make_tuple();
};

struct GeomType {
  using Record = GeomTypeStruct;
  static constexpr Word element = words::kGeomType;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIsSource, &Record::isSource), attribute(words::kFormatType, &Record::formatType),
      attribute(words::kOrxType, &Record::orxType), attribute(words::kFormat, &Record::format));
  static constexpr auto children = std::make_tuple();
};

struct FeatAttribute {
  using Record = FeatAttributeStruct;
  static constexpr Word element = words::kFeatAttribute;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(
      attribute(words::kAttrName, &Record::attrName), attribute(words::kAttrType, &Record::attrType),
      attribute(words::kExposableAttr, &Record::exposableAttr),
      attribute(words::kAttrHasPort, &Record::attrHasPort), attribute(words::kAttrValue, &Record::attrValue),
      attribute(words::kAttrIndexType, &Record::attrIndexType, Emission::Never),
      attribute(words::kAttrValueType, &Record::attrValueType, Emission::Never));
  static constexpr auto children = std::make_tuple();
};

struct NonGuiDeflineParm {
  using Record = NonGuiDeflineParmStruct;
  static constexpr Word element = words::kNonGuiDeflineParm;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(attribute(words::kValue, &Record::value));
  static constexpr auto children = std::make_tuple();
};

struct DeflineParm {
  using Record = DeflineParmStruct;
  static constexpr Word element = words::kDeflineParm;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(attribute(words::kParmName, &Record::parmName),
                                             attribute(words::kParmValue, &Record::parmValue));
  static constexpr auto children = std::make_tuple();
};

// The dynamic-schema rules are kept in an object of their own. A mode that is no known name reads as the
// default.
using SchemaMode = int (IDynamicSchemaInfo::*)() const;
using SetSchemaMode = void (IDynamicSchemaInfo::*)(int);
using SchemaName = QString (IDynamicSchemaInfo::*)() const;
using SetSchemaName = void (IDynamicSchemaInfo::*)(const QString&);

template <SetSchemaMode set>
bool readSchemaMode(FeatureTypeStruct& record, const QString& text) {
  const int mode = DynamicSchemaInfo::modeOfName(text);
  (record.dynamicSchemaInfo.*set)(mode);
  return DynamicSchemaInfo::modeName(mode) == text;
}

template <SchemaMode get>
QString writeSchemaMode(const FeatureTypeStruct& record) {
  return DynamicSchemaInfo::modeName((record.dynamicSchemaInfo.*get)());
}

template <SetSchemaName set>
bool readSchemaName(FeatureTypeStruct& record, const QString& text) {
  (record.dynamicSchemaInfo.*set)(text);
  return true;
}

template <SchemaName get>
QString writeSchemaName(const FeatureTypeStruct& record) {
  return (record.dynamicSchemaInfo.*get)();
}

// A packed list, separated by commas.
bool readAttributesToRemove(FeatureTypeStruct& record, const QString& text);
QString writeAttributesToRemove(const FeatureTypeStruct& record);

struct FeatureType {
  using Record = FeatureTypeStruct;
  static constexpr Word element = words::kFeatureType;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIsSource, &Record::isSource), attribute(words::kNodeName, &Record::nodeName),
      attribute(words::kFeatureTypeName, &Record::featureTypeName),
      attribute(words::kFeatureTypeNameQualifier, &Record::featureTypeNameQualifier),
      attribute(words::kIsEditable, &Record::isEditable), attribute(words::kIdentifier, &Record::identifier),
      attribute(words::kFeatGeomtype, &Record::featGeomtype), attribute(words::kPosition, &Record::position),
      attribute(words::kBoundingRect, &Record::boundingRect), attribute(words::kOrder, &Record::order),
      attribute(words::kCollapsed, &Record::collapsed), attribute(words::kKeyword, &Record::keyword),
      attribute(words::kParmsEdited, &Record::parmsEdited), attribute(words::kEnabled, &Record::enabled),
      attribute(words::kHiddenUserAttrs, &Record::hiddenUserAttrs),
      attribute(words::kReadSelectAttrs, &Record::readSelectAttrs),
      attribute(words::kMergeFilter, &Record::mergeFilter),
      attribute(words::kMergeFilterType, &Record::mergeFilterType),
      attribute(words::kMergeFilterCaseSensitive, &Record::mergeFilterCaseSensitive),
      attribute(words::kDynamicSchema, &Record::dynamicSchema),
      attribute(words::kSchemaAttributeSource, &Record::schemaAttributeSource),
      attribute(words::kDynamicSchemaSources, &Record::dynamicSchemaSources),
      special<Record>(words::kDynamicSchemaFeatureType,
                      &readSchemaMode<&IDynamicSchemaInfo::setFeatureTypeMode>,
                      &writeSchemaMode<&IDynamicSchemaInfo::getFeatureTypeMode>),
      special<Record>(words::kDynamicSchemaFeatureTypeName,
                      &readSchemaName<&IDynamicSchemaInfo::setFeatureTypeName>,
                      &writeSchemaName<&IDynamicSchemaInfo::getFeatureTypeName>),
      special<Record>(words::kDynamicSchemaDefinition,
                      &readSchemaMode<&IDynamicSchemaInfo::setDefinitionMode>,
                      &writeSchemaMode<&IDynamicSchemaInfo::getDefinitionMode>),
      special<Record>(words::kDynamicSchemaDefinitionName,
                      &readSchemaName<&IDynamicSchemaInfo::setDefinitionName>,
                      &writeSchemaName<&IDynamicSchemaInfo::getDefinitionName>),
      special<Record>(words::kDynamicSchemaGeometry, &readSchemaMode<&IDynamicSchemaInfo::setGeometryMode>,
                      &writeSchemaMode<&IDynamicSchemaInfo::getGeometryMode>),
      special<Record>(words::kDynamicSchemaGeometryName,
                      &readSchemaName<&IDynamicSchemaInfo::setGeometryName>,
                      &writeSchemaName<&IDynamicSchemaInfo::getGeometryName>),
      special<Record>(words::kDynamicSchemaAttributesToRemove, &readAttributesToRemove,
                      &writeAttributesToRemove),
      attribute(words::kFanout, &Record::fanout, Emission::Never),
      attribute(words::kFanoutIdAttr, &Record::fanoutIdAttr, Emission::Never),
      attribute(words::kMerge, &Record::merge, Emission::Never));
  static constexpr auto children =
      std::make_tuple(ChildRule<Record, FeatAttribute>{&Record::attributes},
                      ChildRule<Record, NonGuiDeflineParm>{&Record::nonGuiDeflineParms},
                      ChildRule<Record, DeflineParm>{&Record::deflineParms});
};

// "true", "false" or "ORX_SERVER".
bool readStandAlone(GlobalParameterStruct& record, const QString& text);
QString writeStandAlone(const GlobalParameterStruct& record);

struct GlobalParameter {
  using Record = GlobalParameterStruct;
  static constexpr Word element = words::kGlobalParameter;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kGuiLine, &Record::guiLine), attribute(words::kDefaultValue, &Record::defaultValue),
      special<Record>(words::kIsStandAlone, &readStandAlone, &writeStandAlone));
  static constexpr auto children = std::make_tuple();
};

struct Constant {
  using Record = ConstantStruct;
  static constexpr Word element = words::kConstant;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kIdentifier, &Record::identifier),
                                             attribute(words::kConstValue, &Record::constValue));
  static constexpr auto children = std::make_tuple();
};

// The second form of a constant.
struct ParameterConstant : Constant {
  static constexpr Word element = words::kParameterConstant;
};

struct Comment {
  using Record = CommentStruct;
  static constexpr Word element = words::kComment;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIdentifier, &Record::identifier),
      attribute(words::kCommentValue, &Record::commentValue), attribute(words::kPosition, &Record::position),
      attribute(words::kTopLeft, &Record::topLeft), attribute(words::kBottomRight, &Record::bottomRight),
      attribute(words::kBoundingRect, &Record::boundingRect), attribute(words::kOrder, &Record::order),
      attribute(words::kFollowAnchor, &Record::followAnchor), attribute(words::kInfoNode, &Record::infoNode),
      attribute(words::kColour, &Record::colour), attribute(words::kSizePolicy, &Record::sizePolicy),
      attribute(words::kAnchoredNode, &Record::anchoredNode));
  static constexpr auto children = std::make_tuple();
};

struct BookmarkFeat {
  using Record = BookmarkFeatStruct;
  static constexpr Word element = words::kBookmarkFeat;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes =
      inOrder(attribute(words::kName, &Record::name), attribute(words::kSourceNode, &Record::sourceNode),
              attribute(words::kSourcePortDesc, &Record::sourcePortDesc));
  static constexpr auto children = std::make_tuple();
};

struct Bookmark {
  using Record = BookmarkStruct;
  static constexpr Word element = words::kBookmark;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIdentifier, &Record::identifier), attribute(words::kName, &Record::name),
      attribute(words::kDescription, &Record::description), attribute(words::kTopLeft, &Record::topLeft),
      attribute(words::kOrder, &Record::order), attribute(words::kCollapsed, &Record::collapsed),
      attribute(words::kUncollapsedSize, &Record::uncollapsedSize),
      attribute(words::kBottomRight, &Record::bottomRight),
      attribute(words::kBoundingRect, &Record::boundingRect), attribute(words::kSticky, &Record::sticky),
      attribute(words::kNavBehavior, &Record::navBehavior), attribute(words::kColour, &Record::colour),
      attribute(words::kContents, &Record::contents));
  static constexpr auto children = std::make_tuple(ChildRule<Record, BookmarkFeat>{&Record::bookmarkFeats});
};

struct OutputFeat {
  using Record = OutputFeatStruct;
  static constexpr Word element = words::kOutputFeat;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(attribute(words::kName, &Record::name));
  static constexpr auto children = std::make_tuple();
};

struct FeatCollapsed {
  using Record = FeatCollapsedStruct;
  static constexpr Word element = words::kFeatCollapsed;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(attribute(words::kCollapsed, &Record::collapsed));
  static constexpr auto children = std::make_tuple();
};

struct XformAttr {
  using Record = XformAttrStruct;
  static constexpr Word element = words::kXformAttr;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes =
      inOrder(attribute(words::kAttrName, &Record::attrName),
              attribute(words::kIsUserCreated, &Record::isUserCreated),
              attribute(words::kFeatIndex, &Record::featIndex),
              attribute(words::kAttrIsEnabled, &Record::attrIsEnabled),
              attribute(words::kAttrValue, &Record::attrValue),
              attribute(words::kAttrValueType, &Record::attrValueType, Emission::Never));
  static constexpr auto children = std::make_tuple();
};

struct XformParm {
  using Record = XformParmStruct;
  static constexpr Word element = words::kXformParm;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes = inOrder(
      attribute(words::kParmName, &Record::parmName), attribute(words::kParmValue, &Record::parmValue),
      attribute(words::kXformerName, &Record::xformerName, Emission::Never),
      attribute(words::kCustomPrompt, &Record::customPrompt, Emission::Never),
      attribute(words::kAlwaysPromptParm, &Record::alwaysPromptParm, Emission::Never));
  static constexpr auto children = std::make_tuple();
};

// The top left corner of the rectangle, when there is one.
bool readTransformerPosition(TransformerStruct& record, const QString& text);
QString writeTransformerPosition(const TransformerStruct& record);

struct Transformer {
  using Record = TransformerStruct;
  static constexpr Word element = words::kTransformer;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIdentifier, &Record::identifier), attribute(words::kType, &Record::type),
      attribute(words::kVersion, &Record::version),
      special<Record>(words::kPosition, &readTransformerPosition, &writeTransformerPosition),
      attribute(words::kBoundingRect, &Record::boundingRect), attribute(words::kOrder, &Record::order),
      attribute(words::kParmsEdited, &Record::parmsEdited), attribute(words::kEnabled, &Record::enabled),
      attribute(words::kLastParmEdit, &Record::lastParmEdit),
      attribute(words::kInputFtOrder, &Record::inputFtOrder, Emission::UnlessEmpty),
      attribute(words::kOutputFtOrder, &Record::outputFtOrder, Emission::UnlessEmpty));
  static constexpr auto children = std::make_tuple(ChildRule<Record, OutputFeat>{&Record::outputFeats},
                                                   ChildRule<Record, FeatCollapsed>{&Record::featCollapsed},
                                                   ChildRule<Record, XformAttr>{&Record::attributes},
                                                   ChildRule<Record, XformParm>{&Record::parameters});
};

struct SubDocumentIOAttr {
  using Record = SubDocumentIOAttrStruct;
  static constexpr Word element = words::kXformAttr;
  static constexpr Layout layout = Layout::OneLine;
  static constexpr auto attributes =
      inOrder(attribute(words::kAttrName, &Record::attrName),
              attribute(words::kAttrValue, &Record::attrValue, Emission::UnlessNull));
  static constexpr auto children = std::make_tuple();
};

// "true" for an input port, "false" for an output port, "loop" for a loop port.
bool readPortKind(SubDocumentIOStruct& record, const QString& text);
QString writePortKind(const SubDocumentIOStruct& record);

struct SubDocumentIO {
  using Record = SubDocumentIOStruct;
  static constexpr Word element = words::kSubdocumentIo;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIdentifier, &Record::identifier), attribute(words::kName, &Record::name),
      attribute(words::kPosition, &Record::position), attribute(words::kBoundingRect, &Record::boundingRect),
      attribute(words::kCollapsed, &Record::collapsed), attribute(words::kPublished, &Record::published),
      special<Record>(words::kIsSource, &readPortKind, &writePortKind),
      attribute(words::kAttrMode, &Record::attrMode));
  static constexpr auto children = std::make_tuple(ChildRule<Record, SubDocumentIOAttr>{&Record::attributes});
};

struct FeatLink {
  using Record = LinkStruct;
  static constexpr Word element = words::kFeatLink;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(
      attribute(words::kIdentifier, &Record::identifier), attribute(words::kSourceNode, &Record::sourceNode),
      attribute(words::kTargetNode, &Record::targetNode),
      attribute(words::kSourcePortDesc, &Record::sourcePortDesc),
      attribute(words::kTargetPortDesc, &Record::targetPortDesc),
      attribute(words::kEnabled, &Record::enabled), attribute(words::kExecutionIdx, &Record::executionIdx),
      attribute(words::kHidden, &Record::hidden), attribute(words::kExtraPoints, &Record::extraPoints));
  static constexpr auto children = std::make_tuple();
};

struct AttrLink {
  using Record = LinkStruct;
  static constexpr Word element = words::kAttrLink;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kIdentifier, &Record::identifier),
                                             attribute(words::kSourceNode, &Record::sourceNode),
                                             attribute(words::kTargetNode, &Record::targetNode),
                                             attribute(words::kSourcePortDesc, &Record::sourcePortDesc),
                                             attribute(words::kTargetPortDesc, &Record::targetPortDesc));
  static constexpr auto children = std::make_tuple();
};

struct Breakpoint {
  using Record = BreakpointStruct;
  static constexpr Word element = words::kBreakpoint;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes =
      inOrder(attribute(words::kFeatLink, &Record::featLink), attribute(words::kEnabled, &Record::enabled),
              attribute(words::kName, &Record::name), attribute(words::kCondition, &Record::condition),
              attribute(words::kTestClause, &Record::testClause), attribute(words::kBoolOp, &Record::boolOp),
              attribute(words::kCompositeTest, &Record::compositeTest),
              attribute(words::kHitcount, &Record::hitcount), attribute(words::kAction, &Record::action));
  static constexpr auto children = std::make_tuple();
};

struct ServiceProperty {
  using Record = ServicePropertyStruct;
  static constexpr Word element = words::kProperty;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes =
      inOrder(attribute(words::kCategory, &Record::category), attribute(words::kName, &Record::name),
              attribute(words::kValue, &Record::value));
  static constexpr auto children = std::make_tuple();
};

struct Service {
  using Record = ServiceStruct;
  static constexpr Word element = words::kService;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kName, &Record::name));
  static constexpr auto children =
      std::make_tuple(ChildRule<Record, ServiceProperty>{&Record::properties, &words::kProperties});
};

struct Repository {
  using Record = ServerNameStruct;
  static constexpr Word element = words::kRepository;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kName, &Record::name));
  static constexpr auto children = std::make_tuple();
};

struct Item {
  using Record = ServerNameStruct;
  static constexpr Word element = words::kItem;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kName, &Record::name));
  static constexpr auto children = std::make_tuple();
};

struct ServerDocument {
  using Record = ServerNameStruct;
  static constexpr Word element = words::kDocument;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes = inOrder(attribute(words::kName, &Record::name));
  static constexpr auto children = std::make_tuple();
};

struct Modification {
  using Record = ModificationStruct;
  static constexpr Word element = words::kModification;
  static constexpr Layout layout = Layout::Lines;
  static constexpr auto attributes =
      inOrder(attribute(words::kUid, &Record::uid), attribute(words::kValue, &Record::value));
  static constexpr auto children = std::make_tuple();
};

struct ServerParameter {
  using Record = ServerParameterStruct;
  static constexpr Word element = words::kOrxserver;
  static constexpr Layout layout = Layout::Lines;
  static constexpr std::array<AttributeRule<Record>, 0> attributes{};
  static constexpr auto children = std::make_tuple(
      ChildRule<Record, Service>{&Record::services, &words::kServices},
      ChildRule<Record, Repository>{&Record::repositories}, ChildRule<Record, Item>{&Record::items},
      ChildRule<Record, Modification>{&Record::modifications, &words::kModifications},
      ChildRule<Record, ServerDocument>{&Record::documents, nullptr, Emission::Never});
};

}  // namespace tables
