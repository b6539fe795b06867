// Loading reads only what registration needs; nobody may notice.
#include <platform/qorxcore/qorxcore.h>
#include <tests/registry/DefinitionFields.h>
#include <tests/registry/RegistryFolders.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/TransformerCfg.h>

#include <QFile>
#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <iostream>
#include <map>
#include <memory>
#include <string>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using Copy = std::unique_ptr<TransformerCfg>;

std::map<std::pair<QString, int>, Copy> everything(TransformerMgr& registry) {
  std::map<std::pair<QString, int>, Copy> copies;
  for (const QString& name : registry.transformerNames()) {
    for (const int version : registry.transformerVersions(name))
      copies[{name, version}].reset(registry.getTransformer(name, version));
  }
  return copies;
}

}  // namespace

TEST(Loading, WhatIsAskedLateIsAsItWasAtLoading) {
  const std::pair<const char*, const char*> cases[] = {{"/resources/transformers", "en"},
                                                       {"/resources/transformers", "de"},
                                                       {"/fuzz/corpus/definitions", "en"},
                                                       {"/fuzz/corpus/definitions", "de"}};
  const QString before = QORXLanguage();
  for (const auto& [source, language] : cases) {
    SCOPED_TRACE(std::string(source) + " " + language);
    RegistryFolders folders;
    const QString home = folders.path("home/transformers");
    ASSERT_TRUE(QFile::link(QStringLiteral(ORX_SOURCE_DIR) + source, home));
    const QString extra =
        folders.write("extra/a-localized.de",
                      "TRANSFORMER_NAME: Parameters\nVERSION: 0\nLOCALIZED_NAME: Gr\xc3\xb6\xc3\x9f"
                      "e\n");
    qputenv("ORX_AWKWARD", "not here");
    QORXSetLanguage(language);
    const auto early = everything(folders.load());
    TransformerMgr& registry = folders.load();
    // What changes now comes too late.
    qunsetenv("ORX_AWKWARD");
    QORXSetLanguage(QStringLiteral("fr"));
    ASSERT_TRUE(QFile::remove(home) && QFile::remove(extra));
    const auto late = everything(registry);
    QORXSetLanguage(before);
    ASSERT_EQ(late.size(), early.size());
    EXPECT_GE(early.size(), 20u);
    for (const auto& [key, copy] : late) {
      const Copy& first = early.at(key);
      ASSERT_TRUE(copy && first) << key.first.toStdString();
      EXPECT_TRUE(definitionFields(copy->definition()->fields) ==
                  definitionFields(first->definition()->fields));
      EXPECT_EQ(copy->getLocalizedName(), first->getLocalizedName());
      EXPECT_EQ(copy->dependencyMsg(), first->dependencyMsg());
      EXPECT_EQ(copy->serialize(), first->serialize());
    }
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
  // `told`: what the error says beside the path; none: nothing is lost
  const std::tuple<const char*, QByteArray, QStringList> cases[] = {
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
  for (const auto& [name, content, told] : cases) {
    SCOPED_TRACE(std::string(name) + " " + content.left(40).toStdString());
    RegistryFolders folders;
    folders.define("a.ort", definitionText("A", 1));
    const QString path = folders.define(QString::fromLatin1(name), content);
    folders.define("z.ort", definitionText("Z", 1));
    TransformerMgr& registry = folders.load();
    EXPECT_TRUE(registry.isLoaded());
    EXPECT_EQ(registry.transformerNames(), (QStringList{"A", "Z"}));
    EXPECT_TRUE(Copy(registry.getTransformer("Z", 1)));
    ASSERT_EQ(registry.errors().size(), told.isEmpty() ? 0 : 1) << registry.lastError().toStdString();
    for (const QString& text : told)
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

// Lines without end, behind which a definition stands.
TEST(Loading, AVeryLongFileTakesLittle) {
  RegistryFolders folders;
  const QByteArray text = QByteArray("x\n").repeated(1000000);
  folders.define("a.ort", text + definitionText("A", 1));
  EXPECT_EXIT(
      {
        const auto peak = [] {
          rusage usage{};
          ::getrusage(RUSAGE_SELF, &usage);
          return usage.ru_maxrss * 1024LL;
        };
        const auto before = peak();
        const auto start = std::chrono::steady_clock::now();
        const bool isFound = Copy(folders.load().getTransformer("A", 1)) != nullptr;
        const bool isQuick = std::chrono::steady_clock::now() - start < std::chrono::seconds(20);
        std::_Exit(isFound && isQuick && peak() - before < 2 * text.size() + 32 * 1024 * 1024 ? 0 : 1);
      },
      testing::ExitedWithCode(0), "");
}
