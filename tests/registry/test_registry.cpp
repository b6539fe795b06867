#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/LanguageGuard.h>
#include <transform/core/TransformerCfg.h>

#include <gtest/gtest.h>

#include <memory>
#include <set>

namespace {

using Copy = std::unique_ptr<TransformerCfg>;

}  // namespace

TEST(Registry, LaterFoldersAndFilesReplace) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("Same", 3, "CATEGORY: First") +
                              definitionText("Twice", 1, "CATEGORY: A") +
                              definitionText("Twice", 1, "CATEGORY: B"));
  folders.define("b.ort", definitionText("Same", 2, "CATEGORY: Older"));
  folders.define("sub/c.ort", definitionText("Sub", 0));
  const QString extra = folders.write("extra/e.ort", definitionText("Same", 3, "CATEGORY: Extra"));
  TransformerMgr& registry = folders.load();
  EXPECT_EQ(registry.transformerNames(), (QStringList{"Same", "Twice", "Sub"}));
  EXPECT_EQ(registry.transformerVersions("Same"), (QList<int>{2, 3}));
  EXPECT_EQ(Copy(registry.getTransformer("Same", -1))->getFileName(), extra);
  EXPECT_EQ(Copy(registry.getTransformer("Same", -1))->transformerType(), TransformerCfg::kOrdinary);
  EXPECT_EQ(Copy(registry.getTransformer("Same", 2))->transformerType(), TransformerCfg::kBuiltIn);
  EXPECT_EQ(Copy(registry.getTransformer("Twice", 1))->category(), "B");
  ORXString file;
  registry.getDefinitionFileName(ORXString("Same"), file);
  EXPECT_EQ(ORXToQString(file), extra);
  registry.getDefinitionFileName(ORXString("Unknown"), file);
  EXPECT_EQ(ORXToQString(file), "");
  // An older version is in no category; the name stays where a newer definition put it before.
  EXPECT_EQ(registry.getCategories(), (QStringList{"First", "A", "B", "Extra"}));
  EXPECT_EQ(registry.getCategoryTransformers("Extra"), (QStringList{"Same"}));
  EXPECT_EQ(registry.getCategoryTransformers("Older"), QStringList());
  EXPECT_EQ(folders.load().transformerNames().size(), 3) << "a second load begins anew";
}

TEST(Registry, Versions) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("T", 5) + definitionText("T", 2) +
                              definitionText("Far", 2000000000) + definitionText("Odd", -7));
  TransformerMgr& registry = folders.load();
  // `got`: -1: none
  const std::tuple<const char*, int, int> cases[] = {
      {"T", -1, 5},           {"T", -2, 2},  {"T", 5, 5},
      {"T", 3, -1},           {"T", -3, -1}, {"t", -1, -1},
      {"", -1, -1},           {"U", -2, -1}, {"Far", -2, 2000000000},
      {"Far", -1, 2000000000}};
  for (const auto& [name, asked, got] : cases) {
    SCOPED_TRACE(std::string(name) + " " + std::to_string(asked));
    const Copy copy(registry.getTransformer(QString::fromLatin1(name), asked));
    EXPECT_EQ(copy ? copy->getVersion() : -1, got);
    EXPECT_EQ(registry.transformerExists(QString::fromLatin1(name), asked), got != -1);
    EXPECT_EQ(copy ? copy->getIdentifier() : QString::fromLatin1(name), name);
  }
  EXPECT_EQ(registry.currentTransformerVersion("T"), 5);
  EXPECT_EQ(registry.currentTransformerVersion("U"), -1);
  EXPECT_FALSE(registry.isTransformerIgnored(QStringLiteral("T"), -1));
  // Copies are the caller's own.
  const Copy one(registry.getTransformer("T", 5));
  one->setIdentifier(QStringLiteral("changed"));
  EXPECT_EQ(Copy(registry.getTransformer("T", 5))->getIdentifier(), "T");
  // Through the interface.
  ITransformerMgr& face = ITransformerMgr::getTransformerMgr();
  const std::unique_ptr<ITransformerCfg> copy(
      face.getTransformer(ORXString("T"), ITransformerMgr::OLDEST_VERSION));
  ASSERT_TRUE(copy);
  EXPECT_FALSE(std::unique_ptr<ITransformerCfg>(face.getTransformer(ORXString("U"), 1)));
  face.resetIteration();
  QStringList names;
  while (const std::unique_ptr<ITransformerCfg> next{face.getNextTransformer()}) {
    ORXString name;
    next->getName(name);
    names.append(ORXToQString(name));
  }
  EXPECT_EQ(names, (QStringList{"T", "Far", "Odd"}));
  EXPECT_EQ(face.getNextTransformer(), nullptr);
  face.resetIteration();
  EXPECT_TRUE(std::unique_ptr<ITransformerCfg>(face.getNextTransformer()));
}

TEST(Registry, Aliases) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("A", 1, "ALIASES: Old Shared") + definitionText("A", 2) +
                              definitionText("B", 1, "ALIASES: Shared zwei A Middle") +
                              definitionText("H", 1, "VISIBLE: no\nALIASES: Hidden") +
                              definitionText("Loop", 4, "ALIASES: Circle") +
                              definitionText("C", 1, "ALIASES: Old"));
  // "Middle" stands for B; "Far" for "Middle"; two that stand for each other.
  folders.define("b.ort",
                 definitionText("Middle", 9, "ALIASES: Far") + definitionText("Circle", 3, "ALIASES: Loop"));
  TransformerMgr& registry = folders.load();
  // `name`: null: none
  const std::tuple<const char*, int, const char*> cases[] = {
      {"Old", -1, "A"},      {"Old", 1, "A"},        {"Old", 7, nullptr},  {"Shared", -2, "A"},
      {"Far", 9, "Middle"},  {"Far", 1, "B"},        {"Far", 8, nullptr},  {"Hidden", 1, "H"},
      {"Circle", 4, "Loop"}, {"Circle", 5, nullptr}, {"Loop", 3, "Circle"}};
  for (const auto& [asked, version, name] : cases) {
    SCOPED_TRACE(std::string(asked) + " " + std::to_string(version));
    const Copy copy(registry.getTransformer(QString::fromLatin1(asked), version));
    EXPECT_EQ(copy != nullptr, name != nullptr);
    EXPECT_EQ(registry.transformerExists(QString::fromLatin1(asked), version), name != nullptr);
    if (copy && name) {
      EXPECT_EQ(copy->getName(), name);
      EXPECT_EQ(copy->getRequestedAlias(), asked);
    }
  }
  EXPECT_EQ(Copy(registry.getTransformer("A", 1))->getRequestedAlias(), "");
  EXPECT_EQ(registry.getTransformerNameFromAlias("Shared"), "A");
  EXPECT_EQ(registry.getTransformerNameFromAlias("B"), "");
  EXPECT_EQ(registry.currentTransformerVersion("Old"), -1);
  EXPECT_EQ(registry.getVisibleTransformerAliases(),
            (QStringList{"A", "Circle", "Far", "Loop", "Middle", "Old", "Shared", "zwei"}));
  EXPECT_TRUE(registry.isVisibleAlias("Shared"));
  EXPECT_FALSE(registry.isVisibleAlias("A")) << "a visible transformer's own name";
  EXPECT_FALSE(registry.isVisibleAlias("Hidden"));
  EXPECT_EQ(registry.visibleTransformerNames(), (QStringList{"A", "B", "Loop", "C", "Middle", "Circle"}));
}

TEST(Registry, ExceptionList) {
  const std::tuple<const char*, std::set<std::string>> cases[] = {
      {"XFORMER_NAME|PLATFORM|SHOULD_CREATE_TRANSFORMER\nA|ALL|NO\nB|WIN64|NO\nC|WINDOWS|no\nD|MAC|NO\n",
       {"A", "B", "C"}},
      {"SHOULD_CREATE_TRANSFORMER|X|PLATFORM|XFORMER_NAME\r\nYES||ALL|A\r\nNO||ALL|B\r\nNO||ALL\r\n|z|ALL|B",
       {"B"}},
      {"XFORMER_NAME|PLATFORM\nA|ALL|NO\n", {}},
      {"XFORMER_NAME|PLATFORM|SHOULD_CREATE_TRANSFORMER\nA|ALL|NO\nA|ALL|YES\nB|ALL|\n", {}},
      {"", {}},
  };
  for (const auto& [text, refused] : cases) {
    SCOPED_TRACE(text);
    RegistryFolders folders;
    for (const char* name : {"A", "B", "C", "D"}) {
      folders.define(QString::fromLatin1(name) + QLatin1String(".ort"), definitionText(name, 1));
    }
    folders.write("home/pluginsinfo/transformer/exceptions.db", text);
    TransformerMgr& registry = folders.load();
    for (const char* name : {"A", "B", "C", "D"}) {
      const Copy copy(registry.getTransformer(QString::fromLatin1(name), 1));
      ASSERT_TRUE(copy);
      EXPECT_EQ(copy->platformSupported(), refused.count(name) == 0) << name;
    }
    // The list is read for a session alone.
    registry.loadTransformers(nullptr);
    EXPECT_TRUE(Copy(registry.getTransformer("B", 1))->platformSupported());
  }
}

TEST(Registry, CompanionsOfTheLanguage) {
  const QByteArray companion =
      "TRANSFORMER_NAME: T\nVERSION: 2\nLOCALIZED_NAME: Ländermühle\nPARAMETER_NAME: P\nPARAMETER_PROMPT: "
      "Größe\n"
      "PARAMETER_NAME: NONE\nPARAMETER_PROMPT: x\nTOOLTIP_START\nHinweis $(P)\nTOOLTIP_END\n"
      "CATEGORY_NAME: Attributes,Merkmale\nCATEGORY_DESCRIPTION_START Attributes\nüber Merkmale\n"
      "CATEGORY_DESCRIPTION_END\nTRANSFORMER_NAME: U\nLOCALIZED_NAME: Uhr\nTRANSFORMER_NAME: "
      "Unknown\nVERSION: 1\n";
  const QByteArray parameter =
      "CATEGORY: Attributes\nPARAMETER_NAME: P\nPARAMETER_TYPE: INT\nPARAMETER_PROMPT: Size\n";
  RegistryFolders folders;
  folders.define("a.ort", definitionText("T", 1, parameter) + definitionText("T", 2, parameter) +
                              definitionText("U", 7, "CATEGORY: Attributes"));
  folders.define("b-localized.de", companion);
  folders.define("b-localized.fr", "TRANSFORMER_NAME: T\nVERSION: 2\nLOCALIZED_NAME: falsch\n");
  // In the folder behind: one that replaces a localised one, and words for one of the folder before.
  folders.define("w.ort", definitionText("W", 1) + definitionText("V", 1));
  folders.define("w-localized.de", "TRANSFORMER_NAME: W\nLOCALIZED_NAME: Weg\n");
  folders.write("extra/w.ort", definitionText("W", 1));
  folders.write("extra/w-localized.de", "TRANSFORMER_NAME: V\nLOCALIZED_NAME: Vogel\n");
  folders.define("CategoryDefinitions",
                 "CATEGORY_DESCRIPTION_START Attributes\nabout them\nCATEGORY_DESCRIPTION_END\n"
                 "CATEGORY_DESCRIPTION_START Empty\nCATEGORY_DESCRIPTION_END\n");
  QStringList lines;
  {
    const LanguageGuard german("de");
    TransformerMgr& registry = folders.load();
    EXPECT_EQ(registry.lastError(), "");
    const Copy copy(registry.getTransformer("T", 2));
    EXPECT_EQ(copy->getLocalizedName(), QString::fromUtf8("Ländermühle"));
    EXPECT_EQ(copy->getIdentifier(), QString::fromUtf8("Ländermühle"));
    EXPECT_EQ(copy->getName(), "T");
    EXPECT_EQ(copy->getParameterPrompt("P"), QString::fromUtf8("Größe"));
    EXPECT_FALSE(copy->hasParameter("NONE"));
    EXPECT_EQ(Copy(registry.getTransformer("T", 1))->getParameterPrompt("P"), "Size");
    EXPECT_EQ(Copy(registry.getTransformer("U", 7))->getLocalizedName(), "Uhr");
    EXPECT_EQ(Copy(registry.getTransformer("W", 1))->getLocalizedName(), "W");
    EXPECT_EQ(Copy(registry.getTransformer("V", 1))->getLocalizedName(), "Vogel");
    EXPECT_EQ(registry.getLocalizedCategoryName("Attributes"), "Merkmale");
    EXPECT_EQ(registry.getCategoryNameFromLocalizedCategoryName("Merkmale"), "Attributes");
    EXPECT_EQ(registry.getCategoryNameFromLocalizedCategoryName("Attributes"), "Attributes");
    EXPECT_EQ(registry.getCategoryTransformers("Merkmale"), (QStringList{"T", "U"}));
    EXPECT_TRUE(registry.getCategoryDesc("Attributes", lines));
    EXPECT_EQ(lines, (QStringList{"über Merkmale"}));
  }
  const LanguageGuard english("en");
  TransformerMgr& registry = folders.load();
  EXPECT_EQ(Copy(registry.getTransformer("T", 2))->getLocalizedName(), "T");
  EXPECT_EQ(registry.getLocalizedCategoryName("Attributes"), "Attributes");
  EXPECT_TRUE(registry.getCategoryDesc("Attributes", lines));
  EXPECT_EQ(lines, (QStringList{"about them"}));
  EXPECT_FALSE(registry.getCategoryDesc("Merkmale", lines));
  EXPECT_FALSE(registry.getCategoryDesc("Empty", lines));
}

TEST(Registry, ChangeLogPages) {
  const auto change = [](const char* entry) {
    return QByteArray("CHANGE_LOG_START\n\n") + entry + "\nCHANGE_LOG_END\n";
  };
  RegistryFolders folders;
  folders.define(
      "a.ort",
      definitionText("T", 0, change("zero")) + definitionText("T", 2, change("a < b & \"c\"")) +
          definitionText("T", 3, change("three\x01")) + definitionText("New<T>", 1, change("fresh")) +
          definitionText("Old", 4, "VISIBLE: no\nREPLACED_BY: New<T>\n" + change("last")) +
          definitionText("Quiet", 1) + definitionText("Gone", 1, "VISIBLE: no\nREPLACED_BY: Nobody"));
  TransformerMgr& registry = folders.load();
  const LanguageGuard english("en");
  const struct {
    const char* name;
    int from;
    const char* newName;
    int to;
    const char* heading;
    const char* changes;  // headings with "!"; without the marks of lists and paragraphs
  } cases[] = {
      {"T", 0, "T", 3, "Changes from T (version 0) to T (version 3)",
       "!Version 3 three  !Version 2 a &lt; b &amp; &quot;c&quot;"},
      {"T", 2, "T", 2, "Changes from T (version 2) to T (version 2)",
       "!Version 2 a &lt; b &amp; &quot;c&quot;"},
      {"T", -1, "T", 0, "All changes of T up to version 0", "!Version 0 zero"},
      {"T", 3, "T", 2, "Changes from T (version 3) to T (version 2)", "No changes are recorded."},
      {"Old", 3, "New<T>", -1, "Changes from Old (version 3) to New&lt;T&gt; (version 1)",
       "!New&lt;T&gt;, version 1 fresh !Old, version 4 last"},
      {"Quiet", 0, "Quiet", 2147483647, "Changes from Quiet (version 0) to Quiet (version 2147483647)",
       "No changes are recorded."},
  };
  for (const auto& c : cases) {
    const QString text =
        registry.changeLog(QString::fromLatin1(c.name), c.from, QString::fromLatin1(c.newName), c.to)
            .join('\n');
    const QString body = text.section("<body>\n", 1).section("\n</body>\n</html>", 0, 0);
    const QString heading = body.section('\n', 0, 0);
    EXPECT_EQ(heading, QString("<h2 class=\"headline\">%1</h2>").arg(c.heading));
    QString changes = body.section('\n', 1);
    changes.replace("<h3>", "!").replace("</h3>\n<ul>\n<li>", " ").remove("</li>\n</ul>").replace('\n', ' ');
    EXPECT_EQ(changes.remove("<p>").remove("</p>").toStdString(), c.changes);
    EXPECT_TRUE(
        text.startsWith("<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"UTF-8\">\n<title>"));
  }
  const Copy old(registry.getTransformer("Old", 4));
  EXPECT_EQ(registry.changeLog(old.get()), registry.changeLog("Old", 4, "New<T>", 1).join('\n'));
  const Copy newest(registry.getTransformer("T", 0));
  EXPECT_EQ(registry.changeLog(newest.get()), registry.changeLog("T", 0, "T", 3).join('\n'));
  EXPECT_EQ(registry.changeLog(Copy(registry.getTransformer("Gone", 1)).get()), "");
  EXPECT_EQ(registry.changeLog(nullptr), "");
  ORXString page;
  registry.getChangeLog(newest.get(), page);
  EXPECT_EQ(ORXToQString(page), registry.changeLog(newest.get()));
}

TEST(Registry, Deserialize) {
  RegistryFolders folders;
  folders.define("a.ort",
                 definitionText("T", 2, "ALIASES: Old\nPARAMETER_NAME: P\nPARAMETER_TYPE: TEXT_ENCODED\n"));
  TransformerMgr& registry = folders.load();
  const std::pair<const char*, bool> cases[] = {{"", false},
                                                {"NAME", false},
                                                {"NAME,T", false},
                                                {"NAME,T,VERSION,3", false},
                                                {"VERSION,2,NAME,Old,PARAMETER_VALUES", true},
                                                {"NAME,T,VERSION,-1,PARAMETER_VALUES,\"P,\"\"", true},
                                                {"\"NAME,T,VERSION,2", false}};
  for (const auto& [text, isKnown] : cases)
    EXPECT_EQ(Copy(registry.deserialize(QString::fromLatin1(text))) != nullptr, isKnown) << text;
}
