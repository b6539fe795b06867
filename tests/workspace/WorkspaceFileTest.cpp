#include "DocumentContent.h"
#include <transform/workspace/DocumentCopy.h>
#include <transform/workspace/RawLines.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceFile.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/WorkspaceLossReport.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <QTextCodec>
#include <gtest/gtest.h>

namespace {

// Reads a file, writes it again over itself, and answers what the reading gave.
DocumentContent rewritten(const QString& fileName, QString& error) {
  XMLComponentReader reader;
  QStringList header;
  WorkspaceFile::read(reader, fileName, header);
  const WorkspaceFile file(fileName);
  EXPECT_EQ(file.headerLines(), header);
  file.save(
      fileName, reader.GetDocumentType(), [&](XMLComponentWriter& writer) { copyDocument(reader, writer); },
      error);
  return contentOf(reader);
}

}  // namespace

TEST(WorkspaceFile, SavingKeepsWhatSurroundsTheXml) {
  DocumentContent content = randomContent(11, 2);
  // Longer than any buffer, of characters that have a line feed's byte in either half.
  QString& longest = content.documents[QString()].comments[0].commentValue;
  for (int i = 0; i < 200001; ++i)
    longest += QString(QChar(0x0a41)) + QChar(0x410a) + QLatin1Char('x');
  for (const char* const encoding : {"UTF-8", "windows-1252", "UTF-16LE", "UTF-16BE"}) {
    SCOPED_TRACE(encoding);
    const ScratchFile file("");
    WorkspaceFile fresh;
    ASSERT_TRUE(fresh.setEncoding(encoding));
    const QStringList header{"GUI TEXT A a:", QString::fromUtf8("MACRO B \xc3\xa9\xe2\x82\xac"), ""};
    fresh.setHeaderLines(header);
    QString error;
    ASSERT_TRUE(fresh.save(
        file.name(), content.type, [&](XMLComponentWriter& writer) { queueContent(content, writer); },
        error));
    const QByteArray bytes = file.content();
    EXPECT_EQ(WorkspaceFile::recognise(file.name()), WorkspaceFile::Form::Workspace);
    EXPECT_EQ(WorkspaceFile(file.name()).headerLines(), header);
    expectSame(rewritten(file.name(), error), content);
    EXPECT_EQ(error.toStdString(), "");
    EXPECT_TRUE(file.content() == bytes);
  }
}

TEST(WorkspaceFile, LineEndsRawLinesAndWhatFollowsAreKept) {
  const QByteArray start = QByteArray("# first\r\n").repeated(20000);
  const QByteArray end =
      "a line between\r\n  #!START_HEADER of all\nMACRO A \xe9\r\n#! END_HEADER now\r\nFACTORY_DEF * "
      "X\r\n\r\n#! "
      "END_HEADER\r\n\xff";
  QByteArray xml = written(randomContent(2, 1), "ISO-8859-1");
  xml = "#! " + xml.trimmed().replace("\n", "\r\n#! ") + "\r\n";
  const ScratchFile file(start + xml + end);
  QString error;
  rewritten(file.name(), error);
  EXPECT_EQ(error.toStdString(), "");
  EXPECT_TRUE(file.content() == start + xml + end) << file.content().left(300).toStdString();
}

TEST(WorkspaceFile, PlainXmlStaysPlainXml) {
  const DocumentContent content = randomContent(4, 2);
  const ScratchFile file(written(content, "UTF-16"));
  QString error;
  const QByteArray bytes = file.content().replace(QByteArray("U\0T\0F\0-\0001\0006\0", 12),
                                                  QByteArray("U\0T\0F\0-\0001\0006\0L\0E\0", 16));
  expectSame(rewritten(file.name(), error), content);
  EXPECT_EQ(error.toStdString(), "");
  EXPECT_TRUE(file.content() == bytes);
}

TEST(WorkspaceFile, WhatStoodThereSurvivesEveryFailure) {
  const ScratchFile file("#! <WORKSPACE/>\n");
  const auto broken = [](XMLComponentWriter& writer) { writer.setMiscParms(QString(), {{"a b", ""}}); };
  const auto whole = [](XMLComponentWriter&) {};
  QString error;
  EXPECT_FALSE(WorkspaceFile(file.name()).save(file.name(), kWorkspaceDocument, broken, error));
  EXPECT_TRUE(error.contains(QLatin1String("no name of XML")) && error.contains(file.name()))
      << error.toStdString();
  for (const char* const line : {"a\nb", "  #!END_HEADER", "#! END_HEADER x"}) {
    WorkspaceFile copy(file.name());
    copy.setHeaderLines({QLatin1String(line)});
    EXPECT_FALSE(copy.save(file.name(), kWorkspaceDocument, whole, error)) << line;
  }
  EXPECT_EQ(file.content().toStdString(), "#! <WORKSPACE/>\n");
  EXPECT_FALSE(WorkspaceFile().save(QStringLiteral("/nowhere/x.orw"), kWorkspaceDocument, whole, error));
  EXPECT_TRUE(error.contains(QLatin1String("/nowhere/x.orw")));
  QFile full(QStringLiteral("/dev/full"));
  if (full.open(QIODevice::WriteOnly | QIODevice::Unbuffered)) {
    EXPECT_FALSE(WorkspaceFile().save(full.fileName(), kWorkspaceDocument, whole, error));
    EXPECT_FALSE(WorkspaceFile().write(full, kWorkspaceDocument, whole, error));
  }
  WorkspaceFile file16;
  EXPECT_FALSE(file16.setEncoding("UTF-32") || file16.setEncoding("nonsense"));
}

TEST(VersionStore, FurtherVersionsLeaveTheEarlierBytesAlone) {
  QTemporaryDir folder;
  const QString name = folder.filePath(QStringLiteral("t.ort"));
  const VersionStore store(name);
  QString error;
  QByteArray earlier;
  std::vector<DocumentContent> contents;
  for (int version = 1; version <= 3; ++version) {
    contents.push_back(randomContent(static_cast<unsigned>(version), 1));
    const QStringList fields{QString::fromUtf8("N\xc3\xa9"), QString::number(version), "Cat", "{12-34}"};
    ASSERT_TRUE(store.insert(fields, {"FACTORY_DEF a", ""}, written(contents.back()), error))
        << error.toStdString();
    const QByteArray bytes = readAll(name);
    EXPECT_TRUE(bytes.startsWith("# ORW custom transformers\n# TRANSFORMER_BEGIN N\xc3\xa9,"));
    EXPECT_TRUE(bytes.endsWith(earlier));
    earlier = bytes.mid(bytes.indexOf('\n') + 1);
  }
  const QList<VersionInfo> versions = XMLComponentReader::getVersions(name, error);
  ASSERT_EQ(versions.size(), 3);
  for (int i = 0; i < 3; ++i) {
    const VersionInfo& info = versions[i];
    EXPECT_EQ(info.version, 3 - i);
    EXPECT_EQ(info.name, QString::fromUtf8("N\xc3\xa9"));
    EXPECT_EQ(info.guid.toStdString(), "12-34");
    const DocumentContent& content = contents[static_cast<std::size_t>(2 - i)];
    XMLComponentReader reader;
    QStringList header;
    QByteArray before;
    QByteArray behind;
    reader.ReadVersionedInput(name, info.byteOffset, info.byteLength, true, header, before, behind);
    expectSame(contentOf(reader), content);
    EXPECT_EQ(before.size(), info.byteOffset);
    EXPECT_EQ(before.size() + info.byteLength + behind.size(), QFileInfo(name).size());
    EXPECT_EQ(reader.GetDocumentLine(QString()), info.startLine + 2);
    reader.StripAndReadInput(name, info.startLine);
    expectSame(contentOf(reader), content);
    EXPECT_EQ(reader.GetDocumentLine(QString()), info.startLine + 2);
  }
  XMLComponentReader reader;
  QStringList header;
  WorkspaceFile::read(reader, name, header);
  expectSame(contentOf(reader), contents.back());

  const QByteArray document = written(contents[0]);
  const std::pair<QStringList, QByteArray> refused[] = {
      {{"a,b", "4", "c"}, document}, {{"a", "4", "c\nd"}, document},
      {{"a", "4"}, document},        {{"a", "x", "c"}, document},
      {{"a", "0", "c"}, document},   {{QString::fromUtf8("N\xc3\xa9"), "2", "c"}, document},
      {{"a", "4", "c"}, "<X/>"}};
  for (const auto& [fields, bytes] : refused) {
    EXPECT_FALSE(store.insert(fields, {}, bytes, error)) << fields.join(QLatin1Char('|')).toStdString();
    EXPECT_FALSE(error.isEmpty());
  }
  EXPECT_FALSE(store.insert({"a", "4", "c"}, {"TRANSFORMER_END"}, document, error));
  EXPECT_TRUE(readAll(name).endsWith(earlier));
  const ScratchFile other("#! <WORKSPACE/>\n");
  EXPECT_FALSE(VersionStore(other.name()).insert({"a", "4", "c"}, {}, document, error));
}

TEST(VersionStore, OpeningLinesAndPlacesThatAreOff) {
  const QByteArray bytes =
      "# TRANSFORMER_BEGIN Foo,0,Cat,{1234}\n# TRANSFORMER_BEGIN inner,5,x\n# #! <?xml version=\"1.0\"?>\n"
      "# #! <TRANSFORMER/>\n# TRANSFORMER_END\n# TRANSFORMER_BEGIN too,few\n# TRANSFORMER_BEGIN Bar, 2 "
      ",Cat\n";
  const ScratchFile file(bytes);
  QString error;
  const QList<VersionInfo> versions = XMLComponentReader::getVersions(file.name(), error);
  ASSERT_EQ(versions.size(), 2);
  EXPECT_EQ(versions[0].version, 1);
  EXPECT_EQ(versions[0].guid.toStdString(), "1234");
  EXPECT_EQ(versions[0].startLine, 5);
  EXPECT_EQ(versions[1].version, 2);
  XMLComponentReader reader;
  QStringList header;
  QByteArray before;
  QByteArray behind;
  const qint64 length = versions[0].byteLength;
  reader.ReadVersionedInput(file.name(), 0, length, true, header, before, behind);
  EXPECT_EQ(reader.GetDocumentType(), kTransformerDocument);
  EXPECT_EQ(reader.GetDocumentLine(QString()), 4);
  const std::pair<qint64, qint64> places[] = {
      {-1, 5}, {0, 0}, {0, -1}, {bytes.size(), 1}, {1, bytes.size()}, {5, INT64_MAX}, {INT64_MAX, INT64_MAX}};
  for (const auto& [offset, size] : places) {
    EXPECT_THROW(reader.ReadVersionedInput(file.name(), offset, size, true, header, before, behind),
                 WorkspaceLoaderException);
  }
  EXPECT_TRUE(XMLComponentReader::getVersions(QStringLiteral("/nowhere/x"), error).isEmpty());
  EXPECT_EQ(error.toStdString(), "File Error!\nCould not open file: /nowhere/x");
}

TEST(RawLines, StrayLinesAndMarksOfMerges) {
  // `found`: line and, for a conflict, "!"
  const std::tuple<QByteArray, const char*> cases[] = {
      {"note\n#! <W/>\n\nmore\n#! START_HEADER\nMACRO A 1\n=======\n#! END_HEADER\n#! x\nbehind\n#! y\n",
       "9"},
      {"#! <W\n\n#!\n  two \n#!A='1'\n#! />\n", "4 5"},
      {"#! <W\n<<<<<<< a\n#! A='1'\n|||||||\r\n=======\n#! A='2'\n>>>>>>> b\n#! />\n=======\n",
       "2! 4! 5! 7!"},
      {"<W\n<<<<<<<\nA='1'\n=======\n>>>>>>>\n/>", "2! 4! 5!"},
      {"#! START_HEADER\n<<<<<<<<\n>>>>>>>\n=======\n", "1 3!"},
  };
  for (const auto& [bytes, wantedFound] : cases) {
    for (const bool isWide : {false, true}) {
      const QString text = QString::fromLatin1(bytes);
      const ScratchFile file(isWide ? QTextCodec::codecForName("UTF-16BE")->fromUnicode(text) : bytes);
      QStringList found;
      for (const RawLine& line : RawLine::find(file.name()))
        found.append(QString::number(line.line) + (line.kind == RawLine::Kind::Conflict ? "!" : ""));
      EXPECT_EQ(found.join(' ').toStdString(), wantedFound) << bytes.toStdString();
    }
  }
}

TEST(LossReport, NamesEachLossWithItsLine) {
  const ScratchFile file(
      "#! <OTHER A='kept'>\n"
      "#! <CONSTANTS><CONSTANT CONST_VALUE='1'/>\n"
      "#! <PARAMETER_CONSTANT/></CONSTANTS>\n"
      "#! <TRANSFORMERS X='1'>\n"
      "#! <TRANSFORMER ENABLED='yes' IDENTIFIER='007' POSITION='5 6' BOUNDING_RECT='5 7 1 0' OWN='1'>\n"
      "#! <XFORM_PARM CUSTOM_PROMPT='p' ALWAYS_PROMPT_PARM='false'/>\n"
      "#! <XFORM_PARM CUSTOM_PROMPT=''><DEEP/></XFORM_PARM>\n"
      "#! <STRANGE/></TRANSFORMER></TRANSFORMERS>\n"
      "#! <FEATURE_TYPES><FEATURE_TYPE DYNAMIC_SCHEMA_ATTRIBUTES_TO_REMOVE='\"a\"b'/>\n"
      "#! <FEATURE_TYPE DYNAMIC_SCHEMA_ATTRIBUTES_TO_REMOVE=' \"a\"\"\" ,b\",c'/></FEATURE_TYPES>\n"
      "#! <ATTR_LINKS><ATTR_LINK HIDDEN='true'/></ATTR_LINKS>\n"
      "#! text<ORXSERVER><DOCUMENT NAME='d'/></ORXSERVER><!-- note -->\n"
      "skipped\n"
      "#! <SUBDOCUMENTS><SUBDOCUMENT/><SUBDOCUMENT NAME='s'><DATASETS/></SUBDOCUMENT>\n"
      "#! <SUBDOCUMENT NAME='s'/></SUBDOCUMENTS><LOOKUP_TABLES><T/></LOOKUP_TABLES>\n"
      "#! </OTHER>\n");
  XMLComponentReader reader;
  QStringList header;
  reader.ReadInput(file.name(), header);
  QStringList losses;
  const WorkspaceLossReport report(reader);
  for (const auto& loss : report.losses())
    losses.append(QStringLiteral("%1 %2").arg(loss.line).arg(loss.describe()));
  EXPECT_EQ(losses.join(QLatin1Char('\n')).toStdString(),
            "1 the root element OTHER would become WORKSPACE\n"
            "2 the constant CONSTANT is not written\n"
            "3 the constant PARAMETER_CONSTANT is not written\n"
            "4 the attribute X of TRANSFORMERS is not known\n"
            "5 the attribute ENABLED of TRANSFORMER has a malformed value: yes\n"
            "5 the attribute POSITION of TRANSFORMER would become 5 7, the corner of its rectangle\n"
            "5 the attribute OWN of TRANSFORMER is not known\n"
            "6 the attribute CUSTOM_PROMPT of XFORM_PARM is only read\n"
            "7 the element DEEP is not known here\n"
            "8 the element STRANGE is not known here\n"
            "9 the attribute DYNAMIC_SCHEMA_ATTRIBUTES_TO_REMOVE of FEATURE_TYPE has a malformed value: "
            "\"a\"b\n"
            "11 the attribute HIDDEN of ATTR_LINK is not known\n"
            "12 the element DOCUMENT is not known here\n"
            "12 text is not kept\n"
            "12 a comment is not kept\n"
            "14 a sub-document has no name\n"
            "14 the element DATASETS is not known here\n"
            "15 there is an earlier sub-document of the name s\n"
            "15 the element T is not known here");
}
