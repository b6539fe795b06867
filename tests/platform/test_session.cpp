#include <platform/session/session.h>

#include <gtest/gtest.h>

namespace {

QString text(const char* utf8) {
  return QString::fromUtf8(utf8);
}

TEST(ClosedString, KeepsNullsAndOwnsItsBytes) {
  char bytes[] = {'a', '\0', 'b'};
  ORXString string;
  EXPECT_STREQ(string.data(), "");
  string.set(bytes, sizeof bytes);
  bytes[0] = 'x';
  ASSERT_EQ(string.length(), 3u);
  EXPECT_EQ(QByteArray(string.data(), 4), QByteArray("a\0b\0", 4));
  string.set(string.data() + 2, 1);  // from its own bytes
  EXPECT_STREQ(string.data(), "b");
  EXPECT_THROW(string.set(bytes, static_cast<std::size_t>(-1)), std::length_error);
  EXPECT_STREQ(string.data(), "b");
}

TEST(ClosedString, ConvertsBothWays) {
  for (const QString& plain :
       {QString(), text("plain"), text("\xc3\xa4\xf0\x9f\x97\xba"), "a" + QString(QChar(0))})
    EXPECT_EQ(ORXToQString(ORXString(plain)), plain);
}

TEST(ClosedStringArray, GrowsWithSteadyAddresses) {
  ORXStringArray array(QStringList{text("\xc3\xa4"), QString()});
  const IORXString& first = array.elementAt(0);
  for (int count = 0; count < 1000; ++count) {
    array.append("a\0b", 3);
  }
  EXPECT_EQ(array.entries(), 1002u);
  EXPECT_EQ(ORXToQString(first), text("\xc3\xa4"));
  EXPECT_EQ(array.elementAt(1001).length(), 3u);
  EXPECT_EQ(array.elementAt(1002).length(), 0u);
  ORXAssign(array, {text("x"), text("y")});
  EXPECT_EQ(ORXToQStringList(array), (QStringList{text("x"), text("y")}));
  array.clear();
  EXPECT_TRUE(ORXToQStringList(array).isEmpty());
}

TEST(Session, KeepsSettingsByName) {
  ORXSession session;
  QString value = text("untouched");
  EXPECT_FALSE(session.getSetting(text("name"), value));
  EXPECT_EQ(value, text("untouched"));
  for (const QString& set : {QString(), text("later")}) {
    session.setSetting(text("name"), set);
    EXPECT_TRUE(session.getSetting(text("name"), value) && value == set);
  }
  EXPECT_FALSE(session.getSetting(text("NAME"), value));
}

}  // namespace
