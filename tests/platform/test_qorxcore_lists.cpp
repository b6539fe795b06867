#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/Quoting.h>

#include <gtest/gtest.h>

namespace {

TEST(Quoting, QuotesEmptyAndSpecialTexts) {
  const std::tuple<const char*, const char*, const char*> cases[] = {
      {"", " ", "\"\""},          {"a b", " ", "\"a b\""}, {"ab", " ", "ab"},
      {"a\"b", "\"", "\"a\"b\""}, {"a b", "", "a b"},      {"", "", "\"\""}};
  for (const auto& [plain, specials, quoted] : cases) {
    EXPECT_EQ(QORXQuotifyString(plain, specials), quoted) << plain;
  }
}

TEST(SdfList, ReadsPackedTexts) {
  const std::tuple<const char*, QStringList> cases[] = {
      {"", {}},
      {"a", {"a"}},
      {"a,b", {"a", "b"}},
      {",", {QString(), QString()}},
      {"a,,b,", {"a", QString(), "b", QString()}},
      {"\"\"", {QString()}},
      {"\"a,b\",c", {"a,b", "c"}},
      {"\"a\"\"b\"", {"a\"b"}},
      {"a, \"b,c\" ,d", {"a", "b,c", "d"}},
      {" a , b", {" a ", " b"}},
      {"\"never, closed", {"never, closed"}},
      {"\"closed\"tail,b", {"closedtail", "b"}},
      {"a\"b,c", {"a\"b", "c"}},
      {"\"", {QString()}},
      {"\"\"\"", {"\""}},
      {"a,\"", {"a", QString()}},
  };
  for (const auto& [packed, list] : cases) {
    EXPECT_EQ(QORXSdfStringToList(packed, QLatin1Char(',')), list) << packed;
  }
}

TEST(SdfList, PacksWithoutNeedlessQuotes) {
  EXPECT_EQ(QORXListToSdfString({"a b", QString(), " c", "d\t", "e,f", "g\"h", "i\nj"}, QLatin1Char(',')),
            "a b,\"\",\" c\",\"d\t\",\"e,f\",\"g\"\"h\",\"i\nj\"");
}

// Every list of up to three of these elements, with separators and quotes that collide with them.
TEST(SdfList, ComesBackFromEveryList) {
  const QStringList elements =
      QString("|a| |\t a|\"|\"\"|'|,|%|a b|\r|x\ny|a\"|\"a|\",\"|{,}|\xc2\xa0").split('|') +
      QStringList{QChar(0), QChar(0xd800)};
  const QChar separators[] = {QLatin1Char(','),  QLatin1Char('%'), QLatin1Char(' '), QLatin1Char('"'),
                              QLatin1Char('\n'), QLatin1Char('a'), QChar(0)};
  const QChar quotes[] = {QLatin1Char('"'), QLatin1Char('\''), QChar(0)};
  for (const QChar separator : separators) {
    for (const QChar quote : quotes) {
      const auto check = [separator, quote](const QStringList& list) {
        const QString packed = QORXListToSdfString(list, separator, quote);
        ASSERT_EQ(QORXSdfStringToList(packed, separator, quote), list) << qPrintable(packed);
      };
      check({});
      for (const QString& first : elements) {
        check({first});
        for (const QString& second : elements) {
          check({first, second});
          check({first, second, first});
        }
      }
    }
  }
}

TEST(TypedList, ReadsWhatPeopleType) {
  const std::tuple<const char*, QStringList> cases[] = {
      {"", {}},
      {" , ,", {}},
      {"a, b ,c", {"a", "b", "c"}},
      {"{a,b},c", {"a,b", "c"}},
      {"{a {b, c}} , d", {"a {b, c}", "d"}},
      {"\"a,b\", \"c\"\"d\"", {"a,b", "c\"d"}},
      {"{},\"\",a", {"a"}},
      {"{a} {b},c", {"{a} {b}", "c"}},
      {"{never, closed", {"never, closed"}},
      {"a{b,c}d", {"a{b", "c}d"}},
      {"}", {"}"}},
      {"{", {}},
      {"a,{", {"a"}},
  };
  for (const auto& [typed, list] : cases) {
    EXPECT_EQ(QORXStringToList(typed, QLatin1Char(',')), list) << typed;
  }
  EXPECT_EQ(QORXStringToList("  a {b c} \"d e\" ", QLatin1Char(' ')), (QStringList{"a", "b c", "d e"}));
  EXPECT_EQ(QORXStringToList("a{b", QLatin1Char('{')), (QStringList{"a", "b"}));
}

TEST(Lists, TakeLongTexts) {
  constexpr int kCount = 1 << 18;
  EXPECT_EQ(QORXSdfStringToList(QString(kCount, QLatin1Char(',')), QLatin1Char(',')).size(), kCount + 1);
  EXPECT_EQ(QORXSdfStringToList(QString("\"a\",").repeated(kCount), QLatin1Char(',')).size(), kCount + 1);
  EXPECT_EQ(QORXSdfStringToList(QString(kCount, QLatin1Char('"')), QLatin1Char(',')).first().size(),
            kCount / 2 - 1);
  EXPECT_EQ(QORXStringToList(QString("{,").repeated(kCount), QLatin1Char(',')).size(), 1);
  EXPECT_EQ(QORXStringToList(QString("{a}b,").repeated(kCount), QLatin1Char(',')).size(), kCount);
}

}  // namespace
