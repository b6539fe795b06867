#include "SpecialisedSetup.h"
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

std::unique_ptr<TransformerCfg> testerWith(const char* tests, const char* combination = "ALL",
                                           const char* expression = "") {
  auto cfg = makeShipped("Tester", 1);
  cfg->setInputAttributes("INPUT", {"id", "name"});
  EXPECT_TRUE(cfg->setParameterValue("TESTS", tests, false));
  EXPECT_TRUE(cfg->setParameterValue("COMBINATION", combination, false));
  EXPECT_TRUE(cfg->setParameterValue("EXPRESSION", expression, false));
  return cfg;
}

// An attribute as cells store it.
#define ATTRIBUTE(name) "@Value<leftparenthesis>" name "<rightparenthesis>"
// The same as it is written.
#define WRITTEN(column, name) "@EvaluateExpression(FDIV,STRING_ENCODED,TESTS." column ",@Value(" name "))"

}  // namespace

TEST(Tester, TestsAreCheckedAndWritten) {
  struct Case {
    const char* tests;
    QString refusal;
    const char* written;
  };
  const Case cases[] = {
      {"", TransformResString(370608, "Tests"), ""},
      {"<Unused>", "", "<Unused>"},
      {"a;EQUALS;5", "", "a;EQUALS;5"},
      {"a;=;5;b;<=;6", "", "a;EQUALS;5;b;AT_MOST;6"},
      {ATTRIBUTE("id") ";EQUALS;" ATTRIBUTE("name"), "",
       WRITTEN("LEFT", "id") ";EQUALS;" WRITTEN("RIGHT", "name")},
      {ATTRIBUTE("nope") ";EQUALS;5", TransformResString(370607, "'nope'"), nullptr},
      {"a;EQUALS;", TransformResString(370608, "Right Value"), "a;EQUALS;"},
      {";EQUALS;5", TransformResString(370608, "Tests"), nullptr},
      {"a;EQUALS;5;b", TransformResString(370703, QStringList{"2", ""}), nullptr},
      {"a;EQUALS;5;b;equals;5", TransformResString(370703, QStringList{"2", "equals"}), nullptr},
      {"a;FILLED;" ATTRIBUTE("nope"), "", "a;FILLED;\"\""},
      {ATTRIBUTE("nope") ";FILLED;", TransformResString(370607, "'nope'"), nullptr},
      {ATTRIBUTE("nope") ";MISSING;x", "", WRITTEN("LEFT", "nope") ";MISSING;\"\""},
      {ATTRIBUTE("nope") ";EXISTS;;" ATTRIBUTE("nope") ";EQUALS;1", TransformResString(370607, "'nope'"),
       nullptr},
      {"a;MATCHES;<leftparenthesis>b", TransformResString(370611, "(b"), nullptr},
      {"a;MATCHES;b<leftsquarebracket>0-9<rightsquarebracket>", "", nullptr},
      {"a;MATCHES;<leftparenthesis>$(P)", "", nullptr},
      {"a;$(P);", "", "a;$(P);"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.tests);
    const auto cfg = testerWith(c.tests);
    EXPECT_EQ(refusalOf(*cfg, "TESTS"), c.refusal);
    EXPECT_EQ(refusalOf(*cfg, "EXPRESSION"), "");
    if (c.written) {
      EXPECT_EQ(writtenValue(*cfg, "TESTS"), c.written);
    }
    EXPECT_EQ(cfg->getParameterValue("TESTS"), c.tests);
  }
}

TEST(Tester, TheCombinationNamesTests) {
  struct Case {
    const char* combination;
    const char* expression;
    QString refusal;
  };
  const Case cases[] = {
      {"ALL", "nonsense", ""},
      {"EXPRESSION", "", TransformResString(370608, "Combination of the Tests")},
      {"The tests as combined below", "", TransformResString(370608, "Combination of the Tests")},
      {"EXPRESSION", "1<space>and<space><leftparenthesis>2<space>or<space>not<space>1<rightparenthesis>", ""},
      {"EXPRESSION", "1<space>AND<space>NOT<leftparenthesis>2<rightparenthesis>", ""},
      {"EXPRESSION", "1<space>and<space>$(P)", ""},
      {"EXPRESSION", "1<space>and", TransformResString(370702)},
      {"EXPRESSION", "<leftparenthesis>1", TransformResString(370702)},
      {"EXPRESSION", "1<space>2", TransformResString(370701, "2")},
      {"EXPRESSION", "1<rightparenthesis>", TransformResString(370701, ")")},
      {"EXPRESSION", "1<space>or<space>3", TransformResString(370705, QStringList{"3", "2"})},
      {"EXPRESSION", "0", TransformResString(370705, QStringList{"0", "2"})},
      {"EXPRESSION", "1+2", TransformResString(370704, "+")},
      {"EXPRESSION", "-1", TransformResString(370704, "-")},
      {"EXPRESSION", "1.0", TransformResString(370704, "1.0")},
      {"EXPRESSION", ATTRIBUTE("id"), TransformResString(370704, "@Value(id)")},
  };
  for (const Case& c : cases) {
    const auto cfg = testerWith("a;EQUALS;5;b;FILLED;", c.combination, c.expression);
    EXPECT_EQ(refusalOf(*cfg, "EXPRESSION"), c.refusal) << c.combination << " " << c.expression;
  }
  const auto cfg = testerWith("a;EQUALS;5", "EXPRESSION", "1");
  EXPECT_FALSE(cfg->parameterSupportsAttributeReference("EXPRESSION"));
  EXPECT_TRUE(cfg->parameterSupportsAttributeReference("TESTS"));
  const QStringList statements = statementsOf(*cfg);
  EXPECT_TRUE(statements.value(0).contains("TESTS a;EQUALS;5 COMBINATION EXPRESSION "));
  EXPECT_EQ(statements.value(1), "FACTORY_OPTION Tester EXPRESSION 1");
}

TEST(Tester, EarlierFormsAreUpgraded) {
  struct Case {
    const char* before;
    const char* after;
  };
  const Case cases[] = {
      {"&id;>=;5;a;FILLED;",
       "<commercialat>Value<leftparenthesis>id<rightparenthesis>;AT_LEAST;5;a;FILLED;\"\""},
      {"a;!=;&name", "a;DIFFERS;<commercialat>Value<leftparenthesis>name<rightparenthesis>"},
      {"a;EQUALS;5;b;FILLED;", "a;EQUALS;5;b;FILLED;"},
      {"a;like;5", "a;like;5"},
      {"", ""},
      {"ORX_CONDITIONAL:a;&b", "ORX_CONDITIONAL:a;&b"},
  };
  for (const Case& c : cases) {
    const auto cfg = testerWith(c.before);
    cfg->autoUpgradeTransformer();
    EXPECT_EQ(cfg->getParameterValue("TESTS"), c.after) << c.before;
    EXPECT_EQ(cfg->isAutoUpgraded(), QString(c.before) != c.after) << c.before;
  }
}
