#include <platform/qorxcore/WordEncoding.h>

#include <gtest/gtest.h>

#include <utility>

namespace {

QString fromCodePoint(uint code) {
  if (!QChar::requiresSurrogates(code)) {
    return QString(QChar(static_cast<ushort>(code)));
  }
  return QString(QChar(QChar::highSurrogate(code))) + QChar(QChar::lowSurrogate(code));
}

TEST(WordEncoding, GoesBothWays) {
  const std::pair<QString, QString> cases[] = {
      {"", ""},
      {"orx://", "orx:<solidus><solidus>"},
      {"a-b_c.d:e+f*g=h!i?j~k^l|m#n", "a-b_c.d:e+f*g=h!i?j~k^l|m#n"},
      {" \"$(<", "<space><quotationmark><dollarsign><leftparenthesis><lessthansign>"},
      {")>%&'", "<rightparenthesis><greaterthansign><percentsign><ampersand><apostrophe>"},
      {",;@`", "<comma><semicolon><commercialat><graveaccent>"},
      {"[\\]", "<leftsquarebracket><reversesolidus><rightsquarebracket>"},
      {"{}", "<leftcurlybracket><rightcurlybracket>"},
      {"a\nb\r\t", "a<u000a>b<u000d><u0009>"},
      {QString(QChar(0)) + "\u007f\u0085", "<u0000><u007f><u0085>"},
      {"Stra\u00dfe \U0001f5fa", "Stra\u00dfe<space>\U0001f5fa"},
      {"\u00a0\u2003\u2028", "<nobreakspace><emspace><lineseparator>"},
      {"\u205f\u3000", "<mediummathematicalspace><ideographicspace>"},
      {QChar(0xd800) + QString("x") + QChar(0xdc00), "<ud800>x<udc00>"},
      {"<space>", "<lessthansign>space<greaterthansign>"},
  };
  for (const auto& [plain, encoded] : cases) {
    EXPECT_EQ(QORXWwjdEncode(plain), encoded);
    EXPECT_EQ(QORXWwjdDecode(encoded), plain) << encoded.toStdString();
  }
}

TEST(WordEncoding, EveryCodePointComesBackAndIsOneToken) {
  // A token must survive blanks, quotes, lists, macros and braces around it.
  const QString forbidden = QStringLiteral(" \t\r\n\"$%&'(),/;@[\\]`{}");
  for (uint code = 0; code <= QChar::LastValidCodePoint; ++code) {
    const QString plain = fromCodePoint(code);
    const QString encoded = QORXWwjdEncode(plain);
    ASSERT_EQ(QORXWwjdDecode(encoded), plain) << code;
    ASSERT_TRUE(QORXWwjdIsWellFormed(encoded)) << code;
    for (const QChar unit : encoded) {
      ASSERT_FALSE(unit.isSpace() || unit.unicode() < 0x20 || forbidden.contains(unit)) << code;
    }
  }
}

TEST(WordEncoding, LeavesWhatIsNoReference) {
  for (const char* text :
       {"<Unused>", "<BLANK>", "<", "<>", "<<<<", "<u>", "<u12>", "<u000A>", "<u110000>", "<u0000041>",
        "<spac", "<space", "< space>", "<Space>", "a>b", "<ug000>", "$(A)"}) {
    EXPECT_EQ(QORXWwjdDecode(QLatin1String(text)), QLatin1String(text));
  }
  EXPECT_EQ(QORXWwjdDecode(QStringLiteral("<<space>><Unused><u0041><u01f5fa>")),
            QString::fromUtf8("< ><Unused>A\xf0\x9f\x97\xba"));
}

TEST(WordEncoding, TellsWellFormedTexts) {
  const std::tuple<const char*, bool> cases[] = {
      {"", true},         {"abc", true},       {"a<space>b", true}, {"$(NAME)", true}, {"x$(A)<u000a>", true},
      {"a b", false},     {"<Unused>", false}, {"<", false},        {"a>", false},     {"$", false},
      {"$NAME", false},   {"$()", false},      {"$(A", false},      {"$(A B)", false}, {"(A)", false},
      {"$($(A))", false}, {"$(A))", false},    {"<u12>", false},    {"a,b", false},    {"\"a\"", false},
  };
  for (const auto& [text, wellFormed] : cases) {
    EXPECT_EQ(QORXWwjdIsWellFormed(QLatin1String(text)), wellFormed) << text;
  }
  EXPECT_FALSE(QORXWwjdIsWellFormed(QString(QChar(0xd800))));
}

TEST(WordEncoding, TakesLongTexts) {
  constexpr int kLength = 1 << 20;
  for (const char character : {'a', ' ', '<', '>', '$'}) {
    const QString plain(kLength, QLatin1Char(character));
    EXPECT_EQ(QORXWwjdDecode(QORXWwjdEncode(plain)), plain) << character;
    EXPECT_EQ(QORXWwjdIsWellFormed(plain), character == 'a') << character;
  }
  const QString openMacros = QStringLiteral("$(a").repeated(kLength / 3);
  EXPECT_FALSE(QORXWwjdIsWellFormed(openMacros));
  const QString openNames = QStringLiteral("<space").repeated(kLength / 6);
  EXPECT_EQ(QORXWwjdDecode(openNames), openNames);
}

}  // namespace
