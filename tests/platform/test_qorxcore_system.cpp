#include <platform/qorxcore/Language.h>
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

TEST(Language, ReadsLocaleNames) {
  const std::tuple<const char*, const char*> cases[] = {
      {"de", "de"},    {"DE", "de"},   {"de_AT.UTF-8", "de"}, {"fr.UTF-8", "fr"}, {"fr@euro", "fr"},
      {"pt-BR", "pt"}, {"C", "en"},    {"C.UTF-8", "en"},     {"POSIX", "en"},    {"gsw_CH", "en"},
      {"", "en"},      {"../x", "en"}, {"d1", "en"},          {"d", "en"},        {"\xc3\xa4\xc3\xa4", "en"}};
  for (const auto& [locale, language] : cases) {
    QORXSetLanguage("xx");
    QORXSetLanguage(locale);
    EXPECT_EQ(QORXLanguage(), language) << locale;
  }
  QORXSetLanguage("en");
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
  EXPECT_EQ(QORXFromLocal8Bit(bytes), QString("\xc3\xa4") + QChar(0) + QString("b"));
}

TEST(FileNames, BecomePretty) {
  const QString here = QDir::currentPath();
  const std::tuple<const char*, QString> cases[] = {{"", QString()},
                                                    {"/a//b/./c/../d/", "/a/b/d"},
                                                    {"/", "/"},
                                                    {"/..", "/"},
                                                    {"/../../a", "/a"},
                                                    {"a/b", here + "/a/b"},
                                                    {".", here},
                                                    {"a\\b\\..\\c", here + "/a/c"},
                                                    {"/a\\b", "/a\\b"},
                                                    {"C:\\data\\x.orw", "C:/data/x.orw"},
                                                    {"c:/data/../x.orw", "c:/x.orw"},
                                                    {"a:b", here + "/a:b"},
                                                    {"\xc3\xa4:/x", here + "/\xc3\xa4:/x"},
                                                    {"\\\\server\\share", "/server/share"}};
  for (const auto& [name, pretty] : cases) {
    EXPECT_EQ(QORXPrettyUpFileName(name), pretty) << name;
  }
}

TEST(FileNames, KeepABackslashThatIsPartOfAName) {
  QTemporaryDir folder;
  const QString before = QDir::currentPath();
  ASSERT_TRUE(QDir::setCurrent(folder.path()));
  const QString pretty = QDir::currentPath() + QString("/odd\\name");
  ASSERT_TRUE(QFile("odd\\name").open(QIODevice::WriteOnly));
  EXPECT_EQ(QORXPrettyUpFileName("odd\\name"), pretty);
  ASSERT_TRUE(QDir::setCurrent(before));
}

TEST(Home, FollowsTheEnvironmentAndFallsBackToTheSourceTree) {
  const QByteArray before = qgetenv("ORX_HOME");
  qputenv("ORX_HOME", "/some//home/");
  EXPECT_EQ(QORXOrxHome(), "/some/home");
  qputenv("ORX_HOME", "relative");
  EXPECT_EQ(QORXOrxHome(), QDir::currentPath() + QString("/relative"));
  qunsetenv("ORX_HOME");
  EXPECT_EQ(QORXOrxHome(), ORX_SOURCE_DIR "/resources");
  qputenv("ORX_HOME", before);
}

}  // namespace
