#include "DocumentContent.h"

#include <QFile>
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
  EXPECT_EQ(written(content).toStdString(),
            readAll(ORX_SOURCE_DIR "/tests/data/documents/layout.xml").toStdString());
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
