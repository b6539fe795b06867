#include <platform/session/session.h>

#include <gtest/gtest.h>

namespace {

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
       QStringList{QString(), "plain", "\xc3\xa4\xf0\x9f\x97\xba", "a" + QString(QChar(0))})
    EXPECT_EQ(ORXToQString(ORXString(plain)), plain);
}

TEST(ClosedStringArray, GrowsWithSteadyAddresses) {
  ORXStringArray array(QStringList{"\xc3\xa4", QString()});
  const IORXString& first = array.elementAt(0);
  for (int count = 0; count < 1000; ++count) {
    array.append("a\0b", 3);
  }
  EXPECT_EQ(array.entries(), 1002u);
  EXPECT_EQ(ORXToQString(first), "\xc3\xa4");
  EXPECT_EQ(array.elementAt(1001).length(), 3u);
  EXPECT_EQ(array.elementAt(1002).length(), 0u);
  ORXAssign(array, {"x", "y"});
  EXPECT_EQ(ORXToQStringList(array), (QStringList{"x", "y"}));
  array.clear();
  EXPECT_TRUE(ORXToQStringList(array).isEmpty());
}

TEST(Session, KeepsSettingsByName) {
  ORXSession session;
  QString value = "untouched";
  EXPECT_FALSE(session.getSetting("name", value));
  EXPECT_EQ(value, "untouched");
  for (const QString& set : QStringList{QString(), "later"}) {
    session.setSetting("name", set);
    EXPECT_TRUE(session.getSetting("name", value) && value == set);
  }
  EXPECT_FALSE(session.getSetting("NAME", value));
}

}  // namespace
