#include <platform/qorxcore/Language.h>
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

QString text(const char* utf8) {
  return QString::fromUtf8(utf8);
}

TEST(Language, ReadsLocaleNames) {
  const std::tuple<const char*, const char*> cases[] = {
      {"de", "de"},    {"DE", "de"},   {"de_AT.UTF-8", "de"}, {"fr.UTF-8", "fr"}, {"fr@euro", "fr"},
      {"pt-BR", "pt"}, {"C", "en"},    {"C.UTF-8", "en"},     {"POSIX", "en"},    {"gsw_CH", "en"},
      {"", "en"},      {"../x", "en"}, {"d1", "en"},          {"d", "en"},        {"\xc3\xa4\xc3\xa4", "en"}};
  for (const auto& [locale, language] : cases) {
    QORXSetLanguage(text("xx"));
    QORXSetLanguage(text(locale));
    EXPECT_EQ(QORXLanguage(), text(language)) << locale;
  }
  QORXSetLanguage(text("en"));
}

TEST(Language, FirstUseReadsTheEnvironment) {
  // The setting is made once per process, so each environment gets a process of its own.
  // `exitCode`: first letter of the language
  const std::tuple<const char*, const char*, const char*, int> cases[] = {{"de_DE", "fr_FR", "it_IT", 'd'},
                                                                          {"", "fr_FR", "it_IT", 'f'},
                                                                          {"", "", "it_IT", 'i'},
                                                                          {"", "", "", 'e'},
                                                                          {"C", "", "it_IT", 'e'}};
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  for (const auto& [all, messages, lang, exitCode] : cases) {
    EXPECT_EXIT(
        {
          qputenv("LC_ALL", all);
          qputenv("LC_MESSAGES", messages);
          qputenv("LANG", lang);
          std::exit(QORXLanguage().at(0).unicode());
        },
        testing::ExitedWithCode(exitCode), "");
  }
}

TEST(Local8Bit, IsUtf8WithNullsKept) {
  const QByteArray bytes("\xc3\xa4\0b", 4);
  EXPECT_EQ(QORXToLocal8Bit(QORXFromLocal8Bit(bytes)), bytes);
  EXPECT_EQ(QORXFromLocal8Bit(bytes), text("\xc3\xa4") + QChar(0) + text("b"));
}

TEST(FileNames, BecomePretty) {
  const QString here = QDir::currentPath();
  const std::tuple<const char*, QString> cases[] = {{"", QString()},
                                                    {"/a//b/./c/../d/", text("/a/b/d")},
                                                    {"/", text("/")},
                                                    {"/..", text("/")},
                                                    {"/../../a", text("/a")},
                                                    {"a/b", here + text("/a/b")},
                                                    {".", here},
                                                    {"a\\b\\..\\c", here + text("/a/c")},
                                                    {"/a\\b", text("/a\\b")},
                                                    {"C:\\data\\x.orw", text("C:/data/x.orw")},
                                                    {"c:/data/../x.orw", text("c:/x.orw")},
                                                    {"a:b", here + text("/a:b")},
                                                    {"\xc3\xa4:/x", here + text("/\xc3\xa4:/x")},
                                                    {"\\\\server\\share", text("/server/share")}};
  for (const auto& [name, pretty] : cases) {
    EXPECT_EQ(QORXPrettyUpFileName(text(name)), pretty) << name;
  }
}

TEST(FileNames, KeepABackslashThatIsPartOfAName) {
  QTemporaryDir folder;
  const QString before = QDir::currentPath();
  ASSERT_TRUE(QDir::setCurrent(folder.path()));
  const QString pretty = QDir::currentPath() + text("/odd\\name");
  ASSERT_TRUE(QFile(text("odd\\name")).open(QIODevice::WriteOnly));
  EXPECT_EQ(QORXPrettyUpFileName(text("odd\\name")), pretty);
  ASSERT_TRUE(QDir::setCurrent(before));
}

TEST(Home, FollowsTheEnvironmentAndFallsBackToTheSourceTree) {
  const QByteArray before = qgetenv("ORX_HOME");
  qputenv("ORX_HOME", "/some//home/");
  EXPECT_EQ(QORXOrxHome(), text("/some/home"));
  qputenv("ORX_HOME", "relative");
  EXPECT_EQ(QORXOrxHome(), QDir::currentPath() + text("/relative"));
  qunsetenv("ORX_HOME");
  EXPECT_EQ(QORXOrxHome(), text(ORX_SOURCE_DIR "/resources"));
  qputenv("ORX_HOME", before);
}

}  // namespace
