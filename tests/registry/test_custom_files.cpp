#include <platform/session/ORXString.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/QtPrinters.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/workspace/VersionStore.h>

#include <QFile>
#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>

namespace {

using Copy = std::unique_ptr<TransformerCfg>;

// The document of the custom transformer "Cleaner".
QByteArray document(const QByteArray& output, int build) {
  return tidyDocument(build).replace("Tidy", "Cleaner").replace("\"OUT\"", '"' + output + '"');
}

// Puts versions in front of each other, the last one given first in the file: version, build.
void writeVersions(const QString& path, const std::vector<std::pair<int, int>>& versions) {
  for (const auto& [version, build] : versions) {
    QString error;
    ASSERT_TRUE(VersionStore(path).insert(
        {"Cleaner", QString::number(version), "Mine", QString("{GUID%1}").arg(version)}, {},
        document("OUT" + QByteArray::number(version), build), error))
        << error.toStdString();
  }
}

QString customFile(RegistryFolders& folders, const QString& name,
                   const std::vector<std::pair<int, int>>& versions) {
  folders.define("Other.ort", definitionText("Other", 1));
  const QString path = folders.path("home/transformers/" + name);
  writeVersions(path, versions);
  return path;
}

int versionOf(TransformerMgr& registry, int asked) {
  const Copy copy(registry.getTransformer("Cleaner", asked));
  return copy ? copy->getVersion() : -1;
}

// As others are: listed, found, kept as a text.
TEST(CustomTransformerFiles, AreTransformersLikeOthers) {
  RegistryFolders folders;
  const QString path = customFile(folders, "Cleaner.ort", {{1, 18286}, {3, 18286}});
  TransformerMgr& registry = folders.load();
  EXPECT_EQ(registry.lastError(), QString());
  EXPECT_EQ(registry.getCategoryTransformers("Mine"), QStringList{"Cleaner"});
  EXPECT_TRUE(Copy(registry.getTransformerWithGUID("GUID3")));
  for (const int version : {1, 3}) {
    const Copy copy(registry.getTransformer("Cleaner", version));
    ASSERT_TRUE(copy);
    const QString output = QString("OUT%1").arg(version);
    QStringList outputs;
    copy->getOutputTags(outputs);
    EXPECT_EQ(outputs, QStringList{output});
    EXPECT_EQ(copy->getParameterValue("LIMIT"), QString("5"));
    EXPECT_EQ(copy->getFileName(), path);
    copy->setParameterValue("LIMIT", "a,\"b\"\n", false);
    copy->addInputFeatureType("IN", "x,\"y\"");
    copy->setInputAttributes("IN", QStringList{"p,q"});
    copy->setOutputFeatureType(output, "z");
    const Copy restored(registry.deserialize(copy->serialize()));
    ASSERT_TRUE(restored);
    EXPECT_EQ(restored->serialize(), copy->serialize());
    EXPECT_EQ(restored->getParameterValue("LIMIT"), "a,\"b\"\n");
    EXPECT_EQ(restored->getOutputAttributes(output), QStringList{"p,q"});
  }
}

TEST(CustomTransformerFiles, VersionsAreFoundOnDemand) {
  // `versions`: the first of the file is the last given
  const std::tuple<std::vector<std::pair<int, int>>, int, int> cases[] = {
      {{{1, 1}, {3, 1}}, ITransformerMgr::NEWEST_VERSION, 3},
      {{{1, 1}, {3, 1}}, 1, 1},
      {{{1, 1}, {3, 1}}, 2, -1},
      {{{1, 1}, {3, 1}}, 0, 1},
      {{{1, 1}, {3, 1}}, ITransformerMgr::OLDEST_VERSION, 1},
      // A build newer than this one: the next lower version serves.
      {{{1, 18286}, {3, 18287}}, ITransformerMgr::NEWEST_VERSION, 1},
      {{{1, 18286}, {3, 18287}}, 3, -1},
  };
  for (const auto& [versions, asked, found] : cases) {
    RegistryFolders folders;
    customFile(folders, "Cleaner.ort", versions);
    EXPECT_EQ(folders.load().transformerVersions("Cleaner"), (QList<int>{1, 3}));
    EXPECT_EQ(versionOf(TransformerMgr::getTransformerMgr(), asked), found) << asked;
  }
}

TEST(CustomTransformerFiles, TheBuildIsFoundInEveryFormOfXml) {
  const std::tuple<const char*, bool> cases[] = {
      {"LAST_SAVE_BUILD='99999'", true},
      {"LAST_SAVE_BUILD = \"99999\"", true},
      {"LAST_SAVE_BUILD\n=\n\n' 99999 '", true},
      {"LAST_SAVE_BUILD=\"&#57;9&#x39;99\"", true},
      {"LAST_SAVE_BUILD=\"99999999999999999999999\"", true},
      {"NOTE=\"LAST_SAVE_BUILD='99999'\"", false},
      {"X_LAST_SAVE_BUILD='99999'", false},
      {"LAST_SAVE_BUILD='1'><!-- <A LAST_SAVE_BUILD='99999'/> --", false},
      {"LAST_SAVE_BUILD='&&&&'", false},
  };
  for (const auto& [attribute, isTooNew] : cases) {
    RegistryFolders folders;
    QByteArray text = document("OUT", 1);
    text.replace("LAST_SAVE_BUILD=\"1\"", attribute);
    QString error;
    const QString path = folders.path("home/transformers/Cleaner.ort");
    folders.define("Other.ort", definitionText("Other", 1));
    ASSERT_TRUE(VersionStore(path).insert({"Cleaner", "1", "Mine"}, {"note <a \"b"}, text, error));
    EXPECT_EQ(versionOf(folders.load(), ITransformerMgr::NEWEST_VERSION), isTooNew ? -1 : 1) << attribute;
  }
}

TEST(CustomTransformerFiles, RefusedOnesAreListed) {
  RegistryFolders folders;
  const QString first = customFile(folders, "A.ort", {{2, 1}});
  const QString second = customFile(folders, "B.ort", {{2, 1}});
  const QString newer = customFile(folders, "C.ort", {{9, 99999}});
  TransformerMgr& registry = folders.load();
  EXPECT_EQ(registry.transformerNames(), (QStringList{"Cleaner", "Other"}));
  // Whoever asks again is refused again, for the same reason.
  registry.reloadCustomTransformers();
  EXPECT_EQ(versionOf(registry, 9), -1);
  ASSERT_EQ(registry.ignoredTransformers().size(), 2u);
  const TransformerMgr::IgnoredTransformer& duplicate = registry.ignoredTransformers().front();
  EXPECT_EQ(duplicate.path, second);
  EXPECT_EQ(duplicate.keptPath, first);
  EXPECT_TRUE(duplicate.isDuplicate);
  EXPECT_TRUE(duplicate.reason().contains(second) && duplicate.reason().contains(first));
  const TransformerMgr::IgnoredTransformer& refused = registry.ignoredTransformers().back();
  EXPECT_EQ(refused.path, newer);
  EXPECT_EQ(refused.version, 9);
  EXPECT_FALSE(refused.isDuplicate);
  const std::tuple<int, bool> cases[] = {{2, true}, {9, true}, {3, false}, {-1, true}, {-2, true}};
  for (const auto& [version, ignored] : cases)
    EXPECT_EQ(registry.isTransformerIgnored(ORXString("Cleaner"), version), ignored) << version;
  // And say why when they are asked for.
  const std::tuple<const char*, int, QString> asked[] = {
      {"Cleaner", 9, newer}, {"Cleaner", 3, {}}, {"Nothing", 9, {}}, {"Other", 1, {}}};
  for (const auto& [name, version, file] : asked) {
    QString refusal;
    registry.makeTransformer(name, version, &refusal);
    EXPECT_EQ(refusal.isEmpty(), file.isEmpty()) << name << version;
    EXPECT_TRUE(refusal.contains(file));
  }
}

TEST(CustomTransformerFiles, ARemoteFileTakesThePlaceOfTheDefinition) {
  RegistryFolders folders;
  const QString first = customFile(folders, "A.ort", {{2, 1}});
  TransformerMgr& registry = folders.load();
  const Copy before(registry.getTransformer("Cleaner", 2));
  const QString remote = folders.path("remote.ort");
  writeVersions(remote, {{2, 1}});
  registry.loadRemoteTransformer(remote, 2);
  const Copy after(registry.getTransformer("Cleaner", 2));
  ASSERT_TRUE(before && after);
  EXPECT_EQ(before->getFileName(), first);
  EXPECT_EQ(after->getFileName(), remote);
}

// Copies stay usable in whatever order they, the file and the registry's own go.
TEST(CustomTransformerFiles, InstancesOutliveAReload) {
  // n: a new copy; c: a copy of the last one; f, l: the first, the last one goes; u: all are used;
  // r: everything is loaded anew; R: custom transformers are; m: the file takes its own place; d: the file
  // goes
  const char* const sequences[] = {"nru",       "nrrufr",    "ncrfurlr",      "ncrlurfr",
                                   "nrnrflur",  "nRumRufr",  "nmurfr",        "ncdrufur",
                                   "ndRucrflr", "nnnrfrlru", "nmncdrrufurlu", "nlrncrfrul"};
  for (const char* sequence : sequences) {
    SCOPED_TRACE(sequence);
    RegistryFolders folders;
    const QString path = customFile(folders, "A.ort", {{2, 1}});
    TransformerMgr& registry = folders.load();
    std::vector<Copy> copies;
    for (const char* step = sequence; *step; ++step) {
      if (*step == 'n')
        copies.emplace_back(registry.getTransformer("Cleaner", 2));
      else if (*step == 'c')
        copies.emplace_back(copies.back()->getCopy());
      else if (*step == 'f')
        copies.erase(copies.begin());
      else if (*step == 'l')
        copies.pop_back();
      else if (*step == 'r')
        folders.load();
      else if (*step == 'R')
        registry.reloadCustomTransformers();
      else if (*step == 'm')
        registry.loadRemoteTransformer(path, 2);
      else if (*step == 'd')
        QFile::remove(path);
      ASSERT_TRUE(copies.empty() || copies.back());
      for (std::size_t i = 0; *step == 'u' && i < copies.size(); ++i) {
        const QString attribute = QString("a%1").arg(i);
        copies[i]->setInputAttributes("IN", QStringList{attribute});
        EXPECT_EQ(copies[i]->getOutputAttributes("OUT2"), QStringList{attribute});
        EXPECT_TRUE(copies[i]->setParameterValue("LIMIT", attribute, true));
        EXPECT_EQ(Copy(copies[i]->getCopy())->getParameterValue("LIMIT"), attribute);
      }
    }
    EXPECT_TRUE(registry.ignoredTransformers().empty());
  }
}

// The last copy goes after the registry.
TEST(CustomTransformerFiles, InstancesOutliveTheRegistry) {
  RegistryFolders folders;
  customFile(folders, "A.ort", {{2, 1}});
  EXPECT_EXIT(
      {
        static Copy survivor;
        survivor.reset(folders.load().getTransformer("Cleaner", 2));
        std::exit(survivor && survivor->getOutputAttributes("OUT2").isEmpty() ? 0 : 1);
      },
      testing::ExitedWithCode(0), "");
}

}  // namespace
