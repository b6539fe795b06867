#include <platform/qorxcore/WordEncoding.h>

#include <gtest/gtest.h>

#include <ostream>

namespace {

QString fromCodePoint(uint code) {
  if (!QChar::requiresSurrogates(code)) {
    return QString(QChar(static_cast<ushort>(code)));
  }
  return QString(QChar(QChar::highSurrogate(code))) + QChar(QChar::lowSurrogate(code));
}

struct Pair {
  QString plain;
  QString encoded;
};

std::ostream& operator<<(std::ostream& out, const Pair& pair) {
  return out << qPrintable(pair.encoded);
}

class WordEncodingPairs : public testing::TestWithParam<Pair> {};

TEST_P(WordEncodingPairs, GoesBothWays) {
  EXPECT_EQ(QORXWwjdEncode(GetParam().plain), GetParam().encoded);
  EXPECT_EQ(QORXWwjdDecode(GetParam().encoded), GetParam().plain);
}

INSTANTIATE_TEST_SUITE_P(
    Words, WordEncodingPairs,
    testing::Values(
        Pair{QString(), QString()}, Pair{QStringLiteral("orx://"), QStringLiteral("orx:<solidus><solidus>")},
        Pair{QStringLiteral("a-b_c.d:e+f*g=h!i?j~k^l|m#n"), QStringLiteral("a-b_c.d:e+f*g=h!i?j~k^l|m#n")},
        Pair{QStringLiteral(" \"$(<"),
             QStringLiteral("<space><quotationmark><dollarsign><leftparenthesis><lessthansign>")},
        Pair{QStringLiteral(")>%&',;@"),
             QStringLiteral(
                 "<rightparenthesis><greaterthansign><percentsign><ampersand><apostrophe><comma><semicolon>"
                 "<commercialat>")},
        Pair{QStringLiteral("[\\]`{}"),
             QStringLiteral(
                 "<leftsquarebracket><reversesolidus><rightsquarebracket><graveaccent><leftcurlybracket>"
                 "<rightcurlybracket>")},
        Pair{QStringLiteral("a\nb\r\t"), QStringLiteral("a<u000a>b<u000d><u0009>")},
        Pair{QString(QChar(0)) + QChar(0x7f) + QChar(0x85), QStringLiteral("<u0000><u007f><u0085>")},
        Pair{QString::fromUtf8("Stra\xc3\x9f"
                               "e \xf0\x9f\x97\xba"),
             QString::fromUtf8("Stra\xc3\x9f"
                               "e<space>\xf0\x9f\x97\xba")},
        Pair{QString(QChar(0xa0)) + QChar(0x2003) + QChar(0x2028) + QChar(0x205f) + QChar(0x3000),
             QStringLiteral(
                 "<nobreakspace><emspace><lineseparator><mediummathematicalspace><ideographicspace>")},
        Pair{QString(QChar(0xd800)) + QLatin1Char('x') + QChar(0xdc00), QStringLiteral("<ud800>x<udc00>")},
        Pair{QStringLiteral("<space>"), QStringLiteral("<lessthansign>space<greaterthansign>")}));

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

TEST(WordEncoding, LoneSurrogatesComeBackInEveryNeighbourhood) {
  const QChar units[] = {QChar(0xd800), QChar(0xdbff), QChar(0xdc00), QChar(0xdfff), QLatin1Char('a')};
  for (const QChar first : units) {
    for (const QChar second : units) {
      for (const QChar third : units) {
        const QString plain = QString(first) + second + third;
        EXPECT_EQ(QORXWwjdDecode(QORXWwjdEncode(plain)), plain) << plain.toUtf8().toHex().constData();
      }
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
  struct {
    const char* text;
    bool wellFormed;
  } const cases[] = {
      {"", true},         {"abc", true},       {"a<space>b", true}, {"$(NAME)", true}, {"x$(A)<u000a>", true},
      {"a b", false},     {"<Unused>", false}, {"<", false},        {"a>", false},     {"$", false},
      {"$NAME", false},   {"$()", false},      {"$(A", false},      {"$(A B)", false}, {"(A)", false},
      {"$($(A))", false}, {"$(A))", false},    {"<u12>", false},    {"a,b", false},    {"\"a\"", false},
  };
  for (const auto& each : cases) {
    EXPECT_EQ(QORXWwjdIsWellFormed(QLatin1String(each.text)), each.wellFormed) << each.text;
  }
  EXPECT_FALSE(QORXWwjdIsWellFormed(QString(QChar(0xd800))));
}

TEST(WordEncoding, SharesTheTextWhenNothingChanges) {
  const QString plain = QStringLiteral("shared_text");
  const QString unknown = QStringLiteral("<Unused>");
  EXPECT_EQ(QORXWwjdEncode(plain).constData(), plain.constData());
  EXPECT_EQ(QORXWwjdDecode(unknown).constData(), unknown.constData());
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
