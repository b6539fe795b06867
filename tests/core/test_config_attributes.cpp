#include <tests/core/ConfigHelpers.h>
#include <transform/core/AttributeReferences.h>

#include <gtest/gtest.h>

#include <memory>

namespace {

struct PropagationCase {
  const char* what;
  const char* preserves;
  const char* added;
  std::vector<const char*> listActions;
  const char* out;   // what leaves OUT
  const char* rest;  // what leaves REST
};

// IN brings "a l{} l{}.x", OTHER brings "b a l{}.y".
std::unique_ptr<TransformerCfg> makePropagating(const PropagationCase& c) {
  TransformerDefinition definition = makeDefinition({{"NEW", "NEW_ATTR_ENCODED", "", "n<space>1"},
                                                     {"LIST", "TEXT", "", "l"},
                                                     {"MANY", "ATTR_LIST", "", "p,q"},
                                                     {"EMPTY", "TEXT", "", "<Unused>"}});
  definition.preservesAttributes = words(c.preserves);
  definition.attributesAdded = words(c.added);
  for (const char* action : c.listActions) {
    definition.listActions << action;
  }
  auto cfg = std::make_unique<TransformerCfg>();
  cfg->configure(definition);
  cfg->setInputAttributes("OTHER", words("b a l{}.y"));
  cfg->setInputAttributes("IN", words("a l{} l{}.x a"));
  return cfg;
}

TEST(ConfigAttributes, Propagation) {
  const char* const kAll = "a|l{}|l{}.x|b|l{}.y";
  const char* const kAdded = "n 1|p|q|pre_p|pre_q";
  const char* const toLists = "$(LIST){}.count OUT:$(LIST){}.$(MANY) $(EMPTY){}.count";
  const std::vector<const char*> collect{"OUT DROP", "OUT COLLECT OTHER m{}", "OUT COLLECT OTHER $(EMPTY)"};
  const PropagationCase cases[] = {
      {"nothing said", "", "", {}, "", ""},
      {"none", "<NONE>", "", {}, "", ""},
      {"all, each once, in order", "<ALL>", "", {}, kAll, kAll},
      {"one output", "OUT", "", {}, kAll, ""},
      {"an output from inputs", "OUT:OTHER REST:IN REST:OTHER", "", {}, "b|a|l{}.y", kAll},
      {"names", "=b =nobody", "", {}, "b", "b"},
      {"added everywhere and at one output", "", "c OUT:d NOWHERE:e c", {}, "c|d|NOWHERE:e", "c|NOWHERE:e"},
      {"added by parameters", "", "$(NEW) $(MANY) $(EMPTY) $(NOBODY) pre_$(MANY)", {}, kAdded, kAdded},
      {"added to lists", "", toLists, {}, "l{}.count|l{}.p|l{}.q", "l{}.count"},
      {"lists dropped", "<ALL>", "", {"OUT DROP"}, "a|b", kAll},
      {"an output's own action wins", "<ALL>", "", {"REST KEEP", "<ALL> DROP"}, "a|b", kAll},
      {"collected", "OUT:IN", "", collect, "a|m{}.b|m{}.a|m{}.l{}.y", ""},
      {"exploded", "<ALL>", "", {"OUT EXPLODE $(LIST)"}, "a|x|b|y", kAll},
  };
  for (const PropagationCase& c : cases) {
    const auto cfg = makePropagating(c);
    EXPECT_EQ(cfg->getOutputAttributes("OUT").join(QLatin1Char('|')), c.out) << c.what;
    EXPECT_EQ(cfg->getOutputAttributes("REST").join(QLatin1Char('|')), c.rest) << c.what;
  }
}

TEST(ConfigAttributes, ParametersOfTheRulesAffectTheOutput) {
  const auto cfg = makePropagating({"", "", "$(NEW)", {"OUT EXPLODE $(LIST)"}, "", ""});
  EXPECT_TRUE(cfg->parmValueAffectsOutputAttrs("NEW"));
  EXPECT_TRUE(cfg->parmValueAffectsOutputAttrs("LIST"));
  EXPECT_FALSE(cfg->parmValueAffectsOutputAttrs("MANY"));
  cfg->updatePreservesAttributes(words("=a"));
  EXPECT_EQ(cfg->getOutputAttributes("REST"), QStringList({"a", "n 1"}));
}

TEST(ConfigAttributes, ManyAttributesTakeTimeInProportion) {
  const auto cfg = makePropagating({"", "<ALL>", "$(MANY)", {}, "", ""});
  QStringList names;
  for (int i = 0; i < 200000; ++i) {
    names << QString("a") + QString::number(i);
  }
  cfg->setInputAttributes("IN", names);
  cfg->setInputAttributes("OTHER", names);
  cfg->setParameterValue("MANY", names.join(QLatin1Char(',')), true);
  EXPECT_EQ(cfg->getOutputAttributes("OUT"), names);
  QStringList missing;
  bool hasReferences = false;
  cfg->getMissingAttributeReferences("MANY", missing, hasReferences);
  EXPECT_TRUE(missing.isEmpty());
}

TEST(ConfigAttributes, References) {
  const struct {
    const char* type;
    const char* value;
    const char* names;  // separated by "|"
  } cases[] = {
      {"TEXT_OR_ATTR", "@Value()", ""},
      {"TEXT_OR_ATTR", "@value(a)", ""},
      {"TEXT_OR_ATTR", "@Value($(P))", ""},
      {"TEXT_OR_ATTR_ENCODED", "@Value<leftparenthesis>a<space>b<rightparenthesis>", "a b"},
      {"EXPRESSION_ENCODED",
       "<commercialat>Value<leftparenthesis>a<rightparenthesis>+@Value<leftparenthesis>b<rightparenthesis>",
       "a|b"},
      {"TEXT_OR_ATTR", "ORX_CONDITIONAL:@Value(a);=;1;@Value(c);", "a|c"},
      {"TEXT", "a", ""},
      {"ATTR", "a,b", "a,b"},
      {"ATTR_ENCODED", "a<comma>b", "a,b"},
      {"ATTR_LIST", "a,\"b,c\"", "a|b,c"},
      {"ATTR_LIST_ENCODED", "a<space>1,b", "a 1|b"},
      {"ATTR", "<Unused>", ""},
      {"ATTR_LIST", "$(P),a", "a"},
      {"NEW_ATTR", "a", ""},
      {"MULTIPARAMETER ;,GUI<space>ATTR<space>K<space>K,GUI<space>TEXT_OR_ATTR<space>T<space>T",
       "K;a;T;@Value(b);X;@Value(c)", "a|b|c"},
      {"GUI_LINE_TABLE ;,GUI<space>NEW_ATTR<space>K<space>K,GUI<space>TEXT_OR_ATTR<space>T<space>T",
       "n;@Value(b);m;@Value(c);@Value(d)", "b|c|d"},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type, "P", c.value}}));
    EXPECT_EQ(cfg.getAttributeNamesInValue("P").join(QLatin1Char('|')), c.names) << c.type << " " << c.value;
  }
}

TEST(ConfigAttributes, MissingReferences) {
  const struct {
    const char* type;
    const char* value;
    const char* missing;
    bool hasReferences;
  } cases[] = {
      {"TEXT_OR_ATTR", "@Value(a)@Value(z)", "z", true},
      {"TEXT_OR_ATTR", "plain", "", false},
      {"ATTR", "b", "", true},
      {"ATTR ALLOW_NEW", "z", "", true},
      {"ATTR ALLOW_NEW", "@Value(z)", "z", true},
      {"TEXT_OR_ATTR", "@Value(l{3}.x)@Value(l{}.x)@Value(l{0}.z)", "l{0}.z", true},
      {"ATTR", "l{}", "", true},
      {"ATTR", "m{}", "m{}", true},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type, "P", c.value}}));
    cfg.setInputAttributes("IN", words("a"));
    cfg.setInputAttributes("OTHER", words("b l{}.x"));
    QStringList missing = words("stale");
    bool hasReferences = !c.hasReferences;
    cfg.getMissingAttributeReferences("P", missing, hasReferences);
    EXPECT_EQ(missing, words(c.missing)) << c.value;
    EXPECT_EQ(hasReferences, c.hasReferences) << c.value;
  }
}

TEST(ConfigAttributes, HostileReferencesTakeTimeInProportion) {
  const int count = 100000;
  AttributeSet reaching;
  reaching.add({QString("l{}.").repeated(count) + QString("x")});
  EXPECT_FALSE(reaching.holds("l{"));
}

TEST(ConfigAttributes, ByType) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"A", "ATTR", "", "a"},
                                {"L", "ATTR_LIST_ENCODED", "", "b<space>1,a,z"},
                                {"N", "NEW_ATTR", "", "n"},
                                {"T", "TEXT", "", "t"}}));
  cfg.setInputAttributes("IN", {"a", "b 1"});
  const struct {
    const char* type;
    bool onlyInputs;
    QStringList names;
  } cases[] = {
      {"ATTR", false, {"a", "b 1", "z"}},
      {"ATTR", true, {"a", "b 1"}},
      {"ATTR_LIST", false, {"b 1", "a", "z"}},
      {"NEW_ATTR", false, {"n"}},
      {"NEW_ATTR", true, {}},
  };
  for (const auto& c : cases) {
    QStringList names = words("stale");
    cfg.getAttributesByType(c.type, names, c.onlyInputs);
    EXPECT_EQ(names, c.names) << c.type << c.onlyInputs;
  }
}

}  // namespace
