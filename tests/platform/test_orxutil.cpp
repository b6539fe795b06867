#include <platform/orxutil/orxutil.h>
#include <platform/qorxcore/Language.h>
#include <tests/support/Files.h>

#include <QDir>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

class Utilities : public testing::Test {
 protected:
  void SetUp() override {
    // Links on the way to the temporary folder must not show in what is compared.
    m_root = QFileInfo(m_folder.path()).canonicalFilePath();
    for (const char* name : kVariables) {
      m_before.append(qgetenv(name));
      m_wasSet.append(qEnvironmentVariableIsSet(name));
    }
    qputenv("ORX_HOME", path("home").toUtf8());
    qputenv("XDG_DATA_HOME", path("data").toUtf8());
    qunsetenv("ORX_TRANSFORMER_PATH");
    qunsetenv("ORX_FORMAT_PATH");
  }
  void TearDown() override {
    for (int at = 0; at < m_before.size(); ++at) {
      m_wasSet.at(at) ? qputenv(kVariables[at], m_before.at(at)) : qunsetenv(kVariables[at]);
    }
    QORXSetLanguage("en");
  }

  QString path(const char* name) const { return m_root + QLatin1Char('/') + QString(name); }
  // Makes the folders on the way, too.
  QString put(const char* name, const QByteArray& content = "x") const {
    const QFileInfo info(path(name));
    EXPECT_TRUE(QDir().mkpath(info.path()));
    ::put(info.filePath(), content);
    return info.path();
  }

  static constexpr const char* kVariables[] = {"ORX_HOME", "XDG_DATA_HOME", "ORX_TRANSFORMER_PATH",
                                               "ORX_FORMAT_PATH", "HOME"};
  QTemporaryDir m_folder;
  QString m_root;
  QList<QByteArray> m_before;
  QList<bool> m_wasSet;
};

TEST_F(Utilities, FoldersComeInLoadingOrder) {
  const QString custom = put("custom/a.ort");
  const QString data = put("data/orx/transformers/a.ort");
  const QString zebra = put("home/transformers/Zebra/a.ort");
  const QString apple = put("home/transformers/apple/a.ort");
  put("home/transformers/apple/deeper/a.ort");
  put("home/formats/a.fmt");
  const QString formats = put("extra formats/a.fmt");
  ASSERT_TRUE(QDir().mkpath(path("home/transformers/empty")));
  qputenv("ORX_TRANSFORMER_PATH",
          (QString(":/nowhere:") + custom + "/:" + zebra + QLatin1Char(':')).toUtf8());
  qputenv("ORX_FORMAT_PATH", formats.toUtf8());

  EXPECT_EQ(ORX_resourceDirectories("transformer"), (QStringList{zebra, apple, data, custom}));
  const QString home = put("home/transformers/a.ort");
  EXPECT_EQ(ORX_resourceDirectories("transformer"), (QStringList{home, zebra, apple, data, custom}));
  EXPECT_EQ(ORX_resourceDirectories("format"), (QStringList{path("home/formats"), formats}));
}

TEST_F(Utilities, FoldersAreGivenOnceWhateverTheirName) {
  const QString home = put("home/transformers/a.ort");
  ASSERT_TRUE(QFile::link(home, path("alias")));
  qputenv("ORX_TRANSFORMER_PATH", path("alias").toUtf8());
  EXPECT_EQ(ORX_resourceDirectories("transformer"), QStringList{home});
}

TEST_F(Utilities, UserFolderHasADefault) {
  const QString user = put("user/.local/share/orx/transformers/a.ort");
  qputenv("HOME", path("user").toUtf8());
  for (const char* unusable : {"", "relative/path"}) {
    qputenv("XDG_DATA_HOME", unusable);
    EXPECT_EQ(ORX_resourceDirectories("transformer"), QStringList{user}) << unusable;
  }
}

TEST_F(Utilities, OddKindsHaveNoFolders) {
  put("home/secrets/a");
  for (const char* kind : {"", "../secret", "a/b", ".", "\xc3\xa4"}) {
    EXPECT_TRUE(ORX_resourceDirectories(kind).isEmpty()) << kind;
  }
}

TEST_F(Utilities, AddedFoldersStandBehindAllOthers) {
  const QString home = put("home/transformers/a.ort");
  const QString listed = put("listed/a.ort");
  const QString added = put("added/a.ort");
  qputenv("ORX_TRANSFORMER_PATH", listed.toUtf8());
  ORX_addResourceDirectory(added + "/.");
  ORX_addResourceDirectory(added);
  EXPECT_EQ(ORX_resourceDirectories("transformer"), (QStringList{home, listed, added}));
}

TEST_F(Utilities, MessagesComeInTheCurrentLanguageElseInEnglish) {
  put("home/messages/en.msg",
      "\xef\xbb\xbf# comment\n1\tone\r\n2\ttwo\n\n3\tline\\nbreak \\\\ and \\t\n4\ta\tb\nno number\tx\n5 no "
      "tab\n-7\tseven\n"
      "6\t");
  put("home/messages/de.msg", "1\t\xc3\xa4ins\n2\t\n");
  const std::tuple<const char*, long, bool, const char*> cases[] = {
      {"en", 1, true, "one"},   {"de", 1, true, "\xc3\xa4ins"},
      {"de", 2, true, "two"},   {"de", 3, true, "line\nbreak \\ and \\t"},
      {"fr", 4, true, "a\tb"},  {"en", 5, false, ""},
      {"en", 6, false, ""},     {"de", 99, false, ""},
      {"en", -7, true, "seven"}};
  const ORXLocalizedMessageDatabase database;
  for (const auto& [language, number, known, wantedMessage] : cases) {
    QORXSetLanguage(language);
    QORXString message;
    message.assign("left over");
    EXPECT_EQ(database.getMessage(number, message), known) << number;
    EXPECT_EQ(message.toQString(), wantedMessage) << number;
  }
}

TEST_F(Utilities, MessagesMayStandElsewhereOrNowhere) {
  const QString folder = put("elsewhere/en.msg", "1\telsewhere\n");
  QORXString message;
  EXPECT_TRUE(ORXLocalizedMessageDatabase(folder).getMessage(1, message));
  EXPECT_EQ(message.toQString(), "elsewhere");
  EXPECT_FALSE(ORXLocalizedMessageDatabase(path("missing")).getMessage(1, message));
  EXPECT_TRUE(message.toQString().isEmpty());
}

}  // namespace
