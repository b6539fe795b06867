// The checks of mapping files as a person runs them: broken ones against what is to be said about them, sound
// ones against silence, and the ways to name what is to be checked.
#include <tests/cli/BrokenFiles.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

QString brokenMappingFiles() {
  return brokenFolder() + "/mapping-files";
}

QJsonArray lintJson(const QStringList& arguments, int status) {
  const Outcome run = orxt(QStringList{"lint", "--json", "--resources", sample("custom")} + arguments);
  EXPECT_EQ(run.status, status) << run.err.toStdString();
  return QJsonDocument::fromJson(run.out.toUtf8()).array();
}

TEST(Lint, SaysWhatIsWrongWithBrokenMappingFiles) {
  expectSaidOfBroken("lint", brokenMappingFiles(), ".mf", 9);
}

TEST(Lint, FindsNothingWrongWithWhatIsGenerated) {
  EXPECT_EQ(lintJson({sample("")}, 0), QJsonArray());
}

TEST(Lint, TellsTheKindOfAFileByNameAndContent) {
  QTemporaryDir folder;
  ASSERT_TRUE(QDir(folder.path()).mkdir("inner"));
  const QByteArray mapping = "MACRO\n";
  const QByteArray definition = "TRANSFORMER_NAME: A\nCOLOUR: red\nTEMPLATE_START\nTEMPLATE_END\n";
  const QByteArray custom =
      "# ORW custom transformers\n# TRANSFORMER_BEGIN A,1,T\n# MACRO\n# TRANSFORMER_END\n";
  put(folder.filePath("inner/a.mf"), mapping);
  put(folder.filePath("inner/b.ort"), definition);
  put(folder.filePath("c.ort"), custom);
  put(folder.filePath("d.txt"), mapping);
  put(folder.filePath("e.txt"), definition);
  const CommandCase cases[] = {
      {{"lint", "inner/a.mf"}, 1, "", "a.mf:1: error: "},
      {{"lint", "inner"}, 1, "", "inner/b.ort:2: error: "},
      {{"lint", "."}, 1, "", "./c.ort:3: error: "},
      {{"lint", "d.txt"}, 1, "", "d.txt:1: error: The statement"},
      {{"lint", "e.txt"}, 1, "", "e.txt:2: error: "},
      {{"lint", "--lang", "de", "d.txt"}, 1, "", "Erwartet: MACRO NAME"},
      {{"lint", "d.txt", "missing.mf"}, 3, "", "missing.mf: error: "},
      {{"lint"}, 2, "", "path is required"},
      {{"lint", "--rule", "bad-statement=off", "d.txt"}, 0, "", ""},
      {{"lint", "--rule", "unknown-keyword=off", "e.txt"}, 0, "", "e.txt:1: warning: "},
      {{"lint", "--rule", "unknown-keyword=hint", "--rule", "missing-text=off", "e.txt"},
       0,
       "",
       "e.txt:2: hint: "},
      {{"lint", "--rule", "unknown-word=off", "e.txt"}, 2, "", "unknown-word=off"},
  };
  for (const CommandCase& test : cases)
    expectOutcome(test, folder.path());
  for (const QByteArray& input : {mapping, definition, custom}) {
    const Outcome run = orxt({"lint", "-"}, QString(), QString(), input);
    EXPECT_EQ(run.status, 1);
    EXPECT_TRUE(run.err.startsWith("standard input:")) << run.err.toStdString();
  }
}

}  // namespace
