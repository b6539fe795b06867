#include "SpecialisedSetup.h"
#include <transform/specialised/TransformerCfgFactory.h>

#include <gtest/gtest.h>

#include <typeinfo>

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
  // `type`: that of void for none
  const std::tuple<const char*, int, std::type_index> cases[] = {
      {"A", 0, typeid(Old)},  {"A", 1, typeid(Old)},        {"A", 2, typeid(TransformerCfg)},
      {"A", 3, typeid(New)},  {"A", kHighest, typeid(New)}, {"B", 1, typeid(void)},
      {"B", 2, typeid(Two)},  {"C", 2, typeid(Two)},        {"C", 3, typeid(void)},
      {"a", 0, typeid(void)}, {"", 0, typeid(void)}};
  for (const auto& [name, version, type] : cases) {
    const TransformerCfgRule* rule = findTransformerCfgRule(rules, QString::fromLatin1(name), version);
    EXPECT_EQ(rule ? rule->type : std::type_index(typeid(void)), type) << name << " " << version;
  }
}
