#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/AttributeReferences.h>
#include <transform/core/ExpressionWriter.h>
#include <transform/core/ValueReferences.h>

#include <QRegularExpression>
#include <gtest/gtest.h>

#include <random>

namespace {

// Makes values whose references are known because it put them there.
struct Maker {
  std::mt19937 random{5};
  bool isEncoded = false;
  QString text;       // the value
  QString plain;      // what it says, each reference as U+0001, its name, U+0002
  QStringList names;  // of its references

  void put(const QString& piece) {
    text += isEncoded ? QORXWwjdEncode(piece) : piece;
    plain += piece;
  }
  QString bracket(const QString& plainBracket) const {
    return isEncoded ? QORXWwjdEncode(plainBracket) : plainBracket;
  }
  QString piece() {
    static const QStringList pieces{"a", "b c", ",", "\"", "@", "Value", "é", "$", "{1}.x", "<"};
    return pieces.at(int(random() % unsigned(pieces.size())));
  }
  void reference() {
    QString name = "n" + piece();
    if (random() % 3 == 0)
      name += "(" + piece() + ")";
    name.remove('$');  // might make it a reference to a macro
    QString stood = name;
    if (random() % 4 == 0) {
      name.remove('"').insert(int(random() % 2), QStringLiteral(")("));
      stood = '"' + name + '"';
    }
    text += QString(isEncoded && random() % 2 ? "<commercialat>" : "@") + "Value" + bracket("(") +
            (isEncoded ? QORXWwjdEncode(stood) : stood) + bracket(")");
    plain += QChar(1) + name + QChar(2);
    names << name;
  }
  void make(int depth) {
    for (unsigned left = 1 + random() % 4; left > 0; --left) {
      switch (random() % 4) {
        case 0:
          reference();
          break;
        case 1:  // text in brackets, or a reference that is none because it has one inside
          if (depth == 0)
            break;
          put(random() % 2 ? "(" : "@Value(x");
          make(depth - 1);
          if (!plain.endsWith(QChar(2)))
            reference();
          put(")");
          break;
        default:
          put(piece());
      }
    }
  }
};

TEST(ValueReferences, AreTheSameForAllWhoAsk) {
  static const QRegularExpression written("@Value\\(([^()]*)\\)");
  Maker maker;
  int found = 0;
  for (int round = 0; round < 5000; ++round) {
    maker.isEncoded = round % 2;
    maker.text.clear();
    maker.plain.clear();
    maker.names.clear();
    maker.make(3);
    SCOPED_TRACE(maker.text.toStdString());
    const GUIType type =
        GUIType::fromTransformerTypeString(maker.isEncoded ? "TEXT_OR_ATTR_ENCODED" : "TEXT_OR_ATTR", "P");
    AttributeReferences references;
    references.addValue(type, maker.text);
    QStringList known = maker.names;
    known.removeDuplicates();
    ASSERT_EQ(references.names(), known);
    if (maker.names.isEmpty())
      continue;
    ++found;
    ASSERT_TRUE(ExpressionWriter::needsWrapping(type, maker.text));
    const QString start =
        QString("@EvaluateExpression(FDIV,%1,P,").arg(maker.isEncoded ? "STRING_ENCODED" : "STRING");
    QString body = ExpressionWriter(true).wrap(maker.text, "P", type.getType(), maker.isEncoded);
    ASSERT_TRUE(body.startsWith(start) && body.endsWith(')'));
    body = body.mid(start.size(), body.size() - start.size() - 1);
    EXPECT_EQ(QORXWwjdDecode(body.replace(written, QString(QChar(1)) + "\\1" + QChar(2))), maker.plain);
  }
  EXPECT_GT(found, 2000);
}

TEST(ValueReferences, WhatIsNone) {
  struct Case {
    const char* type;
    const char* value;
    int count;
    bool isWrapped;
  };
  const Case cases[] = {
      {"TEXT_OR_ATTR", "@Value(a(b)", 0, true},
      {"TEXT", "@Value(a(b)", 0, false},
      {"TEXT", "pre @Value(y(@Value(z))) post", 1, true},
      {"LISTBOX Red%Blue", "Red @Value(a)", 1, true},
      {"EXPRESSION_ENCODED", "1<plussign>@Value<leftparenthesis>a<rightparenthesis>", 1, false},
      {"TEXT_EDIT_PYTHON", "x<space>@Value<leftparenthesis>a<rightparenthesis>", 1, false},
      {"TEXT_EDIT_PYTHON", "@Value<leftparenthesis>a<rightparenthesis>", 1, true},
      {"TEXT_OR_ATTR", "ORX_CONDITIONAL:1;2", 0, true},
      // An encoded "@" is one of the text unless the type says otherwise; encoded letters are letters
      // elsewhere.
      {"TEXT", "x@Value<leftparenthesis>a<rightparenthesis>", 0, false},
      {"TEXT_OR_ATTR", "<commercialat>Value<leftparenthesis>a<rightparenthesis>", 0, false},
      {"TEXT_ENCODED", "<commercialat>Value<leftparenthesis>a<rightparenthesis>", 0, false},
      {"ATTR_LIST_ENCODED", "<commercialat>Value<leftparenthesis>a<rightparenthesis>", 0, false},
      {"ATTR_ENCODED",
       "@Value<leftparenthesis><commercialat>Value<leftparenthesis>a<rightparenthesis><rightparenthesis>", 1,
       true},
      {"TEXT_OR_ATTR_ENCODED", "<commercialat>Value<leftparenthesis>a<rightparenthesis>", 1, true},
      {"TEXT_OR_ATTR_ENCODED", "<u0040>Value<leftparenthesis>a<rightparenthesis>", 0, false},
      {"TEXT_ENCODED", "ORX_CONDITIONAL:1;<commercialat>Value<leftparenthesis>a<rightparenthesis>", 1, true},
  };
  for (const Case& c : cases) {
    const GUIType type = GUIType::fromTransformerTypeString(c.type, "P");
    EXPECT_EQ(int(valueReferences(type, c.value).size()), c.count) << c.type << ' ' << c.value;
    EXPECT_EQ(ExpressionWriter::needsWrapping(type, c.value), c.isWrapped) << c.type << ' ' << c.value;
  }
  // Word-encoded inside the name, or a reference to a macro: told apart when written.
  const auto names = valueReferences(
      "@Value<leftparenthesis><dollarsign><leftparenthesis>x<rightparenthesis>"
      "<rightparenthesis> @Value($(M) b)");
  ASSERT_EQ(names.size(), 2u);
  EXPECT_EQ(names[0].word, "<dollarsign><leftparenthesis>x<rightparenthesis>");
  EXPECT_EQ(names[1].word, "$(M)<space>b");
}

TEST(ValueReferences, HostileTextsTakeTimeInProportion) {
  const int count = 100000;
  const QString opens = QString("@Value(").repeated(count);
  const auto innermost = valueReferences(opens + "a" + QString(")").repeated(count));
  ASSERT_EQ(innermost.size(), 1u);
  EXPECT_EQ(innermost.front().name, "a");
  EXPECT_TRUE(valueReferences(opens).empty());
  EXPECT_EQ(valueReferences(opens + "a)").size(), 1u);
}

}  // namespace
