#include "DocumentContent.h"

#include <gtest/gtest.h>

namespace {

const QString kMain;

class ShoutingWriter : public XMLComponentWriter {
 public:
  using XMLComponentWriter::XMLComponentWriter;
  void writeComment(const CommentStruct& record) override {
    stream() << "<!-- " << record.commentValue << " -->\n";
  }
  void writeSections(const QString& document) override {
    stream() << "<!-- sections of " << document << " -->\n";
    XMLComponentWriter::writeSections(document);
  }
};

QString refusalOf(const std::function<void(XMLComponentWriter&)>& queue) {
  QBuffer buffer;
  buffer.open(QIODevice::WriteOnly);
  XMLComponentWriter writer(&buffer, kWorkspaceDocument);
  queue(writer);
  writer.writeDocument();
  const bool refused = !writer.getRefusal().isEmpty();
  EXPECT_EQ(refused, writer.stream().status() == QTextStream::WriteFailed);
  EXPECT_EQ(refused, buffer.data().isEmpty());
  return writer.getRefusal();
}

}  // namespace

TEST(Writer, LayoutIsExact) {
  DocumentContent content;
  content.type = kTransformerDocument;
  DatasetStruct dataset;
  dataset.metafileParameters.resize(1);
  dataset.metafileParameters[0].name = QStringLiteral("M");
  content.datasets = {dataset};
  content.server.services.resize(1);
  content.server.services[0].properties.resize(1);
  content.server.repositories.resize(1);
  content.subDocuments = QStringList{"z", "a"};
  content.documents[kMain].parameters = {{"B", "2"}, {"A", "\"1'\n\t\r<&>"}};
  content.documents["z"].parameters = {{"NAME", "z"}, {"C", ""}};
  content.documents["a"];
  TransformerStruct transformer;
  transformer.identifier = 5;
  transformer.type = QStringLiteral("T");
  transformer.position = QPointF(1.5, -2);
  transformer.boundingRect = QRectF(0.1, 2, 1e21, 4);
  transformer.outputFeats.resize(1);
  transformer.featCollapsed.resize(1);
  transformer.attributes.resize(1);
  transformer.parameters.resize(1);
  transformer.parameters[0].parmValue = QStringLiteral("say \"x\"");
  transformer.parameters[0].customPrompt = QStringLiteral("never written");
  SubDocumentIOStruct port;
  port.attributes.resize(2);
  port.attributes[1].attrValue = QLatin1String("");
  content.documents["z"].transformers = {transformer};
  content.documents["z"].ports = {port};
  const QByteArray emptySections =
      "<GLOBAL_PARAMETERS>\n</GLOBAL_PARAMETERS>\n<COMMENTS>\n</COMMENTS>\n<CONSTANTS>\n</CONSTANTS>\n"
      "<BOOKMARKS>\n</BOOKMARKS>\n<TRANSFORMERS>\n</TRANSFORMERS>\n<FEAT_LINKS>\n</FEAT_LINKS>\n"
      "<BREAKPOINTS>\n</BREAKPOINTS>\n<ATTR_LINKS>\n</ATTR_LINKS>\n";
  const QByteArray transformers =
      "<TRANSFORMERS>\n<TRANSFORMER\n  IDENTIFIER=\"5\"\n  TYPE=\"T\"\n  VERSION=\"0\"\n  POSITION=\"0.1 "
      "2\"\n"
      "  BOUNDING_RECT=\"0.1 2 1000000000000000000000 4\"\n  ORDER=\"-1\"\n  PARMS_EDITED=\"false\"\n"
      "  ENABLED=\"true\"\n  LAST_PARM_EDIT=\"0\"\n>\n    <OUTPUT_FEAT NAME=\"\"/>\n"
      "    <FEAT_COLLAPSED COLLAPSED=\"-1\"/>\n"
      "    <XFORM_ATTR ATTR_NAME=\"\" IS_USER_CREATED=\"false\" FEAT_INDEX=\"-1\" ATTR_IS_ENABLED=\"true\""
      " ATTR_VALUE=\"\"/>\n    <XFORM_PARM PARM_NAME=\"\" PARM_VALUE=\"say "
      "&quot;x&quot;\"/>\n</TRANSFORMER>\n"
      "</TRANSFORMERS>\n<SUBDOCUMENT_IOS>\n<SUBDOCUMENT_IO\n  IDENTIFIER=\"-1\"\n  NAME=\"\"\n  POSITION=\"0 "
      "0\"\n"
      "  BOUNDING_RECT=\"0 0 0 0\"\n  COLLAPSED=\"false\"\n  PUBLISHED=\"true\"\n  IS_SOURCE=\"false\"\n"
      "  ATTR_MODE=\"0\"\n>\n    <XFORM_ATTR ATTR_NAME=\"\"/>\n    <XFORM_ATTR ATTR_NAME=\"\" "
      "ATTR_VALUE=\"\"/>\n"
      "</SUBDOCUMENT_IO>\n</SUBDOCUMENT_IOS>\n";
  const QByteArray expected =
      "<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n<TRANSFORMER\n"
      "  A=\"&quot;1&apos;&#10;&#9;&#13;&lt;&amp;&gt;\"\n  B=\"2\"\n>\n<DATASETS>\n<DATASET\n"
      "  IS_SOURCE=\"false\"\n  ROLE=\"\"\n  FORMAT=\"\"\n  DATASET=\"\"\n  KEYWORD=\"\"\n"
      "  MULTI_GEOM_ALLOWED=\"false\"\n  ATTR_MAX_LENGTH=\"-1\"\n  ATTR_CASE=\"\"\n  "
      "ALLOWED_FEAT_TYPES=\"\"\n"
      "  WRITE_DEFS=\"false\"\n  DEFLINE_TEMPLATE=\"\"\n  DEFLINE_ATTRS=\"false\"\n  EXPOSABLE_ATTRS=\"\"\n"
      "  DEFLINE_PARMS=\"\"\n  ATTR_INDEX_TYPES=\"\"\n  ATTR_NAME_INVALID_CHARS=\"\"\n"
      "  SUPPORTS_FEATURE_TYPE_FANOUT=\"true\"\n  ENABLED=\"true\"\n"
      "  DYNAMIC_FEATURE_TYPES_LIST_ON_MERGE=\"true\"\n  DATASET_TYPE=\"\"\n  FEATURE_TYPES_LIST=\"\"\n"
      "  FEAT_TYPE_VALIDATION_SCRIPT=\"\"\n  GENERATE_ORX_BUILD_NUM=\"0\"\n  NAME=\"\"\n>\n"
      "<METAFILE_PARAMETER\n  NAME=\"M\"\n  "
      "VALUE=\"\"\n/>\n</DATASET>\n</DATASETS>\n<DATA_TYPES>\n</DATA_TYPES>\n"
      "<GEOM_TYPES>\n</GEOM_TYPES>\n<FEATURE_TYPES>\n</FEATURE_TYPES>\n<ORXSERVER>\n<SERVICES>\n<SERVICE\n"
      "  NAME=\"\"\n>\n<PROPERTIES>\n<PROPERTY\n  CATEGORY=\"\"\n  NAME=\"\"\n  "
      "VALUE=\"\"\n/>\n</PROPERTIES>\n"
      "</SERVICE>\n</SERVICES>\n<REPOSITORY\n  "
      "NAME=\"\"\n/>\n<MODIFICATIONS>\n</MODIFICATIONS>\n</ORXSERVER>\n" +
      emptySections + "<SUBDOCUMENTS>\n<SUBDOCUMENT\n  NAME=\"z\"\n  C=\"\"\n>\n" +
      QByteArray(emptySections).replace("<TRANSFORMERS>\n</TRANSFORMERS>\n", transformers) +
      "</SUBDOCUMENT>\n<SUBDOCUMENT\n  NAME=\"a\"\n>\n" + emptySections +
      "</SUBDOCUMENT>\n</SUBDOCUMENTS>\n<LOOKUP_TABLES>\n</LOOKUP_TABLES>\n</TRANSFORMER>\n";
  EXPECT_EQ(written(content).toStdString(), expected.toStdString());
}

TEST(Writer, TypesAndModesAreWrittenByName) {
  const std::tuple<int, const char*, int, const char*> cases[] = {
      {1, "WORKSPACE", 0, "AUTOMATIC"},     {2, "DATASOURCE", 1, "FIXED"},
      {4, "ETL_TOOL", 2, "FROM_ATTRIBUTE"}, {8, "TRANSFORMER", 3, "FIRST_ENCOUNTERED"},
      {16, "WORKSPACE", 7, "AUTOMATIC"},    {32, "WORKSPACE", -1, "AUTOMATIC"}};
  for (const auto& [type, root, mode, name] : cases) {
    DocumentContent content;
    content.type = static_cast<DocumentType>(type);
    content.featureTypes.resize(1);
    content.featureTypes[0].dynamicSchemaInfo.setGeometryMode(mode);
    content.documents[kMain];
    const QByteArray bytes = written(content);
    EXPECT_TRUE(bytes.contains(QByteArray("\n<") + root + "\n>")) << type;
    EXPECT_TRUE(bytes.contains(QByteArray("  DYNAMIC_SCHEMA_GEOMETRY=\"") + name + "\"\n")) << mode;
    EXPECT_EQ(readBytes(bytes)->GetFeatureTypeList().front().dynamicSchemaInfo.getGeometryMode(),
              mode == 7 || mode == -1 ? 0 : mode);
  }
}

TEST(Writer, WhatCannotBeReadBackIsRefusedBeforeAnythingIsWritten) {
  const auto comment = [](const QString& text) {
    return [text](XMLComponentWriter& writer) {
      CommentStruct record;
      record.commentValue = text;
      writer.addComment(kMain, record);
    };
  };
  const auto parameter = [](const QString& document, const QString& name, const QString& value) {
    return [=](XMLComponentWriter& writer) { writer.setMiscParms(document, {{name, value}}); };
  };
  const struct {
    const char* name;
    std::function<void(XMLComponentWriter&)> queue;
    const char* refusal;  // empty: written
  } cases[] = {
      {"plain", comment(QStringLiteral("a\tb\r\n")), ""},
      {"control", comment(QString(QChar(1))), "COMMENT, attribute COMMENT_VALUE: the character U+0001"},
      {"null", comment(QString(QChar(0))), "U+0000"},
      {"high surrogate", comment(QStringLiteral("a") + QChar(0xd800)), "U+d800"},
      {"low surrogate", comment(QString(QChar(0xdc00)) + QChar(0xd800)), "U+dc00"},
      {"noncharacter", comment(QString(QChar(0xffff))), "U+ffff"},
      {"longest", comment(QString(16 * 1024 * 1024, QLatin1Char('x'))), ""},
      {"too long", comment(QString(16 * 1024 * 1024 + 1, QLatin1Char('x'))), "longer than"},
      {"too long when escaped", comment(QString(16 * 1024 * 1024 / 5 + 1, QLatin1Char('&'))), "longer than"},
      {"parameter name", parameter(kMain, "a b", ""), "a b: this is no name of XML"},
      {"empty parameter name", parameter(kMain, "", ""), "no name of XML"},
      {"digit first", parameter("sub", "1", ""), "the parameters of sub, 1: this is no name of XML"},
      {"parameter value", parameter(kMain, "a", QString(QChar(2))), "U+0002"},
      {"document name", parameter(QString(QChar(2)), "a", ""), "U+0002"},
      {"parameter name and encoding",
       [](XMLComponentWriter& writer) {
         writer.setMiscParms(QStringLiteral("s"), {{QString(QChar(0x4e2d)), ""}});
         writer.setEncoding("ISO-8859-1");
       },
       "cannot be written in the encoding"},
      {"number",
       [](XMLComponentWriter& writer) {
         TransformerStruct record;
         record.boundingRect = QRectF(0, 0, qInf(), 0);
         writer.addTransformer(kMain, record);
       },
       "TRANSFORMER, attribute BOUNDING_RECT: a number is not finite"},
      {"inner record",
       [](XMLComponentWriter& writer) {
         TransformerStruct record;
         record.parameters.resize(3);
         record.parameters[2].parmValue = QChar(3);
         writer.addTransformer(kMain, record);
       },
       "XFORM_PARM, attribute PARM_VALUE"},
  };
  for (const auto& item : cases) {
    const std::string refusal = refusalOf(item.queue).toStdString();
    if (*item.refusal == '\0')
      EXPECT_EQ(refusal, "") << item.name;
    else
      EXPECT_NE(refusal.find(item.refusal), std::string::npos) << item.name << ": " << refusal;
  }
}

TEST(Writer, DerivedWritersReplaceSingleElements) {
  QBuffer buffer;
  buffer.open(QIODevice::WriteOnly);
  ShoutingWriter writer(&buffer, kWorkspaceDocument);
  CommentStruct comment;
  comment.commentValue = QStringLiteral("HI");
  writer.setMiscParms(QStringLiteral("s"), {});
  writer.addComment(QStringLiteral("s"), comment);
  writer.addComment(QStringLiteral("lost"), comment);
  EXPECT_EQ(writer.getUnwrittenDocuments(), QStringList{"lost"});
  writer.writeDocument();
  EXPECT_TRUE(buffer.data().contains("</ORXSERVER>\n<!-- sections of  -->\n<GLOBAL_PARAMETERS>"));
  EXPECT_TRUE(
      buffer.data().contains("<SUBDOCUMENT\n  NAME=\"s\"\n>\n<!-- sections of s -->\n<GLOBAL_PARAMETERS>\n"
                             "</GLOBAL_PARAMETERS>\n<COMMENTS>\n<!-- HI -->\n</COMMENTS>\n"));
  EXPECT_FALSE(buffer.data().contains("lost"));
}
