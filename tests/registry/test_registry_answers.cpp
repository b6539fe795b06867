// What the registry answers once it is loaded: texts from strangers, what validation asks, and copies that
// outlive what they were made from.
#include <platform/qorxcore/qorxcore.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/QtPrinters.h>
#include <transform/core/TransformerCfg.h>

#include <QDir>
#include <gtest/gtest.h>

#include <memory>
#include <random>

namespace {

using Copy = std::unique_ptr<TransformerCfg>;

TEST(RegistryAnswers, SerialisedTextsOfStrangers) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("T", 2,
                                         "PARAMETER_NAME: P\nPARAMETER_TYPE: TEXT_ENCODED\n"
                                         "PARAMETER_NAME: Q\nPARAMETER_TYPE: ATTR\n"));
  TransformerMgr& registry = folders.load();
  // Pieces put together at random: whatever is restored can be written and read again.
  const QStringList pieces =
      QString("NAME,T,VERSION,2,|PARAMETER_VALUES|INPUT_ATTRS|OUTPUT_FUNCTIONS|,|\"|\"\"|P|Q|INPUT|\n| |&")
          .split('|') +
      QStringList{QChar(0xdc00)};
  std::mt19937 random(5);
  int restored = 0;
  for (int i = 0; i < 3000; ++i) {
    QString text = pieces[0];
    for (std::size_t count = random() % 40; count > 0; --count)
      text += pieces[static_cast<int>(random() % static_cast<unsigned>(pieces.size()))];
    const Copy copy(registry.deserialize(text));
    if (!copy)
      continue;
    ++restored;
    const Copy again(registry.deserialize(copy->serialize()));
    ASSERT_TRUE(again) << text.toStdString();
    ASSERT_EQ(again->serialize(), copy->serialize()) << text.toStdString();
  }
  EXPECT_GT(restored, 1000);
  // Long ones cost time by their length alone.
  for (const QString& piece : {QString(","), QString("\""), QString("\"\","), QString("P,")}) {
    QString text = "NAME,T,VERSION,2,PARAMETER_VALUES," + piece.repeated(200000);
    EXPECT_TRUE(Copy(registry.deserialize(text))) << piece.toStdString();
    text = "NAME,T,VERSION,2,INPUT_FILTERS," + QORXListToSdfString({"INPUT", piece.repeated(200000)}, ',');
    EXPECT_TRUE(Copy(registry.deserialize(text))) << piece.toStdString();
  }
}

TEST(RegistryAnswers, ValidationAsksForConnectionsAndMembers) {
  RegistryFolders folders;
  folders.define(
      "a.ort",
      definitionText(
          "T", 1,
          "PARAMETER_NAME: STORE\nPARAMETER_TYPE: TEXT\nPARAMETER_PROMPT: Store\n"
          "PARAMETER_NAME: PACK\nPARAMETER_TYPE: MULTIPARAMETER "
          "<semicolon>,GUI<space>INT<space>N<space>Count,GUI<space>OPTIONAL<space>TEXT<space>T<space>"
          "Text\nPARAMETER_PROMPT: Pack\n"));
  folders.write("home/connections.list", "# shipped\nParcel Store\nwell<space>known\n");
  folders.write("user/orx/connections.list", QString::fromUtf8(" Straßen \n").toUtf8());
  const Copy copy(folders.load().getTransformer("T", 1));
  // `refused`: what the message names; null: accepted
  const std::tuple<const char*, const char*, const char*> cases[] = {
      {"STORE", "orx://?connection=Parcel%20Store", nullptr},
      {"STORE", "orx://x?a=b&connection=well%20known", nullptr},
      {"STORE", "orx:<solidus><solidus>?connection=Stra%C3%9Fen", nullptr},
      {"STORE", "orx://?connection=Parcel", "Parcel"},
      {"STORE", "orx://?connection=%23%20shipped", "# shipped"},
      {"PACK", "N;1;T;x", nullptr},
      {"PACK", "N;1;T;", nullptr},
      {"PACK", "N;;T;x", "Count"},
      {"PACK", "M;;N;1", nullptr},
  };
  for (const auto& [parameter, value, refused] : cases) {
    copy->setParameterValue(parameter, QString::fromUtf8(value), false);
    QString message;
    EXPECT_EQ(copy->validateParameter(parameter, message), refused == nullptr) << value;
    EXPECT_TRUE(refused ? message.contains(refused) : message.isEmpty()) << value << message.toStdString();
  }
}

TEST(RegistryAnswers, AnUnreadableListOfConnectionsIsTold) {
  RegistryFolders folders;
  folders.define("a.ort", definitionText("T", 1));
  folders.write("user/orx/connections.list", "Store\n");
  const QString list = folders.path("home/connections.list");
  ASSERT_TRUE(QDir().mkdir(list));
  const TransformerMgr& registry = folders.load();
  EXPECT_TRUE(registry.lastError().contains(list)) << registry.lastError().toStdString();
  EXPECT_TRUE(registry.isConnectionKnown("Store"));
  EXPECT_TRUE(registry.isLoaded() && registry.transformerExists("T", 1));
  const QString userList = folders.path("user/orx/connections.list");
  ASSERT_TRUE(QFile::remove(userList) && QDir().mkdir(userList));
  ASSERT_EQ(folders.load().errors().size(), 2);
  EXPECT_TRUE(registry.errors().first().contains(list) && registry.lastError().contains(userList));
}

// What HTML forbids in a text is not on the page, wherever it comes from.
TEST(RegistryAnswers, ChangeLogOfAStranger) {
  RegistryFolders folders;
  folders.define("a.ort",
                 definitionText("</title><b>", 1,
                                "CHANGE_LOG_START\n<script>\"'&amp;\x01\x7f\xc2\x85\xef\xbf\xbf\xed\xa0\x80"
                                "\xf0\x9d\x84\x9e\n \nend\nCHANGE_LOG_END"));
  TransformerMgr& registry = folders.load();
  const QStringList page = registry.changeLog("</title><b>", -1, "</title><b>", -1);
  EXPECT_TRUE(page.contains("<title>All changes of &lt;/title&gt;&lt;b&gt; up to version 1</title>"));
  const int list = page.indexOf("<ul>");
  EXPECT_EQ(page.mid(list + 2, 2), (QStringList{"<li>end</li>", "</ul>"}));
  EXPECT_TRUE(page.value(list + 1).startsWith("<li>&lt;script&gt;&quot;'&amp;amp;   "))
      << page.value(list + 1).toStdString();
  for (const uint c : page.join('\n').toUcs4())
    EXPECT_TRUE(c == '\n' || (c >= ' ' && !(c >= 0x7f && c < 0xa0) && !QChar::isNonCharacter(c))) << c;
  EXPECT_TRUE(page.value(list + 1).contains(QString::fromUtf8("\xf0\x9d\x84\x9e")));
}

}  // namespace
