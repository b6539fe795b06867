#include "DocumentContent.h"
#include <platform/orxutil/Decipher.h>
#include <platform/session/ORXString.h>
#include <platform/session/ORXStringArray.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLDatasetElement.h>
#include <transform/workspace/XMLFeatureTypeElement.h>
#include <transform/workspace/XMLGlobalParamElement.h>
#include <transform/workspace/writing/XmlText.h>

#include <QDir>
#include <QFile>
#include <QTextCodec>
#include <gtest/gtest.h>
#include <xercesc/dom/DOM.hpp>

namespace {

const QString kMain;

// A main document with one section.
std::unique_ptr<XMLComponentReader> readSection(const char* section, const QByteArray& elements) {
  return readBytes(QByteArray("<WORKSPACE><") + section + '>' + elements + "</" + section + "></WORKSPACE>");
}

TransformerStruct transformer(const QByteArray& attributes, const QByteArray& children = QByteArray()) {
  return readSection("TRANSFORMERS", "<TRANSFORMER " + attributes + '>' + children + "</TRANSFORMER>")
      ->GetTransformerList(kMain)
      .front();
}

QStringList temporaryFiles() {
  return QDir(QDir::tempPath()).entryList({QStringLiteral("kx-*")}, QDir::Files | QDir::Hidden);
}

}  // namespace

TEST(Reading, AbsentAttributesTakeTheirDefaults) {
  EXPECT_TRUE(transformer("") == TransformerStruct());
  const auto features = readSection("FEATURE_TYPES", "<FEATURE_TYPE/>");
  EXPECT_TRUE(features->GetFeatureTypeList().front() == FeatureTypeStruct());
  EXPECT_EQ(features->GetFeatureTypeList().front().mergeFilterType.toStdString(), "FILTER_TYPE_GLOB");
  EXPECT_EQ(features->GetFeatureTypeList().front().schemaAttributeSource, 1);
  const auto bookmarks = readSection("BOOKMARKS", "<BOOKMARK/>");
  EXPECT_EQ(bookmarks->GetBookmarkList(kMain).front().contents.toStdString(), "<OLD_BOOKMARK>");
  EXPECT_EQ(bookmarks->GetBookmarkList(kMain).front().order, 0.0);
  EXPECT_EQ(transformer("").order, -1.0);
  EXPECT_TRUE(transformer("").enabled);
  EXPECT_FALSE(readSection("BREAKPOINTS", "<BREAKPOINT/>")->GetBreakpointList(kMain).front().enabled);
  const auto roles =
      readSection("DATASETS", "<DATASET IS_SOURCE='true' ROLE=''/><DATASET/><DATASET ROLE='X'/>");
  QStringList read;
  for (const DatasetStruct& dataset : roles->GetDatasetList())
    read.append(dataset.role);
  EXPECT_EQ(read, (QStringList{"READER", "WRITER", "X"}));
}

TEST(Reading, NonNormalForms) {
  const struct {
    const char* attributes;
    std::function<bool(const TransformerStruct&)> holds;
  } cases[] = {
      {"ENABLED='false'", [](const auto& t) { return !t.enabled; }},
      {"ENABLED='FALSE'", [](const auto& t) { return t.enabled; }},
      {"ENABLED=''", [](const auto& t) { return t.enabled; }},
      {"PARMS_EDITED='yes'", [](const auto& t) { return !t.parmsEdited; }},
      {"PARMS_EDITED='true'", [](const auto& t) { return t.parmsEdited; }},
      {"VERSION=' +07 '", [](const auto& t) { return t.version == 7; }},
      {"VERSION='-3'", [](const auto& t) { return t.version == -3; }},
      {"VERSION='0x10'", [](const auto& t) { return t.version == 0; }},
      {"VERSION='7.5'", [](const auto& t) { return t.version == 0; }},
      {"IDENTIFIER='99999999999'", [](const auto& t) { return t.identifier == -1; }},
      {"IDENTIFIER='12x'", [](const auto& t) { return t.identifier == -1; }},
      {"IDENTIFIER='+-5'", [](const auto& t) { return t.identifier == -1; }},
      {"ORDER='1e3'", [](const auto& t) { return t.order == 1000; }},
      {"ORDER='nan'", [](const auto& t) { return t.order == -1; }},
      {"ORDER='inf'", [](const auto& t) { return t.order == -1; }},
      {"ORDER='1,5'", [](const auto& t) { return t.order == -1; }},
      {"POSITION='  1.5   -2 '", [](const auto& t) { return t.position == QPointF(1.5, -2); }},
      {"POSITION='1'", [](const auto& t) { return t.position == QPointF(); }},
      {"POSITION='1 2 3'", [](const auto& t) { return t.position == QPointF(); }},
      {"BOUNDING_RECT='1 2 3 4'", [](const auto& t) { return t.boundingRect == QRectF(1, 2, 3, 4); }},
      {"BOUNDING_RECT='1 2 3'", [](const auto& t) { return t.boundingRect == QRectF(); }},
      {"TYPE='a&#10;b\nc'", [](const auto& t) { return t.type == QLatin1String("a\nb c"); }},
      {"TYPE='Inspector'", [](const auto& t) { return t.kind == TransformerKind::Inspector; }},
      {"TYPE='SubDocumentTransformer'", [](const auto& t) { return t.kind == TransformerKind::SubDocument; }},
      {"TYPE='inspector'", [](const auto& t) { return t.kind == TransformerKind::Ordinary; }},
  };
  for (const auto& item : cases)
    EXPECT_TRUE(item.holds(transformer(item.attributes))) << item.attributes;
}

TEST(Reading, TransformersTakeNamePromptsListFormsAndTheUpgrade) {
  XMLComponentReader reader;
  reader.SetPromptDefinitionSource([](const QString& type, int version, const QString& parameter) {
    return type == QLatin1String("T") && version == 3 && parameter == QLatin1String("KNOWN")
               ? QStringLiteral("GUI INTEGER KNOWN How many:")
               : QString();
  });
  reader.ReadBufferInput(
      "<WORKSPACE><TRANSFORMERS><TRANSFORMER TYPE='T' VERSION='3'>"
      "<XFORM_PARM PARM_NAME='GROUP_BY' PARM_VALUE='a __KX_TYPE__ __kx_type__ __KX_TYPE__'/>"
      "<XFORM_ATTR ATTR_NAME='a{12}.b'/><XFORM_ATTR ATTR_NAME='a{}.b{0}'/><XFORM_ATTR ATTR_NAME='a{x}{'/>"
      "<XFORM_PARM PARM_NAME='KNOWN' PARM_VALUE='__KX_TYPE__' CUSTOM_PROMPT='Mine' "
      "ALWAYS_PROMPT_PARM='true'/>"
      "<XFORM_PARM PARM_NAME='OTHER' CUSTOM_PROMPT='Yours'/>"
      "<XFORM_PARM PARM_NAME='XFORMER_NAME' PARM_VALUE='Name'/>"
      "</TRANSFORMER></TRANSFORMERS></WORKSPACE>");
  const TransformerStruct record = reader.GetTransformerList(kMain).front();
  EXPECT_EQ(record.name.toStdString(), "Name");
  ASSERT_EQ(record.parameters.size(), 4);
  EXPECT_EQ(record.parameters[0].parmValue.toStdString(), "a orx_feature_type __kx_type__ orx_feature_type");
  EXPECT_EQ(record.parameters[1].parmValue.toStdString(), "__KX_TYPE__");
  EXPECT_EQ(record.parameters[1].promptLine.toStdString(), "GUI INTEGER KNOWN Mine");
  EXPECT_TRUE(record.parameters[1].alwaysPromptParm);
  EXPECT_EQ(record.parameters[2].promptLine.toStdString(), "GUI OPTIONAL TEXT OTHER Yours");
  ASSERT_EQ(record.attributes.size(), 3);
  EXPECT_EQ(record.attributes[0].listForm, AttributeListForm::Indexed);
  EXPECT_EQ(record.attributes[1].listForm, AttributeListForm::IndexFree);
  EXPECT_EQ(record.attributes[2].listForm, AttributeListForm::None);
}

TEST(Reading, SubDocumentsConstantsAndRootAttributes) {
  const auto reader = readBytes(
      "<ETL_TOOL A='1' DISABLE_VISUALIZERS='true'><CONSTANTS><CONSTANT CONST_VALUE='c'/>"
      "<PARAMETER_CONSTANT IDENTIFIER='4' CONST_VALUE='p'/></CONSTANTS>"
      "<SUBDOCUMENTS><SUBDOCUMENT NAME='b' X='y'><SUBDOCUMENT_IOS><SUBDOCUMENT_IO IDENTIFIER='9' "
      "IS_SOURCE='loop'/>"
      "<SUBDOCUMENT_IO IDENTIFIER='2' IS_SOURCE='true'/></SUBDOCUMENT_IOS></SUBDOCUMENT>"
      "<SUBDOCUMENT NAME='a'/><SUBDOCUMENT NAME='b' X='second'/></SUBDOCUMENTS></ETL_TOOL>");
  EXPECT_EQ(reader->GetDocumentType(), kToolDocument);
  EXPECT_TRUE(reader->AreVisualizersDisabled());
  EXPECT_EQ(reader->GetMiscParm(QStringLiteral("A")).toStdString(), "1");
  EXPECT_EQ(reader->GetMiscParm(QStringLiteral("B"), QStringLiteral("none")).toStdString(), "none");
  EXPECT_FALSE(reader->HasMiscParm(QStringLiteral("B")));
  EXPECT_EQ(reader->GetSubDocParms(kMain).size(), 2);
  EXPECT_EQ(reader->GetSubDocList(), (QStringList{"b", "a", "b"}));
  EXPECT_EQ(reader->GetSubDocParms(QStringLiteral("b")).value(QStringLiteral("X")).toStdString(), "y");
  EXPECT_TRUE(reader->GetSubDocParms(QStringLiteral("unknown")).isEmpty());
  EXPECT_TRUE(reader->GetTransformerList(QStringLiteral("unknown")).isEmpty());
  EXPECT_EQ(reader->GetConstantList(kMain).front().constValue.toStdString(), "c");
  EXPECT_EQ(reader->GetConstantList(kMain, true).front().identifier, 4);
  EXPECT_EQ(reader->GetSubDocumentIOList(QStringLiteral("b")).front().isSource, SubDocumentIOKind::Loop);
  const OrderedObjectList ports = reader->GetOrderedSubDocumentIOs(QStringLiteral("b"));
  ASSERT_EQ(ports.size(), 2u);
  EXPECT_EQ(ports[0].record.isSource, SubDocumentIOKind::Input);
  EXPECT_EQ(ports[1].key, 9);
}

TEST(Reading, WorkspaceFilesAreRecognisedByTheirFirstBytes) {
  const std::pair<QByteArray, bool> cases[] = {{"#! <WORKSPACE\n", true},
                                               {"# ORW custom transformers\n", true},
                                               {QByteArray(90, ' ') + "<WORKSPACE", true},
                                               {QByteArray(91, ' ') + "<WORKSPACE", false},
                                               {"<workspace>", false},
                                               {"", false}};
  for (const auto& [bytes, expected] : cases)
    EXPECT_EQ(XMLComponentReader::IsFileXMLWorkspace(ScratchFile(bytes).name()), expected)
        << bytes.toStdString();
  EXPECT_FALSE(XMLComponentReader::IsFileXMLWorkspace(QStringLiteral("/nowhere/at/all")));
}

TEST(Reading, FilesAreSplitAndLinesAreThoseOfTheFile) {
  const QByteArray bytes =
      "# a comment\r\n"
      "#! <?xml version=\"1.0\" encoding=\"UTF-8\" ?>\r\n"
      "  #!    <WORKSPACE>\r\n"
      "not XML\r\n"
      "#!<NO_BLANK>\r\n"
      "#! <TRANSFORMERS>\r\n"
      "#! <TRANSFORMER IDENTIFIER=\"1\"\r\n"
      "#!   TYPE=\"T\r\n"
      "#!  U\">\r\n"
      "#! <XFORM_PARM PARM_NAME=\"p\"/></TRANSFORMER>\r\n"
      "#! </TRANSFORMERS></WORKSPACE>\r\n"
      "#! START_HEADER\r\n"
      "GUI TEXT NAME The name:\r\n"
      "DEFAULT_MACRO NAME  some \xc3\xa9 value \r\n"
      "MACRO OTHER\r\n"
      "\r\n"
      "#!END_HEADER\r\n"
      "#! <BROKEN\r\n";
  const ScratchFile file(bytes);
  XMLComponentReader reader;
  QStringList header{QStringLiteral("before")};
  const QStringList filesBefore = temporaryFiles();
  reader.ReadInput(file.name(), header);
  EXPECT_EQ(temporaryFiles(), filesBefore);
  EXPECT_EQ(header,
            (QStringList{"before", "GUI TEXT NAME The name:",
                         QString::fromUtf8("DEFAULT_MACRO NAME  some \xc3\xa9 value "), "MACRO OTHER", ""}));
  EXPECT_EQ(reader.GetFirstHeaderLineNumber(), 13);
  const TransformerStruct record = reader.GetTransformerList(kMain).front();
  EXPECT_EQ(record.line, 7);
  EXPECT_EQ(record.type.toStdString(), "T U");
  EXPECT_EQ(record.parameters.front().line, 10);
  EXPECT_EQ(reader.GetDocumentLine(kMain), 3);

  QStringList lines;
  QHash<QString, QString> prompts;
  QHash<QString, QString> macros;
  const QString xml = XMLComponentReader::SplitWorkspace(file.name(), lines, &prompts, &macros);
  QFile xmlFile(xml);
  EXPECT_TRUE(
      readAll(xml).startsWith("<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\r\n<WORKSPACE>\r\n<TRANS"));
  EXPECT_EQ(xmlFile.permissions() & (QFile::ReadGroup | QFile::ReadOther | QFile::WriteOther), 0);
  EXPECT_TRUE(xmlFile.remove());
  EXPECT_EQ(prompts, (QHash<QString, QString>{{"NAME", "GUI TEXT NAME The name:"}}));
  EXPECT_EQ(macros,
            (QHash<QString, QString>{{"NAME", QString::fromUtf8("some \xc3\xa9 value ")}, {"OTHER", ""}}));
}

TEST(Reading, EncodingsAreDeclaredDetectedOrTheSystems) {
  const QString text = QString::fromUtf8("<WORKSPACE A=\"\xc3\xa9\xe2\x82\xac\"/>\n");
  const QByteArray utf8Mark = "\xef\xbb\xbf";
  const auto wide = [](const QString& content, const char* codec) {
    QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
    return QTextCodec::codecForName(codec)->fromUnicode(content.constData(), content.size(), &state);
  };
  const auto declared = [](const char* name) {
    return QStringLiteral("<?xml version=\"1.0\" encoding=\"%1\"?>\n").arg(QLatin1String(name));
  };
  const std::pair<const char*, QByteArray> cases[] = {
      {"the system's", text.toUtf8()},
      {"declared UTF-8", (declared("UTF-8") + text).toUtf8()},
      {"marked UTF-8", utf8Mark + text.toUtf8()},
      {"declared and marked UTF-8", utf8Mark + (declared("utf-8") + text).toUtf8()},
      {"no encoding in the declaration", ("<?xml version='1.0'?>" + text).toUtf8()},
      {"marked little endian", "\xff\xfe" + wide(text, "UTF-16LE")},
      {"declared, marked big endian", "\xfe\xff" + wide(declared("UTF-16") + text, "UTF-16BE")},
      {"declared little endian", wide(declared("UTF-16") + text, "UTF-16LE")},
  };
  for (const auto& [name, bytes] : cases) {
    EXPECT_EQ(readBytes(bytes)->GetMiscParm(QStringLiteral("A")), QString::fromUtf8("\xc3\xa9\xe2\x82\xac"))
        << name;
  }
  EXPECT_EQ(readBytes("<?xml version='1.0' encoding='ISO-8859-1'?><WORKSPACE A='\xe9'/>")
                ->GetMiscParm(QStringLiteral("A")),
            QString(QChar(0xe9)));
}

TEST(Reading, EmbeddedDocumentsAreFoundByLine) {
  const ScratchFile file(
      "# ORW custom transformers\n"
      "#! <?xml version=\"1.0\"?>\n#! <TRANSFORMER A=\"1\"/>\n"
      "# between\n"
      "#! <?xml version=\"1.0\"?>\n#! <TRANSFORMER A=\"2\">\n#! <TRANSFORMERS><TRANSFORMER/></TRANSFORMERS>\n"
      "#! </TRANSFORMER>\n");
  const std::pair<int, const char*> cases[] = {{1, "1"}, {4, "2"}};
  const QStringList filesBefore = temporaryFiles();
  XMLComponentReader reader;
  for (const auto& [skipped, value] : cases) {
    reader.StripAndReadInput(file.name(), skipped);
    EXPECT_EQ(reader.GetMiscParm(QStringLiteral("A")).toStdString(), value);
  }
  EXPECT_EQ(reader.GetTransformerList(kMain).front().line, 7);
  EXPECT_THROW(reader.StripAndReadInput(file.name(), 100), WorkspaceLoaderException);
  EXPECT_EQ(reader.getRootNode(), nullptr);
  EXPECT_EQ(temporaryFiles(), filesBefore);
}

TEST(Reading, EncipheredFilesAreReadFromAPlainCopy) {
  QString copy;
  ORW_setDecipherRoutine([&](const QString& fileName, const QString& plainCopy) {
    copy = plainCopy;
    put(plainCopy, "#! <WORKSPACE A='plain'/>\n");
    return readAll(fileName) == "CIPHER";
  });
  EXPECT_TRUE(ORW_hasDecipherRoutine());
  XMLComponentReader reader;
  QStringList header;
  reader.ReadInput(ScratchFile("CIPHER").name(), header);
  EXPECT_EQ(reader.GetMiscParm(QStringLiteral("A")).toStdString(), "plain");
  EXPECT_FALSE(copy.isEmpty() || QFile::exists(copy));
  reader.ReadInput(ScratchFile("#! <WORKSPACE A='own'/>").name(), header);
  ORW_setDecipherRoutine({});
  EXPECT_FALSE(ORW_hasDecipherRoutine() || ORW_decryptWorkspace("in", "out"));
  EXPECT_EQ(reader.GetMiscParm(QStringLiteral("A")).toStdString(), "own");
  EXPECT_FALSE(QFile::exists(copy));
}

TEST(Reading, ParserLevelAnswersForSingleElements) {
  const auto parser = IXMLComponentParser::create();
  const ScratchFile file("<A><B N='7' C='1, 0.5 0'/><C/><B N='x'/></A>");
  parser->ReadInput(ORXString(file.name()));
  auto* const root = parser->getRootNode();
  const auto items = parser->getChildItems(QStringLiteral("B"), root);
  ASSERT_EQ(items.size(), 2u);
  EXPECT_EQ(parser->getAttrInt(QStringLiteral("N"), items[0], 3), 7);
  EXPECT_EQ(parser->getAttrInt(QStringLiteral("N"), items[1], 3), 3);
  EXPECT_EQ(parser->getAttrString(QStringLiteral("Z"), items[1], QStringLiteral("none")).toStdString(),
            "none");
  EXPECT_EQ(dynamic_cast<XMLComponentParser&>(*parser).getAttrColour(QStringLiteral("C"), items[0]),
            (QStringList{"1", "0.5", "0"}));
  auto* const attribute = items[0]->getAttributes()->item(0);
  EXPECT_EQ(fromXml(attribute->getTextContent()), fromXml(attribute->getFirstChild()->getNodeValue()));
  EXPECT_EQ(attribute->getChildNodes()->getLength(), 1u);
  attribute->setNodeValue(u"changed");
  EXPECT_EQ(parser->getAttrString(fromXml(attribute->getNodeName()), items[0]).toStdString(), "changed");
  const ScratchFile noMarkup("plain\n<A/>");
  parser->ReadInput(noMarkup.name());
  EXPECT_EQ(parser->getRootNode(), nullptr);
}

TEST(Reading, AdaptersShowRecordsAsClosedStrings) {
  FeatureTypeStruct type;
  type.featureTypeName = QStringLiteral("roads");
  type.attributes.resize(2);
  type.attributes[0].attrName = "id";
  type.attributes[1].attrName = QString::fromUtf8("\xc3\xa9");
  type.attributes[1].attrType = "text";
  ORXString text;
  ORXStringArray names;
  const XMLFeatureTypeElement element(type);
  element.getAttributes(names);
  EXPECT_EQ(ORXToQStringList(names), (QStringList{"id", QString::fromUtf8("\xc3\xa9")}));
  EXPECT_TRUE(element.getAttrDataType(ORXString("\xc3\xa9"), text));
  EXPECT_STREQ(text.data(), "text");
  EXPECT_FALSE(element.getAttrDataType(ORXString("none"), text));
  EXPECT_STREQ(text.data(), "");
  element.getName(text);
  EXPECT_STREQ(text.data(), "roads");
  GlobalParameterStruct parameter;
  parameter.guiLine = QStringLiteral("GUI TEXT The_Name Give a name:");
  XMLGlobalParamElement(parameter).getParameterName(text);
  EXPECT_STREQ(text.data(), "The_Name");
  DatasetStruct dataset;
  dataset.isSource = true;
  dataset.keyword = QStringLiteral("K_1");
  XMLDatasetElement(dataset).getKeyword(text);
  EXPECT_STREQ(text.data(), "K_1");
  EXPECT_TRUE(XMLDatasetElement(dataset).isReader());
}
