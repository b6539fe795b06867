#include "SpecialisedSetup.h"
#include <transform/specialised/TransformerCfgFactory.h>

#include <gtest/gtest.h>

#include <typeinfo>

namespace {

struct Case {
  const char* name;
  int version;
  const char* className;  // empty for the plain class
};

}  // namespace

TEST(Factory, TheTableGivesEachTransformerItsClass) {
  const Case cases[] = {
      {"AttributeValueMapper", 1, "ValueMapperTransformerCfg"},
      {"BulkAttributeRemover", 1, "AttributeExpressionRemoverTransformerCfg"},
      {"ExpressionEvaluator", 1, "ExpressionEvaluatorCfg"},
      {"Tester", 1, "TesterTransformerCfg"},
      {"ParameterFetcher", 0, "ParameterFetcherTransformerCfg"},
      {"ParameterFetcher", 3, "ParameterFetcherTransformerCfg"},
      {"XMLTemplater", 1, "XMLTemplaterTransformerCfg"},
      {"JSONTemplater", 1, "XMLTemplaterTransformerCfg"},
      {"XMLUpdater", 1, "XMLUpdaterTransformerCfg"},
      {"JSONUpdater", 1, "XMLUpdaterTransformerCfg"},
      {"ChartGenerator", 1, "ChartGeneratorTransformerCfg"},
      {"HTMLReportGenerator", 1, "ReportGeneratorTransformerCfg"},
  };
  for (const Case& c : cases) {
    const QString name = QString::fromLatin1(c.name);
    const std::unique_ptr<TransformerCfg> made(createTransformerCfg(name, c.version));
    const std::unique_ptr<TransformerCfg> copy(made->getCopy());
    EXPECT_EQ(findTransformerCfgRule(name, c.version)->type, typeid(*made)) << c.name;
    EXPECT_TRUE(QString::fromLatin1(typeid(*made).name()).endsWith(c.className)) << c.name;
    EXPECT_EQ(typeid(*copy), typeid(*made)) << c.name;
    for (const QString& other : {name.toLower(), name + " ", name.mid(1)}) {
      EXPECT_FALSE(findTransformerCfgRule(other, c.version)) << other.toStdString();
    }
  }
  // Names whose class serves none of these versions, and none at all.
  for (const Case& c : {Case{"ORXServerJobSubmitter", 2, ""},
                        {"AttributeSplitter", 1, ""},
                        {"Deaggregator", 6, ""},
                        {"TclCaller", 3, ""},
                        {"TestSuite.WorkspaceRunner", 0, ""},
                        {"", 0, ""}}) {
    const std::unique_ptr<TransformerCfg> made(createTransformerCfg(c.name, c.version));
    EXPECT_EQ(typeid(*made), typeid(TransformerCfg)) << c.name;
  }
}

TEST(Factory, TheFirstFittingRuleDecides) {
  struct Old : TransformerCfg {};
  struct New : TransformerCfg {};
  struct Two : TransformerCfg {};
  const auto make = []() -> TransformerCfg* { return new TransformerCfg; };
  constexpr int kHighest = std::numeric_limits<int>::max();
  const std::vector<TransformerCfgRule> rules = {
      {{QLatin1String("A")}, {0, 1}, typeid(Old), make},
      {{QLatin1String("A")}, {3}, typeid(New), make},
      {{QLatin1String("B"), QLatin1String("C")}, {2, 2}, typeid(Two), make},
      {{QLatin1String("A")}, {0}, typeid(TransformerCfg), make},
  };
  struct Choice {
    const char* name;
    int version;
    std::type_index type;  // that of void for none
  };
  const Choice cases[] = {
      {"A", 0, typeid(Old)},  {"A", 1, typeid(Old)},        {"A", 2, typeid(TransformerCfg)},
      {"A", 3, typeid(New)},  {"A", kHighest, typeid(New)}, {"B", 1, typeid(void)},
      {"B", 2, typeid(Two)},  {"C", 2, typeid(Two)},        {"C", 3, typeid(void)},
      {"a", 0, typeid(void)}, {"", 0, typeid(void)}};
  for (const Choice& c : cases) {
    const TransformerCfgRule* rule = findTransformerCfgRule(rules, QString::fromLatin1(c.name), c.version);
    EXPECT_EQ(rule ? rule->type : std::type_index(typeid(void)), c.type) << c.name << " " << c.version;
  }
}
