#include "SpecialisedSetup.h"
#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

std::unique_ptr<TransformerCfg> evaluatorWith(const QString& storedExpression) {
  auto cfg = makeShipped("ExpressionEvaluator");
  cfg->setInputAttributes("INPUT", {"a", "b"});
  EXPECT_TRUE(cfg->setParameterValue("EXPRESSION", storedExpression, false));
  return cfg;
}

}  // namespace

TEST(ExpressionEvaluator, ExpressionsHaveToBeUnderstood) {
  struct Case {
    const char* expression;
    const char* rest;  // that is not understood; "" for an end that comes too early, null when all is well
  };
  const Case cases[] = {
      {"1", nullptr},
      {" .5 * 2.e-3 + 1E9 ", nullptr},
      {"-@Value(a) / (@Value(b) + 2) % 3", nullptr},
      {"not @Value(a) = \"x \"\"y\"\" (\" or @Value(b) != 2", nullptr},
      {"max(1, min(@Value(a), 2)) >= pi()", nullptr},
      {"sin (1)", nullptr},
      {"- - +1", nullptr},
      {"1 AND NOT 2", nullptr},
      {"@Value(a", "@Value(a"},
      {"1 +", ""},
      {"(1", ""},
      {"max(1,", ""},
      {"max(1,)", ")"},
      {"()", ")"},
      {"1)", ")"},
      {"1 2", "2"},
      {"1,2", ",2"},
      {"(1,2)", ",2)"},
      {"* 2", "* 2"},
      {"1 == 2", "= 2"},
      {"2x", "2x"},
      {"1.", nullptr},
      {".", "."},
      {"a + 1", "a + 1"},
      {"and (1)", "and (1)"},
      {"\"open", "\"open"},
      {"1 + @Other(2)", "@Other(2)"},
  };
  for (const Case& c : cases) {
    const auto cfg = evaluatorWith(QORXWwjdEncode(c.expression));
    EXPECT_EQ(refusalOf(*cfg, "EXPRESSION"), !c.rest    ? QString()
                                             : !*c.rest ? TransformResString(370702)
                                                        : TransformResString(370701, c.rest))
        << c.expression;
  }
  EXPECT_EQ(refusalOf(*evaluatorWith(""), "EXPRESSION"), TransformResString(370608, "Expression"));
  EXPECT_EQ(refusalOf(*evaluatorWith("1<space>$(P)<space>2"), "EXPRESSION"), "") << "P may be an operator";
  EXPECT_EQ(refusalOf(*evaluatorWith("@Value<leftparenthesis>c<rightparenthesis>"), "EXPRESSION"),
            TransformResString(370607, "'c'"));
  EXPECT_EQ(refusalOf(*evaluatorWith("ORX_CONDITIONAL:1=1;2;3+"), "EXPRESSION"), TransformResString(370702));
  const QString deep = QString(100000, '(') + "1" + QString(100000, ')');
  EXPECT_EQ(refusalOf(*evaluatorWith(QORXWwjdEncode(deep)), "EXPRESSION"), "");
  EXPECT_EQ(refusalOf(*evaluatorWith("1<space>" + QString(100, 'x')), "EXPRESSION"),
            TransformResString(370701, QString(40, 'x') + QChar(0x2026)));
}

TEST(ExpressionEvaluator, ExpressionsAreWrittenAsValues) {
  struct Case {
    const char* stored;
    int build;
    const char* written;
  };
  const Case cases[] = {
      {"<commercialat>Value<leftparenthesis>a<rightparenthesis><solidus>2", 18286,
       "@EvaluateExpression(FDIV,FLOAT,EXPRESSION,@Value(a)<solidus>2)"},
      {"7<solidus>2", 15179, "@EvaluateExpression(FLOAT,EXPRESSION,7<solidus>2)"},
      {"$(P)*2", 18286, "@EvaluateExpression(FDIV,FLOAT,EXPRESSION,$(P)*2)"},
      {"ORX_CONDITIONAL:1=1;2;3", 18286, "@EvaluateExpression(FDIV,FLOAT,EXPRESSION,@Choose(1=1,2,3))"},
      {"<Unused>", 18286, "<Unused>"},
  };
  for (const Case& c : cases) {
    const auto cfg = evaluatorWith(c.stored);
    cfg->setLastParmEditBuild(c.build);
    EXPECT_EQ(writtenValue(*cfg, "EXPRESSION"), c.written);
    EXPECT_EQ(writtenValue(*cfg, "RESULT_ATTRIBUTE"), "result");
  }
}

TEST(ExpressionEvaluator, ForeignOperatorsAreUpgraded) {
  struct Case {
    const char* before;
    const char* after;
  };
  const Case cases[] = {
      {"@Value(a==b) == 1 && !(2 <> 3)", "@Value(a==b) = 1  and   not (2 != 3)"},
      {"\"!\" == \"a||b\" || 1 != 2", "\"!\" = \"a||b\"  or  1 != 2"},
      {"1 = 2", "1 = 2"},
      {"1 == ", "1 == "},
      {"\"!", "\"!"},
  };
  for (const Case& c : cases) {
    const auto cfg = evaluatorWith(QORXWwjdEncode(c.before));
    cfg->autoUpgradeTransformer();
    EXPECT_EQ(QORXWwjdDecode(cfg->getParameterValue("EXPRESSION")), c.after);
    EXPECT_EQ(cfg->isAutoUpgraded(), QString(c.before) != c.after) << c.before;
  }
}
