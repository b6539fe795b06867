// The commands that look at documents or rewrite them.
#include <tests/cli/OrxtProcess.h>
#include <tests/support/QtPrinters.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>

#include <sys/stat.h>

namespace {

const QByteArray kSmall = readAll(QStringLiteral(ORX_SOURCE_DIR "/tests/data/documents/small.orw"));

const QByteArray kVersions = readAll(QStringLiteral(ORX_SOURCE_DIR "/tests/data/documents/versions.ort"));

// The small document with something in it that no canonical form holds.
QByteArray withLosses() {
  return QByteArray(kSmall)
      .replace(
          "#! <TRANSFORMERS>\n",
          "#! <CONSTANTS><CONSTANT IDENTIFIER=\"9\" CONST_VALUE=\"x\"/></CONSTANTS>\n#! <TRANSFORMERS>\n")
      .replace("IDENTIFIER=\"2\"", "IDENTIFIER=\"2\" WHIM=\"x\"")
      .replace("KEYWORD=\"CSV_1\" ENABLED", "KEYWORD=\"CSV_1\" FANOUT=\"true\" ENABLED")
      .replace("#! <BOOKMARKS>", "#! <ODDITIES/><BOOKMARKS>");
}

QJsonArray infoJson(const QStringList& files, const QString& folder = QString(),
                    const QByteArray& input = QByteArray()) {
  const Outcome run = orxt(QStringList{"info", "--json"} + files, folder, QString(), input);
  EXPECT_EQ(run.status, 0) << run.err.toStdString();
  QJsonParseError error;
  const QJsonDocument json = QJsonDocument::fromJson(run.out.toUtf8(), &error);
  EXPECT_EQ(error.error, QJsonParseError::NoError) << error.errorString().toStdString();
  return json.array();
}

TEST(DocumentCommands, EndWithTheStatusThatFits) {
  QTemporaryDir folder;
  const QString good = samples().first();
  put(folder.filePath("empty.orw"), "");
  put(folder.filePath("cut.orw"), readAll(good).left(3000));
  put(folder.filePath("noise.orw"), QByteArray("\xff\x00\x1b[2J#!", 9).repeated(5000));
  put(folder.filePath("lossy.orw"), withLosses());
  put(folder.filePath("small.orw"), kSmall);
  put(folder.filePath("conflict.orw"), QByteArray(kSmall) + "\n<<<<<<< ours\n");
  put(folder.filePath("other.orw"), "<FOO/>");
  put(folder.filePath("versions.ort"), kVersions);
  put(folder.filePath("hollow.ort"), "# ORW custom transformers\n");
  const CommandCase cases[] = {
      {{"info", "--help"}, 0, "Example:", ""},
      {{"format", "--help"}, 0, "--drop", ""},
      {{"info"}, 2, "", "workspace"},
      {{"format"}, 2, "", "workspace"},
      {{"format", good, good}, 2, "", "give -i or --check"},
      {{"format", "-i", "-o", "x", good}, 2, "", "excludes"},
      {{"format", "--check", "-o", "x", good}, 2, "", "excludes"},
      {{"format", "-i", "-"}, 2, "", "in place"},
      {{"info", "missing.orw"}, 3, "", "missing.orw: error: cannot be read: "},
      {{"info", "--lang", "de", "missing.orw"}, 3, "", "missing.orw: error: lässt sich nicht lesen: "},
      {{"info", "--lang", "de", "cut.orw"}, 1, "", "Lesen des Arbeitsbereichs bei Zeile 112 "},
      {{"info", "--lang", "de", "small.orw"}, 0, "Eigener Transformer Inner, Version 4", ""},
      {{"info", "."}, 3, "", ".: error: "},
      {{"info", "empty.orw"}, 1, "", "empty.orw: error: "},
      {{"info", "cut.orw"}, 1, "", "cut.orw:"},
      {{"info", "noise.orw"}, 1, "", "noise.orw: error: "},
      {{"info", "hollow.ort"}, 1, "", "hollow.ort: error: "},
      {{"info", "-"}, 1, "", "standard input: error: "},
      {{"info", "missing.orw", "small.orw", "empty.orw"}, 3, "TITLE  Small", "empty.orw: error: "},
      {{"info", "small.orw"}, 0, "Custom transformer Inner, version 4", ""},
      {{"info", "versions.ort"}, 0, "Cleaner 1  Cleaning  aa-bb  line 9", ""},
      {{"format", "missing.orw"}, 3, "", "missing.orw: error: "},
      {{"format", "-i", "cut.orw"}, 1, "", "cut.orw:"},
      {{"format", "-i", "noise.orw"}, 1, "", "noise.orw: error: "},
      {{"format", "-i", "versions.ort"}, 1, "", "versions.ort: error: "},
      {{"format", "--drop", "conflict.orw"}, 1, "", "<<<<<<< ours"},
      {{"format", "--drop", "other.orw"}, 1, "", "no workspace document"},
      {{"format", "small.orw", "-o", "/dev/full"}, 3, "", "cannot be written: /dev/full: "},
      {{"format", "small.orw", "-o", "no/such/folder/x.orw"}, 3, "", "no/such/folder/x.orw"},
      {{"format", "--check", "small.orw"}, 1, "", "small.orw:2: error: "},
      {{"format", "--check", "lossy.orw"}, 1, "", "lossy.orw:4: error: "},
      {{"format", "--check", good, "small.orw", "missing.orw"}, 3, "", "small.orw:2: error: "},
  };
  const QByteArray cut = readAll(folder.filePath("cut.orw"));
  for (const CommandCase& test : cases)
    expectOutcome(test, folder.path());
  EXPECT_EQ(readAll(folder.filePath("cut.orw")), cut);
  EXPECT_EQ(readAll(folder.filePath("small.orw")), QByteArray(kSmall));
  EXPECT_EQ(readAll(folder.filePath("versions.ort")), QByteArray(kVersions));
  EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files | QDir::Hidden).size(), 9) << "a file was left behind";
}

TEST(DocumentCommands, TellTheFormOfAFileAlike) {
  const QByteArray xml =
      "<WORKSPACE TITLE='Tiny'><SUBDOCUMENTS><SUBDOCUMENT NAME='Inner'><SUBDOCUMENT_IOS>"
      "<SUBDOCUMENT_IO IDENTIFIER='1' NAME='IN' IS_SOURCE='true'/></SUBDOCUMENT_IOS></SUBDOCUMENT>"
      "</SUBDOCUMENTS></WORKSPACE>\n";
  const QByteArray notes = QByteArray("# a note that says nothing\n").repeated(10000);
  const QByteArray late = QByteArray(kVersions).replace("Cleaner,1,", "Cleaner,17,");
  const QByteArray wide(reinterpret_cast<const char*>(QString("#! " + xml).utf16()), 2 * (3 + xml.size()));
  const char* const none = "The file holds no workspace document.";
  const char* const onlyVersions =
      "The file begins with definitions of custom transformers, so it is no workspace.";
  const struct {
    QByteArray bytes;
    const char* refusal;  // empty: the file is read
    const char* shown;    // by info, which also shows versions; empty: refused as by the others
  } forms[] = {
      {"#! " + xml, "", "TITLE  Tiny"},
      {notes + "#! " + xml, "", "TITLE  Tiny"},
      {QByteArray("\n").repeated(200000) + "  #!   " + xml + notes, "", "TITLE  Tiny"},
      {"\xff\xfe" + wide, "", "TITLE  Tiny"},
      {xml, "", "TITLE  Tiny"},
      {"\xef\xbb\xbf" + xml, "", "TITLE  Tiny"},
      {"# a note\n#! " + xml + "# TRANSFORMER_BEGIN a,1,c\n", "", "TITLE  Tiny"},
      {QByteArray(600000, ' ') + xml, "", "TITLE  Tiny"},
      {kVersions + "#! " + xml, onlyVersions, "TITLE  second"},
      {kVersions, onlyVersions, "TITLE  second"},
      {late, onlyVersions, "TITLE  first"},
      {notes + late, onlyVersions, "TITLE  first"},
      {"# ORW custom transformers\n" + notes, onlyVersions, ""},
      {QByteArray("\n").repeated(200000) + xml, none, ""},
      {notes, none, ""},
      {notes + xml, none, ""},
      {"FACTORY_DEF * X\n", none, ""},
      {"<other/>\n", none, ""},
      {"<?xml version='1.0'?>\n<svg xmlns='http://www.w3.org/2000/svg'/>\n", none, ""},
      {"#! <Workspace/>\n", none, ""},
      {"", none, ""},
  };
  QTemporaryDir folder;
  for (const auto& form : forms) {
    put(folder.filePath("file"), form.bytes);
    const std::string begin = form.bytes.left(60).toStdString() + " ...\n";
    const QStringList commands[] = {{"info", "file"},
                                    {"format", "--drop", "file"},
                                    {"validate", "-q", "file"},
                                    {"generate", "file"},
                                    {"extract", "file", "Inner", "-o", "x"}};
    for (const QStringList& command : commands) {
      const Outcome run = orxt(command, folder.path());
      const bool isInfo = command.first() == "info";
      const bool isRead = isInfo ? *form.shown : !*form.refusal;
      const std::string what = command.first().toStdString() + ": " + begin + run.err.toStdString();
      EXPECT_EQ(run.status, isRead ? 0 : 1) << what;
      const QString said = QString("file: error: ") + form.refusal;
      EXPECT_TRUE(isRead || run.err.startsWith(said)) << what;
      EXPECT_TRUE(!isRead || !isInfo || run.out.contains(form.shown)) << what << run.out.toStdString();
      QFile::remove(folder.filePath("x"));
    }
  }
}

TEST(DocumentCommands, StandardOutputThatTakesNothingIsAnError) {
  for (const char* const command : {"info", "format", "generate", "transformers list"}) {
    const QStringList arguments = QString(command).split(' ') + samples().mid(0, *command != 't');
    const Outcome run = orxt(arguments, QString(), "/dev/full");
    EXPECT_EQ(run.status, 3) << command;
    EXPECT_TRUE(run.err.contains("standard output")) << run.err.toStdString();
  }
}

TEST(FormatCommand, TheSamplesAreCanonical) {
  const Outcome check = orxt(QStringList{"format", "--check"} + samples());
  EXPECT_EQ(check.status, 0) << check.err.toStdString();
}

TEST(FormatCommand, ListsEveryLossAndWritesNothingUnlessTold) {
  QTemporaryDir folder;
  const QString file = folder.filePath("lossy.orw");
  put(file, withLosses());
  const char* const losses[] = {"lossy.orw:4: %1: the attribute FANOUT ", "lossy.orw:10: %1: the constant ",
                                "lossy.orw:12: %1: the attribute WHIM ",
                                "lossy.orw:20: %1: the element ODDITIES "};
  for (const QStringList& arguments :
       {QStringList{"-i"}, QStringList{"-o", "out.orw"}, QStringList{"--check"}, QStringList()}) {
    const Outcome run = orxt(QStringList{"format", "lossy.orw"} + arguments, folder.path());
    EXPECT_EQ(run.status, 1);
    EXPECT_TRUE(run.out.isEmpty());
    for (const char* const loss : losses)
      EXPECT_TRUE(run.err.contains(QString(loss).arg("error"))) << loss << "\n" << run.err.toStdString();
    EXPECT_EQ(run.err.count('\n'), 5) << run.err.toStdString();
    for (const char* const rule : {"lost-content", "unknown-attribute", "unknown-element"})
      EXPECT_TRUE(run.err.contains(QString(" [%1]\n").arg(rule))) << rule;
  }
  EXPECT_EQ(readAll(file), withLosses());
  EXPECT_FALSE(QFile::exists(folder.filePath("out.orw")));

  const Outcome dropped = orxt({"format", "--drop", "-i", "lossy.orw"}, folder.path());
  EXPECT_EQ(dropped.status, 0);
  for (const char* const loss : losses)
    EXPECT_TRUE(dropped.err.contains(QString(loss).arg("warning"))) << loss << "\n"
                                                                    << dropped.err.toStdString();
  const Outcome small = orxt({"format", "-"}, QString(), QString(), kSmall);
  EXPECT_EQ(readAll(file), small.out.toUtf8());
}

TEST(FormatCommand, KeepsWhatStandsAroundTheDocument) {
  QTemporaryDir folder;
  const QByteArray canonical = orxt({"format", "-"}, QString(), QString(), kSmall).out.toUtf8();
  ASSERT_TRUE(canonical.contains("#!   TITLE=\"Small\"\n"));
  ASSERT_TRUE(canonical.endsWith("MACRO A b\n# kept\n#! END_HEADER\nbehind the header\n"));
  const QByteArray latin = QByteArray(kSmall)
                               .replace("UTF-8", "ISO-8859-1")
                               .replace("Small",
                                        "Gr\xf6\xdf"
                                        "e");
  const QByteArray latinCanonical = QByteArray(canonical)
                                        .replace("UTF-8", "ISO-8859-1")
                                        .replace("Small",
                                                 "Gr\xf6\xdf"
                                                 "e");
  const struct {
    const char* name;
    QByteArray before;
    QByteArray after;
  } cases[] = {
      {"line feeds", kSmall, canonical},
      {"carriage returns", QByteArray(kSmall).replace("\n", "\r\n"),
       QByteArray(canonical).replace("\n", "\r\n")},
      {"lines in front", QByteArray("front\n") + kSmall, "front\n" + canonical},
      {"byte order mark", QByteArray("\xef\xbb\xbf") + kSmall, "\xef\xbb\xbf" + canonical},
      {"an 8-bit encoding", latin, latinCanonical},
  };
  for (const auto& test : cases) {
    const QString file = folder.filePath("file.orw");
    put(file, test.before);
    ASSERT_TRUE(QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner));
    EXPECT_EQ(orxt({"format", "-i", file}).status, 0) << test.name;
    EXPECT_EQ(readAll(file), test.after) << test.name;
    struct stat first {};
    struct stat second {};
    ASSERT_EQ(stat(file.toLocal8Bit().constData(), &first), 0);
    EXPECT_EQ(first.st_mode & 0777, 0600u) << test.name;
    EXPECT_EQ(orxt({"format", "--check", file}).status, 0) << test.name;
    EXPECT_EQ(orxt({"format", "-i", file}).status, 0) << test.name;
    ASSERT_EQ(stat(file.toLocal8Bit().constData(), &second), 0);
    EXPECT_EQ(first.st_ino, second.st_ino) << test.name << ": a canonical file was replaced";
  }
}

TEST(InfoCommand, DescribesADocumentAsJson) {
  const QJsonArray entries = infoJson({"-"}, QString(), kSmall);
  const char* const expected = R"([{
    "file": "standard input", "form": "workspace", "documentType": "WORKSPACE", "encoding": "UTF-8",
    "headerLines": 2, "attributes": {"TITLE": "Small", "USAGE": "none"}, "versions": [],
    "datasets": [{"role": "READER", "keyword": "CSV_1", "format": "CSV", "dataset": "in.csv", "name": "in",
                  "enabled": true, "line": 3}],
    "featureTypes": [{"role": "READER", "name": "row", "node": "", "keyword": "CSV_1", "geometry": "",
                      "attributes": 2, "enabled": false, "line": 4}],
    "dataTypes": 0, "geometryTypes": 0, "server": {"services": [], "repositories": [], "items": []},
    "globalParameters": [
      {"name": "PLACE", "type": "TEXT_ENCODED", "prompt": "Where It Is", "optional": true, "password": false,
       "standAlone": false, "server": false, "default": "an<space>der", "line": 7},
      {"name": "SECRET", "type": "PASSWORD", "prompt": "Pass Word", "optional": false, "password": true,
       "standAlone": false, "server": true, "default": null, "line": 8}],
    "transformers": [
      {"type": "SubDocumentTransformer", "subDocument": "Inner", "count": 1, "disabled": 0, "versions": [0]},
      {"type": "ValueAssigner", "count": 3, "disabled": 1, "versions": [2, 10]}],
    "featureLinks": {"count": 2, "disabled": 1}, "attributeLinks": 0, "constants": 0, "comments": [],
    "bookmarks": [{"name": "Start", "description": "", "line": 19}],
    "breakpoints": [{"name": "stop", "link": 6, "enabled": true, "line": 18}],
    "subDocuments": [{
      "name": "Inner", "version": 4, "attributes": {"VERSION": "4"},
      "ports": [{"name": "IN", "kind": "input", "published": true},
                {"name": "ROUND", "kind": "loop", "published": false}],
      "globalParameters": [], "transformers": [], "featureLinks": {"count": 0, "disabled": 0},
      "attributeLinks": 0, "constants": 0, "comments": [{"text": "well", "line": 22}], "bookmarks": [],
      "breakpoints": []}]
  }])";
  const QJsonDocument wanted = QJsonDocument::fromJson(expected);
  ASSERT_FALSE(wanted.isNull());
  EXPECT_EQ(QJsonDocument(entries).toJson().toStdString(), wanted.toJson().toStdString());
}

TEST(InfoCommand, NeverPrintsPasswordsOrTerminalControls) {
  const QByteArray evil = QByteArray(kSmall).replace("Small",
                                                     "a\xc2\x9b"
                                                     "31m\xe2\x80\xae b&#10;c");
  const Outcome run = orxt({"info", "-"}, QString(), QString(), evil);
  EXPECT_EQ(run.status, 0);
  EXPECT_TRUE(run.out.contains("TITLE  a31m b c\n")) << run.out.toStdString();
  EXPECT_TRUE(run.out.contains("PLACE   TEXT_ENCODED  an der    Where It Is\n")) << run.out.toStdString();
  EXPECT_TRUE(run.out.contains("SECRET  PASSWORD      ********  Pass Word\n")) << run.out.toStdString();
  EXPECT_FALSE(run.out.contains("hunter2"));
}

TEST(InfoCommand, ListsStoredVersionsAndSkipsWhatCannotBeRead) {
  QTemporaryDir folder;
  put(folder.filePath("cleaner.ort"), kVersions);
  const Outcome mixed = orxt({"info", "--json", "missing.ort", "cleaner.ort"}, folder.path());
  EXPECT_EQ(mixed.status, 3);
  const QJsonArray files = QJsonDocument::fromJson(mixed.out.toUtf8()).array();
  ASSERT_EQ(files.size(), 1);
  EXPECT_EQ(files[0]["form"].toString() + files[0]["attributes"]["TITLE"].toString(),
            QString("versionssecond"));
  const QJsonValue first = files[0]["versions"].toArray().at(1);
  EXPECT_EQ(first["version"].toInt(), 1);
  EXPECT_EQ(first["guid"].toString(), QString("aa-bb"));
  EXPECT_EQ(first["line"].toInt(), 9);
}

}  // namespace
