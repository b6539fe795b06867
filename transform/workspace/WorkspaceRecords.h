// The records of a workspace document: one plain structure per element, one field per attribute, named after
// the attribute; one vector per kind of child element, in document order.
//
// The initial value of a field is what the reader takes when the attribute is absent. Positions and sizes are
// in the units of the editor's canvas. `line` is the line of the element in the file that the document was
// read from, counted from 1; 0 for a record that was not read. It is no part of a record's value: operator==
// leaves it, and all that is derived from other fields, out.
#pragma once

#include <platform/Export.h>
#include <transform/workspace/DynamicSchemaInfo.h>
#include <transform/workspace/RecordList.h>

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QString>

#include <vector>

// By the root element; single bits.
enum DocumentType : int {
  kWorkspaceDocument = 1,
  kDataSourceDocument = 2,
  kToolDocument = 4,
  kTransformerDocument = 8,
  kUnknownDocument = 32,
};

struct MetafileParameterStruct {
  QString name;
  QString value;
  int line = 0;
};

struct DatasetStruct {
  bool isSource = false;  // true for a reader
  QString role;           // "READER" or "WRITER"; the reader fills in an empty one by isSource
  QString format;
  QString dataset;  // path or name
  QString keyword;
  bool multiGeomAllowed = false;
  int attrMaxLength = -1;
  QString attrCase;
  QString allowedFeatTypes;
  bool writeDefs = false;
  QString deflineTemplate;
  bool deflineAttrs = false;
  QString exposableAttrs;
  QString deflineParms;
  QString attrIndexTypes;
  QString attrNameInvalidChars;
  bool supportsFeatureTypeFanout = true;
  bool enabled = true;
  bool dynamicFeatureTypesListOnMerge = true;
  QString datasetType;
  QString featureTypesList;
  QString featTypeValidationScript;
  int generateOrxBuildNum = 0;
  QString name;
  QString alwaysPromptParms;  // read, never written
  RecordList<MetafileParameterStruct> metafileParameters;
  int line = 0;
};

struct DataTypeStruct {
  bool isSource = false;
  QString formatType;
  QString orxType;
  QString format;
  int line = 0;
};

struct GeomTypeStruct {
  bool isSource = false;
  QString formatType;
  QString orxType;
  QString format;
  int line = 0;
};

struct FeatAttributeStruct {
  QString attrName;
  QString attrType;
  bool exposableAttr = false;
  bool attrHasPort = true;
  QString attrValue;
  QString attrIndexType;  // read, never written
  QString attrValueType;  // read, never written
  int line = 0;
};

struct NonGuiDeflineParmStruct {
  QString value;
  int line = 0;
};

struct DeflineParmStruct {
  QString parmName;
  QString parmValue;
  int line = 0;
};

struct FeatureTypeStruct {
  bool isSource = false;
  QString nodeName;
  QString featureTypeName;
  QString featureTypeNameQualifier;
  bool isEditable = false;
  int identifier = -1;
  QString featGeomtype;
  QPointF position;
  QRectF boundingRect;
  double order = -1.0;
  bool collapsed = true;
  QString keyword;  // of the dataset it belongs to
  bool parmsEdited = true;
  bool enabled = true;
  QString hiddenUserAttrs;
  bool readSelectAttrs = false;
  QString mergeFilter;
  QString mergeFilterType = QStringLiteral("FILTER_TYPE_GLOB");
  bool mergeFilterCaseSensitive = true;
  bool dynamicSchema = false;
  int schemaAttributeSource = 1;
  QString dynamicSchemaSources;
  DynamicSchemaInfo dynamicSchemaInfo;
  bool fanout = false;   // read, never written
  QString fanoutIdAttr;  // read, never written
  bool merge = false;    // read, never written
  RecordList<FeatAttributeStruct> attributes;
  RecordList<NonGuiDeflineParmStruct> nonGuiDeflineParms;
  RecordList<DeflineParmStruct> deflineParms;
  int line = 0;
};

struct GlobalParameterStruct {
  QString guiLine;  // the prompt line
  QString defaultValue;
  bool isStandAlone = false;
  bool isServer = false;  // belongs to the server settings; wins over isStandAlone when written
  int line = 0;
};

struct ConstantStruct {
  int identifier = -1;
  QString constValue;
  int line = 0;
};

struct CommentStruct {
  int identifier = -1;
  QString commentValue;
  QPointF position;
  QPointF topLeft;
  QPointF bottomRight;
  QRectF boundingRect;
  double order = -1.0;
  bool followAnchor = true;
  bool infoNode = false;
  QString colour;
  int sizePolicy = 0;
  int anchoredNode = -1;  // identifier of the node it is pinned to
  int line = 0;
};

struct BookmarkFeatStruct {
  QString name;
  int sourceNode = -1;
  QString sourcePortDesc;
  int line = 0;
};

struct BookmarkStruct {
  int identifier = -1;
  QString name;
  QString description;
  QPointF topLeft;
  double order = 0.0;
  bool collapsed = false;
  QSizeF uncollapsedSize = QSizeF(0, 0);
  QPointF bottomRight;
  QRectF boundingRect;
  bool sticky = false;
  int navBehavior = 0;
  QString colour;
  QString contents = QStringLiteral("<OLD_BOOKMARK>");  // the default marks one saved before contents existed
  RecordList<BookmarkFeatStruct> bookmarkFeats;
  int line = 0;
};

struct OutputFeatStruct {
  QString name;
  int line = 0;
};

struct FeatCollapsedStruct {
  int collapsed = -1;
  int line = 0;
};

// How an attribute's name points into a list: "name", "name{3}" or "name{}".
enum class AttributeListForm { None, Indexed, IndexFree };

// An exposed attribute.
struct XformAttrStruct {
  QString attrName;
  bool isUserCreated = false;
  int featIndex = -1;
  bool attrIsEnabled = true;
  QString attrValue;
  QString attrValueType;                                 // read, never written
  AttributeListForm listForm = AttributeListForm::None;  // derived from attrName
  int line = 0;
};

struct XformParmStruct {
  QString parmName;
  QString parmValue;
  QString xformerName;            // read, never written
  QString customPrompt;           // read, never written
  bool alwaysPromptParm = false;  // read, never written
  QString promptLine;             // derived: with a custom prompt, the prompt line that holds it
  int line = 0;
};

// The transformer types that are known by their name.
enum class TransformerKind { Ordinary, SubDocument, Inspector };

struct TransformerStruct {
  int identifier = -1;  // unique within the document
  QString type;
  int version = 0;
  QPointF position;
  QRectF boundingRect;
  double order = -1.0;
  bool parmsEdited = false;
  bool enabled = true;
  int lastParmEdit = 0;
  QString inputFtOrder;  // readPortOrder() reads it
  QString outputFtOrder;
  RecordList<OutputFeatStruct> outputFeats;
  RecordList<FeatCollapsedStruct> featCollapsed;
  RecordList<XformAttrStruct> attributes;
  RecordList<XformParmStruct> parameters;
  QString name;                                      // derived: the value of the parameter "XFORMER_NAME"
  TransformerKind kind = TransformerKind::Ordinary;  // derived from type
  int line = 0;
};

struct SubDocumentIOAttrStruct {
  QString attrName;
  QString attrValue;  // null: the attribute has no value, and none is written
  int line = 0;
};

enum class SubDocumentIOKind { Output, Input, Loop };

struct SubDocumentIOStruct {
  int identifier = -1;
  QString name;
  QPointF position;
  QRectF boundingRect;
  bool collapsed = false;
  bool published = true;
  SubDocumentIOKind isSource =
      SubDocumentIOKind::Output;  // "true" is an input, "false" an output, "loop" a loop
  int attrMode = 0;
  RecordList<SubDocumentIOAttrStruct> attributes;
  int line = 0;
};

// A sub-document port with the key that it is sorted by: its identifier. Ports of one key keep document
// order.
struct OrderedObjectStruct {
  int key = -1;
  SubDocumentIOStruct record;
};
using OrderedObjectList = std::vector<OrderedObjectStruct>;

// Feature links and attribute links; an attribute link has neither of the last four attributes.
struct LinkStruct {
  int identifier = -1;
  int sourceNode = -1;
  int targetNode = -1;
  QString sourcePortDesc;
  QString targetPortDesc;
  bool enabled = true;
  int executionIdx = -1;
  bool hidden = false;
  QString extraPoints;
  int line = 0;
};

struct BreakpointStruct {
  int featLink = -1;  // identifier of the link it sits on
  bool enabled = false;
  QString name;
  QString condition;
  QString testClause;
  QString boolOp;
  QString compositeTest;
  QString hitcount;
  QString action;
  int line = 0;
};

struct ServicePropertyStruct {
  QString category;
  QString name;
  QString value;
  int line = 0;
};

struct ServiceStruct {
  QString name;
  RecordList<ServicePropertyStruct> properties;
  int line = 0;
};

// A repository, an item or a document of the server settings.
struct ServerNameStruct {
  QString name;
  int line = 0;
};

struct ModificationStruct {
  QString uid;
  QString value;
  int line = 0;
};

struct ServerParameterStruct {
  RecordList<ServiceStruct> services;
  RecordList<ServerNameStruct> repositories;
  RecordList<ServerNameStruct> items;
  RecordList<ModificationStruct> modifications;
  RecordList<ServerNameStruct> documents;  // read, never written
  int line = 0;
};

#define ORX_RECORD_EQUALITY(Record)                                    \
  ORX_EXPORT bool operator==(const Record& left, const Record& right); \
  inline bool operator!=(const Record& left, const Record& right) {    \
    return !(left == right);                                           \
  }

ORX_RECORD_EQUALITY(DatasetStruct)
ORX_RECORD_EQUALITY(DataTypeStruct)
ORX_RECORD_EQUALITY(GeomTypeStruct)
ORX_RECORD_EQUALITY(FeatureTypeStruct)
ORX_RECORD_EQUALITY(GlobalParameterStruct)
ORX_RECORD_EQUALITY(ConstantStruct)
ORX_RECORD_EQUALITY(CommentStruct)
ORX_RECORD_EQUALITY(BookmarkStruct)
ORX_RECORD_EQUALITY(TransformerStruct)
ORX_RECORD_EQUALITY(SubDocumentIOStruct)
ORX_RECORD_EQUALITY(LinkStruct)
ORX_RECORD_EQUALITY(BreakpointStruct)
ORX_RECORD_EQUALITY(ServerParameterStruct)

#undef ORX_RECORD_EQUALITY
