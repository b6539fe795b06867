// Validation as a person runs it: broken workspaces against what is to be said about them, sound ones
// against silence, and the forms for programs.
#include <tests/cli/BrokenFiles.h>
#include <tests/support/QtPrinters.h>
#include <transform/findings/RuleSettings.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

Outcome validateBroken(const QStringList& arguments) {
  return orxt(QStringList{"validate", "--resources", "definitions"} + arguments, brokenFolder());
}

TEST(Validate, SaysWhatIsWrongWithBrokenWorkspaces) {
  expectSaidOfBroken("validate", brokenFolder(), ".orw", 15);
}

TEST(Validate, FindsNothingWrongWithTheSamples) {
  const Outcome run = orxt(QStringList{"validate", "--json", "--resources", sample("custom")} + samples());
  EXPECT_EQ(run.status, 0);
  const QJsonArray reports = QJsonDocument::fromJson(run.out.toUtf8()).array();
  ASSERT_EQ(reports.size(), samples().size());
  for (const QJsonValue& report : reports) {
    EXPECT_EQ(report["errors"].toInt(-1), 0) << run.out.toStdString();
    EXPECT_EQ(report["warnings"].toInt(-1), 0) << run.out.toStdString();
    EXPECT_LE(report["hints"].toInt(99), 5) << run.out.toStdString();
  }
}

TEST(Validate, EndsWithTheStatusThatFits) {
  const struct {
    QStringList arguments;
    int status;
    int errors;  // lines on standard error
    const char* out;
  } cases[] = {
      {{"loose-ends.orw"}, 0, 6, "Workspaces: 1. Errors: 0, warnings: 3, hints: 3.\n"},
      {{"loose-ends.orw", "--quiet"}, 0, 0, ""},
      {{"refused-values.orw", "--quiet"}, 1, 3, ""},
      {{"refused-values.orw", "--quiet", "--rule", "missing-file=error"}, 1, 4, ""},
      {{"refused-values.orw", "loose-ends.orw"}, 1, 11, "Workspaces: 2. Errors: 3, warnings: 5, hints: 3.\n"},
      {{"missing.orw", "refused-values.orw", "-q"}, 3, 4, ""},
      {{"loose-ends.orw", "--rule", "unfed-input=error", "-q"}, 1, 2, ""},
      {{"loose-ends.orw", "--rule", "unfed-input=off", "--rule", "dropped-output=off"},
       0,
       2,
       "Workspaces: 1. Errors: 0, warnings: 1, hints: 1.\n"},
      {{"references.orw", "--rule", "missing-file=off"},
       1,
       7,
       "Workspaces: 1. Errors: 4, warnings: 1, hints: 2.\n"},
      {{"loose-ends.orw", "--rule", "unfed-input=hint", "--rule", "unfed-input=error", "-q"}, 1, 2, ""},
      {{"cycle.orw", "--rule", "cycle=warning"}, 2, 1, ""},
      {{"cycle.orw", "--rule", "cycle=off"}, 2, 1, ""},
      {{"cycle.orw", "--rule", "cycle=error", "-q"}, 1, 1, ""},
      {{"cycle.orw", "--rule", "cycle=loud"}, 2, 1, ""},
      {{"cycle.orw", "--rule", "circle=off"}, 2, 1, ""},
      {{"cycle.orw", "--rule", "cycle"}, 2, 1, ""},
      {{"missing.orw", "cycle.orw", "--lang", "de"},
       3,
       2,
       "Arbeitsbereiche: 2. Fehler: 1, Warnungen: 0, Hinweise: 0. Nicht lesbar: 1.\n"},
      {{"cycle.orw", "--lang", "fr"},
       1,
       1,
       "Espaces de travail : 1. Erreurs : 1, avertissements : 0, conseils : 0.\n"},
  };
  for (const auto& test : cases) {
    const Outcome run = validateBroken(test.arguments);
    const std::string line = test.arguments.join(' ').toStdString() + "\n" + run.err.toStdString();
    EXPECT_EQ(run.status, test.status) << line;
    EXPECT_EQ(run.err.count('\n'), test.errors) << line;
    EXPECT_EQ(run.out, QString(test.out)) << line;
  }
}

// The errors among the lines, in their order.
QStringList errorsIn(const QString& lines) {
  return lines.split('\n').filter(QRegularExpression(": error: "));
}

TEST(Judgement, IsTheSameForValidateAndGenerate) {
  QStringList raised;
  QStringList lowered;
  for (const orx::RuleRow& rule : orx::ruleTable()) {
    orx::RuleSettings settings;
    QString reason;
    const QString name = rule.name;
    if (settings.set(name + "=error", reason))
      raised << "--rule" << name + "=error";
    if (settings.set(name + "=off", reason))
      lowered << "--rule" << name + "=off";
  }
  QStringList workspaces = samples();
  for (const QString& name : QDir(brokenFolder()).entryList({"*.orw"}))
    workspaces << brokenFolder() + "/" + name;
  const QStringList common = {
      "--resources", brokenFolder() + "/definitions", "--resources", sample("custom"), "--lang", "en"};
  const QStringList settings[] = {
      {},
      raised,
      lowered,
      {"--param", "NOWHERE=1"},
      {"--param", "LEVEL=none", "--param", "ROUND=$(ROUND)"},
      {"--rule", "unknown-global-parameter=off", "--param", "LEVEL=high"},
  };
  for (const QStringList& setting : settings) {
    QTemporaryDir folder;
    const Outcome judged = orxt(QStringList{"validate", "-q"} + common + setting + workspaces);
    const Outcome written =
        orxt(QStringList{"generate", "-q", "-d", folder.path()} + common + setting + workspaces);
    const std::string what = setting.mid(0, 6).join(' ').toStdString();
    EXPECT_EQ(errorsIn(written.err), errorsIn(judged.err)) << what;
    EXPECT_EQ(written.status, judged.status) << what << written.err.toStdString();
    const Outcome json = orxt(QStringList{"validate", "--json"} + common + setting + workspaces);
    const QJsonArray reports = QJsonDocument::fromJson(json.out.toUtf8()).array();
    ASSERT_EQ(reports.size(), workspaces.size()) << what;
    for (int i = 0; i < workspaces.size(); ++i) {
      const QString output = folder.filePath(QFileInfo(workspaces.at(i)).completeBaseName() + ".mf");
      EXPECT_EQ(QFile::exists(output), reports.at(i)["errors"].toInt(-1) == 0)
          << what << workspaces.at(i).toStdString();
    }
  }
}

TEST(Validate, WritesSarif) {
  QTemporaryDir folder;
  const QString spaced = folder.filePath("a b#.orw");
  ASSERT_TRUE(QFile::copy(brokenFolder() + "/cycle.orw", spaced));
  const Outcome run = validateBroken({"--sarif", "refused-values.orw", spaced, "missing.orw"});
  EXPECT_EQ(run.status, 3);
  const QJsonObject log = QJsonDocument::fromJson(run.out.toUtf8()).object();
  EXPECT_EQ(log["version"].toString(), QString("2.1.0"));
  const QJsonObject sarifRun = log["runs"].toArray().at(0).toObject();
  const QJsonArray rules = sarifRun["tool"]["driver"]["rules"].toArray();
  const QJsonArray results = sarifRun["results"].toArray();
  ASSERT_EQ(results.size(), 6);
  for (const QJsonValue& result : results)
    EXPECT_EQ(rules.at(result["ruleIndex"].toInt(-1))["id"], result["ruleId"]);
  const QJsonValue first = results.at(0);
  EXPECT_EQ(first["ruleId"].toString(), QString("missing-value"));
  EXPECT_EQ(first["level"].toString(), QString("error"));
  const QJsonValue place = first["locations"].toArray().at(0)["physicalLocation"];
  EXPECT_EQ(place["artifactLocation"]["uri"].toString(), QString("refused-values.orw"));
  EXPECT_EQ(place["region"]["startLine"].toInt(), 13);
  const QString uri =
      results.at(5)["locations"].toArray().at(0)["physicalLocation"]["artifactLocation"]["uri"].toString();
  EXPECT_TRUE(uri.startsWith("file:///") && uri.endsWith("/a%20b%23.orw")) << uri.toStdString();
  EXPECT_FALSE(sarifRun["invocations"].toArray().at(0)["executionSuccessful"].toBool(true));
}

}  // namespace
