#include <platform/qorxcore/Lists.h>
#include <platform/qorxcore/Quoting.h>

#include <gtest/gtest.h>

namespace {

QString text(const char* utf8) {
  return QString::fromUtf8(utf8);
}

TEST(Quoting, QuotesEmptyAndSpecialTexts) {
  const std::tuple<const char*, const char*, const char*> cases[] = {
      {"", " ", "\"\""},          {"a b", " ", "\"a b\""}, {"ab", " ", "ab"},
      {"a\"b", "\"", "\"a\"b\""}, {"a b", "", "a b"},      {"", "", "\"\""}};
  for (const auto& [plain, specials, quoted] : cases) {
    EXPECT_EQ(QORXQuotifyString(text(plain), text(specials)), text(quoted)) << plain;
  }
}

TEST(SdfList, ReadsPackedTexts) {
  const std::tuple<const char*, QStringList> cases[] = {
      {"", {}},
      {"a", {text("a")}},
      {"a,b", {text("a"), text("b")}},
      {",", {QString(), QString()}},
      {"a,,b,", {text("a"), QString(), text("b"), QString()}},
      {"\"\"", {QString()}},
      {"\"a,b\",c", {text("a,b"), text("c")}},
      {"\"a\"\"b\"", {text("a\"b")}},
      {"a, \"b,c\" ,d", {text("a"), text("b,c"), text("d")}},
      {" a , b", {text(" a "), text(" b")}},
      {"\"never, closed", {text("never, closed")}},
      {"\"closed\"tail,b", {text("closedtail"), text("b")}},
      {"a\"b,c", {text("a\"b"), text("c")}},
      {"\"", {QString()}},
      {"\"\"\"", {text("\"")}},
      {"a,\"", {text("a"), QString()}},
  };
  for (const auto& [packed, list] : cases) {
    EXPECT_EQ(QORXSdfStringToList(text(packed), QLatin1Char(',')), list) << packed;
  }
}

TEST(SdfList, PacksWithoutNeedlessQuotes) {
  EXPECT_EQ(QORXListToSdfString(
                {text("a b"), QString(), text(" c"), text("d\t"), text("e,f"), text("g\"h"), text("i\nj")},
                QLatin1Char(',')),
            text("a b,\"\",\" c\",\"d\t\",\"e,f\",\"g\"\"h\",\"i\nj\""));
}

// Every list of up to three of these elements, with separators and quotes that collide with them.
TEST(SdfList, ComesBackFromEveryList) {
  const QStringList elements =
      text("|a| |\t a|\"|\"\"|'|,|%|a b|\r|x\ny|a\"|\"a|\",\"|{,}|\xc2\xa0").split('|') +
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
      {"a, b ,c", {text("a"), text("b"), text("c")}},
      {"{a,b},c", {text("a,b"), text("c")}},
      {"{a {b, c}} , d", {text("a {b, c}"), text("d")}},
      {"\"a,b\", \"c\"\"d\"", {text("a,b"), text("c\"d")}},
      {"{},\"\",a", {text("a")}},
      {"{a} {b},c", {text("{a} {b}"), text("c")}},
      {"{never, closed", {text("never, closed")}},
      {"a{b,c}d", {text("a{b"), text("c}d")}},
      {"}", {text("}")}},
      {"{", {}},
      {"a,{", {text("a")}},
  };
  for (const auto& [typed, list] : cases) {
    EXPECT_EQ(QORXStringToList(text(typed), QLatin1Char(',')), list) << typed;
  }
  EXPECT_EQ(QORXStringToList(text("  a {b c} \"d e\" "), QLatin1Char(' ')),
            (QStringList{text("a"), text("b c"), text("d e")}));
  EXPECT_EQ(QORXStringToList(text("a{b"), QLatin1Char('{')), (QStringList{text("a"), text("b")}));
}

TEST(Lists, TakeLongTexts) {
  constexpr int kCount = 1 << 18;
  EXPECT_EQ(QORXSdfStringToList(QString(kCount, QLatin1Char(',')), QLatin1Char(',')).size(), kCount + 1);
  EXPECT_EQ(QORXSdfStringToList(text("\"a\",").repeated(kCount), QLatin1Char(',')).size(), kCount + 1);
  EXPECT_EQ(QORXSdfStringToList(QString(kCount, QLatin1Char('"')), QLatin1Char(',')).first().size(),
            kCount / 2 - 1);
  EXPECT_EQ(QORXStringToList(text("{,").repeated(kCount), QLatin1Char(',')).size(), 1);
  EXPECT_EQ(QORXStringToList(text("{a}b,").repeated(kCount), QLatin1Char(',')).size(), kCount);
}

}  // namespace
