// The checks of mapping files as a person runs them: broken ones against what is to be said about them, sound
// ones against silence, and the ways to name what is to be checked.
#include <tests/cli/BrokenFiles.h>
#include <transform/findings/Rules.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSet>
#include <QTemporaryDir>
#include <gtest/gtest.h>

using orx::Rule;

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

TEST(Lint, HasABrokenFileForEveryRuleInEveryLanguage) {
  // These need large files, or a system without Python.
  const QSet<QString> elsewhere = {"long-statement", "deep-block", "unchecked-python", "too-many-findings",
                                   "too-many-names"};
  QMap<QString, QSet<QString>> texts;
  for (const char* language : {"en", "de", "fr"}) {
    QSet<QString> found;
    for (const QJsonValue& finding : lintJson({"--lang", language, brokenMappingFiles()}, 1)) {
      found.insert(finding["rule"].toString());
      texts[finding["rule"].toString()].insert(finding["text"].toString());
    }
    for (const orx::RuleRow& rule : orx::ruleTable()) {
      const bool isOfMappingFiles = rule.rule >= Rule::NotUtf8 && rule.rule < Rule::UnreadableFile;
      EXPECT_TRUE(!isOfMappingFiles || found.contains(rule.name) || elsewhere.contains(rule.name))
          << rule.name.latin1();
    }
  }
  for (auto rule = texts.cbegin(); rule != texts.cend(); ++rule)
    EXPECT_GE(rule.value().size(), 3) << rule.key().toStdString();
}

TEST(Lint, FindsNothingWrongWithWhatIsGenerated) {
  EXPECT_EQ(lintJson({sample("")}, 0), QJsonArray());
  for (const QString& workspace : samples()) {
    const Outcome written = orxt({"generate", "--resources", sample("custom"), workspace});
    const Outcome run =
        orxt({"lint", "--resources", sample("custom"), "-"}, QString(), QString(), written.out.toUtf8());
    EXPECT_EQ(run.status, 0);
    EXPECT_EQ(run.err + run.out, QString()) << workspace.toStdString();
  }
}

TEST(Lint, FindsWhatSpoilsASample) {
  const struct {
    const char* sample;
    const char* sound;
    const char* spoilt;
    const char* rules;
  } cases[] = {
      {"flood_parcels",
       "FACTORY_NAME \"Add margin\" INPUT INPUT FEATURE_TYPE \"Chosen return period_PASSED\"",
       "FACTORY_NAME \"Add margin\" INPUT INPUT FEATURE_TYPE \"Chosen return period_PASED\"",
       "dropped-type unfed-type"},
      {"flood_parcels", "FACTORY_OPTION Check<space>outlines ID", "FACTORY_OPTION Check<space>outline ID",
       "unknown-factory"},
      {"flood_parcels", "DEFAULT_MACRO ZONE_MARGIN 2.5\n", "", "unknown-reference"},
      {"flood_parcels", "FACTORY_NAME \"Measure parcels\"", "FACTORY_NAME \"Add margin\"",
       "repeated-factory unknown-factory"},
      {"flood_parcels", "return $curAttrValue; ", "return [$curAttrValue; ", "tcl-syntax"},
      {"flood_parcels", "@Tcl2(", "@Tcl(", "unknown-function"},
      {"flood_parcels", "RUN:STATEMENTS", "RUN:DEFINITION", "missing-definition"},
      {"land_cover", "MACRO Tidy_Area_WORKSPACE_NAME Tidy forest\n", "", "late-macro"},
      {"land_cover", "# TRANSFORMER_END\n", "", "open-block"},
      {"land_cover", "INCLUDE_CUSTOM_TRANSFORMER_VER Tidy Area:1",
       "INCLUDE_CUSTOM_TRANSFORMER_VER Tidy Area:2", "missing-definition"},
      {"station_catchments", "Placer:1", "Placer:11", "missing-definition"},
      {"road_network", "\" \\\n", "\" \n", "unfed-type unknown-statement"},
  };
  QTemporaryDir folder;
  for (const auto& test : cases) {
    QByteArray text = readAll(sample(test.sample + QString(".mf")));
    const int at = text.indexOf(test.sound);
    ASSERT_GE(at, 0) << test.sound;
    text.replace(at, static_cast<int>(qstrlen(test.sound)), test.spoilt);
    write(folder.filePath("spoilt.mf"), text);
    QStringList rules;
    const Outcome run =
        orxt({"lint", "--json", "--resources", sample("custom"), folder.filePath("spoilt.mf")});
    for (const QJsonValue& finding : QJsonDocument::fromJson(run.out.toUtf8()).array())
      rules << finding["rule"].toString();
    rules.removeDuplicates();
    rules.sort();
    EXPECT_EQ(rules.join(' '), QString(test.rules)) << test.spoilt;
  }
}

TEST(Lint, TellsTheKindOfAFileByNameAndContent) {
  QTemporaryDir folder;
  ASSERT_TRUE(QDir(folder.path()).mkdir("inner"));
  const QByteArray mapping = "MACRO\n";
  const QByteArray definition = "TRANSFORMER_NAME: A\nCOLOUR: red\nTEMPLATE_START\nTEMPLATE_END\n";
  const QByteArray custom =
      "# ORW custom transformers\n# TRANSFORMER_BEGIN A,1,T\n# MACRO\n# TRANSFORMER_END\n";
  write(folder.filePath("inner/a.mf"), mapping);
  write(folder.filePath("inner/b.ort"), definition);
  write(folder.filePath("c.ort"), custom);
  write(folder.filePath("d.txt"), mapping);
  write(folder.filePath("e.txt"), definition);
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

TEST(Lint, WritesSarif) {
  const Outcome run = orxt({"lint", "--sarif", "--rule", "unfed-type=error", "flow.mf", "missing.mf",
                            brokenFolder() + "/definitions/Dependent.ort"},
                           brokenMappingFiles());
  EXPECT_EQ(run.status, 3);
  const QJsonValue log = QJsonDocument::fromJson(run.out.toUtf8()).object()["runs"].toArray().at(0);
  QSet<QString> said;
  for (const QJsonValue& result : log["results"].toArray()) {
    EXPECT_EQ(log["tool"]["driver"]["rules"].toArray().at(result["ruleIndex"].toInt(-1))["id"],
              result["ruleId"]);
    const QJsonValue place = result["locations"].toArray().at(0)["physicalLocation"];
    said.insert(QString("%1:%2 %3 %4")
                    .arg(place["artifactLocation"]["uri"].toString().section('/', -1))
                    .arg(place["region"]["startLine"].toInt())
                    .arg(result["level"].toString(), result["ruleId"].toString()));
  }
  for (const char* expected : {"flow.mf:9 error unknown-factory", "flow.mf:13 error unfed-type",
                               "flow.mf:14 note dropped-type", "Dependent.ort:2 warning missing-text"})
    EXPECT_TRUE(said.contains(expected)) << expected;
  EXPECT_FALSE(log["invocations"].toArray().at(0)["executionSuccessful"].toBool(true));
}

}  // namespace
