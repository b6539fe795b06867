// Loading reads only what registration needs; nobody may notice.
#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/qorxcore.h>
#include <tests/registry/AwkwardDefinitions.h>
#include <tests/registry/DefinitionFields.h>
#include <tests/registry/RegistryFolders.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/TransformerCfg.h>
#include <transform/files/FolderListing.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileParser.h>

#include <QDir>
#include <QFile>
#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <fstream>
#include <iostream>
#include <map>
#include <memory>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using Copy = std::unique_ptr<TransformerCfg>;

// Makes every prototype while loading, in the plainest way.
class EagerRegistry {
 public:
  std::map<QString, std::map<int, Copy>> prototypes;
  QStringList names;
  QStringList visibleNames;
  QStringList categories;
  std::map<QString, QStringList> namesOfCategory;
  std::map<QString, QString> aliases;
  std::map<QString, QStringList> categoryDescriptions;
  std::map<QString, QString> categoryNames;

  void load() {
    const QString companionEnd = QLatin1String("-localized.") + QORXLanguage();
    for (const QString& folder : ORX_resourceDirectories(QStringLiteral("transformer"))) {
      const QStringList files = FolderListing::files(folder).names();
      for (const QString& name : files) {
        if (name.endsWith(QLatin1String(".ort")) || name == QLatin1String("CategoryDefinitions.ort"))
          define(folder + '/' + name);
      }
      for (const QString& name : files.filter(companionEnd))
        localize(folder + '/' + name);
    }
  }

 private:
  void define(const QString& path) {
    QFile file(path);
    DefinitionFileParser parser;
    ASSERT_TRUE(file.open(QIODevice::ReadOnly) && parser.parse(file, path));
    for (const CategoryText& category : parser.categories())
      categoryDescriptions[category.name] = category.texts();
    for (const DefinitionText& text : parser.definitions()) {
      const TransformerDefinition fields = DefinitionFileParser::interpret(text);
      if (!fields.name.isEmpty())
        add(fields);
    }
  }

  void add(const TransformerDefinition& fields) {
    Copy prototype(new TransformerCfg);
    prototype->configure(fields);
    std::map<int, Copy>& versions = prototypes[fields.name];
    if (versions.empty()) {
      names << fields.name;
      if (prototype->isVisible())
        visibleNames << fields.name;
    }
    if (versions.empty() || fields.version >= versions.rbegin()->first) {
      for (const QString& tag : prototype->tags()) {
        if (namesOfCategory.count(tag) == 0)
          categories << tag;
        if (!namesOfCategory[tag].contains(fields.name))
          namesOfCategory[tag] << fields.name;
      }
    }
    versions[fields.version] = std::move(prototype);
    for (const QString& alias : fields.aliases)
      aliases.emplace(alias, fields.name);
  }

  void localize(const QString& path) {
    QFile file(path);
    CompanionFileParser parser;
    ASSERT_TRUE(file.open(QIODevice::ReadOnly) && parser.parse(file));
    for (const CompanionEntry& entry : parser.entries()) {
      for (auto& [version, prototype] : prototypes[entry.name]) {
        if (!entry.hasVersion || entry.version == version)
          localize(entry, *prototype);
      }
    }
    for (const CategoryText& category : parser.categoryDescriptions())
      categoryDescriptions[category.name] = category.texts();
    for (const CategoryName& category : parser.categoryNames())
      categoryNames[category.name] = category.localizedName;
  }

  static void localize(const CompanionEntry& entry, TransformerCfg& prototype) {
    if (!entry.localizedName.isEmpty())
      prototype.setLocalizedName(entry.localizedName);
    for (const CompanionEntry::Text& prompt : entry.prompts) {
      if (!prompt.text.isEmpty() && prototype.hasParameter(prompt.name))
        prototype.setParameterPrompt(prompt.name, prompt.text);
    }
    for (const CompanionEntry::Text& tag : entry.tagDescriptions)
      prototype.setTagDescription(tag.name, tag.text);
    if (!entry.descriptionLines.isEmpty())
      prototype.setDescriptionLines(entry.descriptionLines);
    if (!entry.tooltipLines.isEmpty())
      prototype.setTooltipLines(entry.tooltipLines);
    if (!entry.changeLog.isEmpty())
      prototype.setChangeLog(entry.changeLog);
  }
};

void expectSame(const TransformerCfg& lazy, TransformerCfg& eager) {
  eager.setIdentifier(eager.getLocalizedName());  // as copies have it
  EXPECT_TRUE(definitionFields(lazy.definition()->fields) == definitionFields(eager.definition()->fields));
  EXPECT_EQ(lazy.getLocalizedName(), eager.getLocalizedName());
  EXPECT_EQ(lazy.transformerType(), eager.transformerType());
  EXPECT_EQ(lazy.dependencyMet(), eager.dependencyMet());
  EXPECT_EQ(lazy.dependencyMsg(), eager.dependencyMsg());
  EXPECT_EQ(lazy.getParameters(), eager.getParameters());
  for (const QString& name : eager.getParameters()) {
    EXPECT_EQ(lazy.getGuiLine(name), eager.getGuiLine(name));
    EXPECT_EQ(lazy.getParameterValue(name), eager.getParameterValue(name));
  }
}

}  // namespace

TEST(Loading, OnDemandGivesWhatLoadingGave) {
  const struct {
    bool isShipped;
    const char* language;
  } cases[] = {{true, "en"}, {true, "de"}, {false, "en"}, {false, "de"}};
  const QString language = QORXLanguage();
  for (const auto& c : cases) {
    SCOPED_TRACE(std::string(c.isShipped ? "shipped " : "awkward ") + c.language);
    RegistryFolders folders;
    const QString home = folders.path("home/transformers");
    if (c.isShipped) {
      ASSERT_TRUE(QFile::link(QStringLiteral(ORX_SOURCE_DIR "/resources/transformers"), home));
    } else {
      int number = 100;
      for (const QByteArray& text : awkwardDefinitions())
        folders.define(QString::number(number++) + ".ort", text);
      folders.define("a-localized.de",
                     "TRANSFORMER_NAME: Two\nLOCALIZED_NAME: Zwei\nTRANSFORMER_NAME: Parameters\nVERSION: 0\n"
                     "PARAMETER_NAME: P\nPARAMETER_PROMPT: Gr\xC3\xB6\xC3\x9F"
                     "e\nTAG_DESCRIPTION O: Ausgang\n"
                     "CATEGORY_NAME: G,Gruppe\nDESCRIPTION_START\nText\nDESCRIPTION_END\n");
      // Takes the place of one that is localised already, and localises one of the folder before.
      folders.write("extra/b.ort", definitionText("Two", 2, "CATEGORY: Late"));
      folders.write("extra/b-localized.de",
                    "TRANSFORMER_NAME: Blocks\nLOCALIZED_NAME: Bl\xC3\xB6"
                    "cke\n");
    }
    qputenv("ORX_AWKWARD", "not here");
    QORXSetLanguage(QString::fromLatin1(c.language));
    EagerRegistry eager;
    eager.load();
    TransformerMgr& registry = folders.load();
    // What changes now comes too late.
    qunsetenv("ORX_AWKWARD");
    QORXSetLanguage(QStringLiteral("fr"));
    ASSERT_TRUE(c.isShipped ? QFile::remove(home) : QDir(home).removeRecursively());
    QDir(folders.path("extra")).removeRecursively();

    EXPECT_EQ(registry.transformerNames(), eager.names);
    EXPECT_EQ(registry.visibleTransformerNames(), eager.visibleNames);
    EXPECT_EQ(registry.getCategories(), eager.categories);
    for (const auto& [category, names] : eager.namesOfCategory)
      EXPECT_EQ(registry.getCategoryTransformers(category), names);
    for (const auto& [category, lines] : eager.categoryDescriptions) {
      QStringList got;
      EXPECT_TRUE(registry.getCategoryDesc(category, got));
      EXPECT_EQ(got, lines);
    }
    for (const auto& [category, name] : eager.categoryNames)
      EXPECT_EQ(registry.getLocalizedCategoryName(category), name);
    for (const auto& [alias, name] : eager.aliases)
      EXPECT_EQ(registry.getTransformerNameFromAlias(alias), name);
    for (const auto& [name, versions] : eager.prototypes) {
      for (const auto& [version, prototype] : versions) {
        SCOPED_TRACE(name.toStdString() + " " + std::to_string(version));
        const Copy copy(registry.getTransformer(name, version));
        ASSERT_TRUE(copy);
        expectSame(*copy, *prototype);
      }
      EXPECT_EQ(registry.transformerVersions(name).size(), static_cast<int>(versions.size()));
    }
    QORXSetLanguage(language);
  }
}

TEST(Loading, BadFilesCostNothingElse) {
  QByteArray binary;
  for (int i = 0; i < 4096; ++i)
    binary.append(static_cast<char>(i * 37));
  const QByteArray lost = "TRANSFORMER_NAME: Lost\n";
  QByteArray manyLines = lost;
  for (const QByteArray line = "VERSION: 1\n"; manyLines.size() < 3000000;)
    manyLines += line;
  const struct {
    const char* name;
    QByteArray content;
    QStringList told;  // what the error says beside the path; none: nothing is lost
  } cases[] = {
      {"bad.ort", binary, {"belong to no definition"}},
      {"bad.ort", lost + "TEMPLATE_START\nnever ends\n", {"'Lost'", "TEMPLATE_END"}},
      {"bad.ort", lost + "TOOLTIP_START\n" + definitionText("Swallowed", 1), {"'Lost'"}},
      {"bad.ort", definitionText("A", 1) + definitionText("A", 1), {"version 1", "'A'", "more than once"}},
      {"bad.ort", "TEMPLATE_START\nTEMPLATE_END\n", {"without a name"}},
      {"bad.ort", QByteArray(), {}},
      {"bad.ort", QByteArray(1000000, '\n'), {}},
      {"bad.ort", QByteArray(3000000, 'x'), {"belong to no definition"}},
      {"bad.ort", manyLines, {"'Lost'"}},
      {"bad.ort", QByteArray(65 * 1024 * 1024, '#'), {"64 MiB"}},
      {"bad-localized.en", binary, {}},
      {"bad.txt", definitionText("Text", 1), {}},
      {"bad-localized.xx", definitionText("Companion", 1), {}},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(std::string(c.name) + " " + c.content.left(40).toStdString());
    RegistryFolders folders;
    folders.define("a.ort", definitionText("A", 1));
    const QString path = folders.define(QString::fromLatin1(c.name), c.content);
    folders.define("z.ort", definitionText("Z", 1));
    TransformerMgr& registry = folders.load();
    EXPECT_TRUE(registry.isLoaded());
    EXPECT_EQ(registry.transformerNames(), (QStringList{"A", "Z"}));
    EXPECT_TRUE(Copy(registry.getTransformer("Z", 1)));
    ASSERT_EQ(registry.errors().size(), c.told.isEmpty() ? 0 : 1) << registry.lastError().toStdString();
    for (const QString& text : c.told)
      EXPECT_TRUE(registry.lastError().contains(text) && registry.lastError().contains(path))
          << registry.lastError().toStdString();
  }
}

TEST(Loading, EveryBadFileIsTold) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("A", 1));
  folders.write("home/transformers/dir.ort/readme", "no definition");
  QStringList told = {
      folders.define("c.ort", definitionText("C", 1)), folders.define("d.ort", "TRANSFORMER_NAME: D\n"),
      folders.define("e.ort", "TEMPLATE_START\n"),     folders.path("home/transformers/b.ort"),
      folders.path("home/transformers/f.ort"),         folders.path("home/transformers/shut")};
  folders.define("shut/s.ort", definitionText("S", 1));
  const auto restrict = [](const QString& path, mode_t mode) {
    ASSERT_EQ(::chmod(QFile::encodeName(path).constData(), mode), 0);
  };
  restrict(told[0], 0);
  ASSERT_TRUE(QFile::link(told[3], told[3]));
  ASSERT_EQ(::mkfifo(QFile::encodeName(told[4]).constData(), 0666), 0);
  restrict(told[5], 0);
  restrict(folders.path(""), 0755);
  EXPECT_EXIT(
      {
        // Somebody who may not read everything; the sanitizers' own work at the end needs the rights.
        if (::geteuid() == 0 && ::setuid(65534) != 0)
          std::_Exit(2);
        const QStringList errors = folders.load().errors();
        bool isSame = errors.size() == told.size();
        for (int i = 0; isSame && i < told.size(); ++i)
          isSame = errors[i].contains(told[i]);
        if (!isSame)
          std::cerr << errors.join('\n').toStdString() << std::endl;
        std::_Exit(isSame && folders.load().lastError() == errors.last() ? 0 : 1);
      },
      testing::ExitedWithCode(0), "");
  restrict(told[5], 0755);
}

namespace {

// In bytes; 0 where the system does not tell.
qint64 processMemory(const std::string& key) {
  std::ifstream status("/proc/self/status");
  for (std::string line; std::getline(status, line);) {
    if (line.rfind(key, 0) == 0)
      return std::stoll(line.substr(line.find(':') + 1)) * 1024;
  }
  return 0;
}

}  // namespace

// Lines without end, behind which a definition stands.
TEST(Loading, AVeryLongFileTakesLittle) {
#ifdef NDEBUG
  constexpr int kLines = 10000000;
#else
  constexpr int kLines = 1000000;
#endif
  RegistryFolders folders;
  QByteArray text(2 * kLines, 'x');
  for (int i = 1; i < text.size(); i += 2)
    text[i] = '\n';
  folders.define("a.ort", text + definitionText("A", 1));
  const qint64 allowed = 2 * text.size() + 32 * 1024 * 1024;
  std::ofstream("/proc/self/clear_refs")
      << "5" << std::flush;  // the peak begins anew, where that may be asked
  const qint64 before = processMemory("VmHWM");
  const auto start = std::chrono::steady_clock::now();
  TransformerMgr& registry = folders.load();
  EXPECT_TRUE(Copy(registry.getTransformer("A", 1)));
  EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
  EXPECT_LT(processMemory("VmHWM") - before, allowed);
}
