// The command as a person runs it: what it prints where, and with which exit status it ends.
#include <tests/cli/OrxtProcess.h>
#include <tests/support/QtPrinters.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

TEST(CommandLine, EndsWithTheStatusThatFits) {
  QTemporaryDir folder;
  put(folder.filePath("empty.orw"), "");
  put(folder.filePath("cut.orw"), readAll(samples().first()).left(3000));
  put(folder.filePath("kept.mf"), "before");
  put(folder.filePath("a b#$.orw"), readAll(samples().first()));
  const QString good = samples().first();
  const CommandCase cases[] = {
      {{"--help"}, 0, "Example:", ""},
      {{"--version"}, 0, "orxt ", ""},
      {{"generate", "--help"}, 0, "--param NAME=VALUE", ""},
      {{"transformers", "show", "--help"}, 0, "Example:", ""},
      {{}, 2, "", "generate"},
      {{"frobnicate"}, 2, "", "frobnicate"},
      {{"generate"}, 2, "", "workspace"},
      {{"generate", good, good}, 2, "", "give -d DIR"},
      {{"generate", good, good, "-d", "out"}, 2, "", "give them separately"},
      {{"generate", good, "-o", "x", "-d", "y"}, 2, "", "excludes"},
      {{"generate", good, "--depfile", "d.d"}, 2, "", "--output"},
      {{"generate", "cut.orw", "-o", "x.mf", "--depfile", "./cut.orw"}, 2, "", "--depfile"},
      {{"generate", good, "-o", "x.mf", "--depfile", "x.mf"}, 2, "", "--depfile"},
      {{"generate", "missing.orw", "-o", "x.mf", "--depfile", "d.d"}, 3, "", "missing.orw"},
      {{"generate", good, "-o", "x.mf", "--depfile", "no/such/d.d"}, 3, "", "no/such/d.d"},
      {{"generate", "a b#$.orw", "-o", "x$.mf", "--depfile", "d.d"}, 0, "", ""},
      {{"generate", good, "--param", "novalue"}, 2, "", "NAME=VALUE"},
      {{"generate", good, "--param", "NO_SUCH=1"}, 1, "", "NO_SUCH"},
      {{"generate", "missing.orw"}, 3, "", "missing.orw: error: "},
      {{"generate", "empty.orw"}, 1, "", "empty.orw: error: "},
      {{"generate", "cut.orw", "-o", "cut.mf"}, 1, "", "cut.orw:"},
      {{"generate", good, "-o", "/dev/full"}, 3, "", "/dev/full"},
      {{"generate", good, "-o", "no/such/folder/x.mf"}, 3, "", "no/such/folder/x.mf"},
      {{"generate", good}, 0, "FACTORY_DEF * ", ""},
      {{"generate", good, "-o", "-"}, 0, "FACTORY_DEF * ", ""},
      {{"transformers", "list"}, 0, "GeometryBufferer", ""},
      {{"transformers", "list", "--category", "No Such"}, 1, "", "there are: "},
      {{"transformers", "show", "GeometryBufferer"}, 0, "Parameters", ""},
      {{"transformers", "list", "--resources", sample("custom")}, 0, "[custom, version 2, ", ""},
      {{"transformers", "show", "Site Placer", "--resources", sample("custom")}, 0, "site_placer.ort", ""},
      {{"generate", sample("station_catchments.orw"), "-o", "kept.mf"}, 1, "", "'Site Placer' of version "},
      {{"transformers", "show", "NoSuchThing"}, 1, "", "NoSuchThing"},
      {{"transformers", "show", "GeometryBufferer", "--version", "99"}, 1, "", "99"},
      {{"transformers", "show", "GeometryBufferer", "--version", "new"}, 2, "", "new"},
      {{"lint", QStringLiteral(ORX_SOURCE_DIR) + "/resources/transformers"}, 0, "", ""},
      {{"lint", "missing.ort"}, 3, "", "missing.ort"},
      {{"lint", "x.ort", "--lang", "xx"}, 2, "", "'xx'; there are: de, en, fr"},
      {{"transformers", "list", "--lang", "german"}, 2, "", "'german'; there are: de, en, fr"},
      {{"transformers", "list", "--lang", "fr_CA"}, 0, "GeometryBufferer", ""},
      {{"generate", good, good, "--lang", "de"}, 2, "", "Mehrere Arbeitsbereiche"},
  };
  for (const CommandCase& test : cases)
    expectOutcome(test, folder.path());
  EXPECT_FALSE(QFile::exists(folder.filePath("cut.mf")));
  const QByteArray dependencies = readAll(folder.filePath("d.d"));
  EXPECT_TRUE(dependencies.startsWith("x$$.mf: \\\n  a\\ b\\#$$.orw \\\n")) << dependencies.constData();
  EXPECT_TRUE(dependencies.contains("/resources/transformers/") && dependencies.endsWith(".ort:\n"));
  EXPECT_EQ(readAll(folder.filePath("kept.mf")), QByteArray("before"));
}

TEST(CommandLine, TellsWhenItDoesNotSpeakTheLanguageOfTheEnvironment) {
  const QStringList command = {"lint", sample("custom")};
  for (const char* locale : {"C", "POSIX", "de_AT.UTF-8", "fr"})
    EXPECT_EQ(orxt(command, QString(), QString(), QByteArray(), locale).err, QString()) << locale;
  const Outcome run = orxt(command, QString(), QString(), QByteArray(), "ja_JP.UTF-8");
  EXPECT_EQ(run.status, 0);
  EXPECT_TRUE(run.err.contains("'ja'; there are: de, en, fr")) << run.err.toStdString();
}

TEST(CommandLine, GeneratesManyWorkspacesAtOnce) {
  QTemporaryDir folder;
  put(folder.filePath("broken.orw"), "#! <WORKSPACE><TRANSFORMERS>\n");
  QStringList arguments = {"generate", "--resources", sample("custom"), "-d", "out",
                           "--jobs",   "3",           "broken.orw"};
  arguments += samples();
  const Outcome run = orxt(arguments, folder.path());
  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.err.startsWith("broken.orw")) << run.err.toStdString();
  const QDir out(folder.filePath("out"));
  EXPECT_EQ(out.entryList(QDir::Files).size(), samples().size());
  for (const QString& name : out.entryList(QDir::Files))
    EXPECT_EQ(readAll(out.filePath(name)), readAll(sample(name))) << name.toStdString();
}

TEST(CommandLine, WithoutItsHomeADiagnosticStillTellsWhatIsMeant) {
  const QByteArray home = qgetenv("ORX_HOME");
  qputenv("ORX_HOME", "/nowhere");
  const Outcome run = orxt({"generate", sample("flood_parcels.orw")});
  const Outcome lossy = orxt({"format", "-"}, QString(), QString(), "<WORKSPACE><OTHER/></WORKSPACE>");
  qputenv("ORX_HOME", home);
  EXPECT_EQ(lossy.status, 1);
  EXPECT_TRUE(lossy.err.contains("370773 OTHER")) << lossy.err.toStdString();
  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.err.contains("unknown-transformer AreaClipper")) << run.err.toStdString();
}

}  // namespace
