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
    EXPECT_STREQ(findTransformerCfgRule(name, c.version)->className.data(), c.className) << c.name;
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
  const auto make = [] { return new TransformerCfg; };
  constexpr int kHighest = TransformerCfgRule::kHighestVersion;
  const std::vector<TransformerCfgRule> rules = {
      {QLatin1String("A"), 0, 1, QLatin1String("Old"), make},
      {QLatin1String("A"), 3, kHighest, QLatin1String("New"), make},
      {QLatin1String("A"), 0, kHighest, QLatin1String("Rest"), make},
      {QLatin1String("B"), 2, 2, QLatin1String("Two"), make},
  };
  const Case cases[] = {{"A", 0, "Old"},        {"A", 1, "Old"}, {"A", 2, "Rest"}, {"A", 3, "New"},
                        {"A", kHighest, "New"}, {"B", 1, ""},    {"B", 2, "Two"},  {"B", 3, ""},
                        {"a", 0, ""},           {"", 0, ""}};
  for (const Case& c : cases) {
    const TransformerCfgRule* rule = findTransformerCfgRule(rules, QString::fromLatin1(c.name), c.version);
    EXPECT_STREQ(rule ? rule->className.data() : "", c.className) << c.name << " " << c.version;
  }
}
