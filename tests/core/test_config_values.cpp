#include <tests/core/ConfigHelpers.h>
#include <transform/core/TransformerCfgListener.h>

#include <gtest/gtest.h>

namespace {

const char kTwoMembers[] =
    "MULTIPARAMETER ;,GUI<space>ATTR<space>KEY<space><quotationmark><quotationmark><space>Key,"
    "GUI<space>TEXT_OR_ATTR_ENCODED<space>TO<space>Target";

struct RecordingListener : TransformerCfgListener {
  QString rewriteValue(const TransformerCfg&, const QString&, const QString& value) override {
    return value + qs("!");
  }
  void parameterChanged(TransformerCfg&, const QString& parameter, const QString& oldValue,
                        const QString& newValue) override {
    calls << parameter + qs(":") + oldValue + qs(">") + newValue;
  }
  QStringList calls;
};

TEST(ConfigValues, StoredForms) {
  const struct {
    const char* type;
    const char* set;
    const char* stored;
  } cases[] = {
      {"TEXT", "&a", "&a"},
      {"TEXT_OR_ATTR", "&a", "&a"},
      {"TEXT_OR_ATTR_ENCODED", "&a", "<commercialat>Value<leftparenthesis>a<rightparenthesis>"},
      {"TEXT_OR_ATTR_ENCODED", "a&", "a&"},
      {"TEXT_EDIT_SQL_OR_ATTR", "&a", "<commercialat>Value<leftparenthesis>a<rightparenthesis>"},
      {"TEXT_EDIT_SQL", "&a", "&a"},
      {"ATTR", "&a", "a"},
      {"ATTR", "&", ""},
      {"ATTR", "&&a", "&a"},
      {"ATTR_LIST", "&a", "a"},
      {"NEW_ATTR", "&a", "&a"},
      {"NEW_ATTR_ENCODED", "&a", "&a"},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type}}));
    EXPECT_TRUE(cfg.setParameterValue(qs("P"), qs(c.set), true));
    EXPECT_EQ(cfg.getParameterValue(qs("P")), qs(c.stored)) << c.type << " " << c.set;
  }
}

TEST(ConfigValues, IdentifiersAreCutShorterThanTheyMayBe) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "TEXT"}}));
  const struct {
    const char* name;
    int length;
    int stored;
  } cases[] = {{"XFORMER_NAME", 1023, 1023},
               {"XFORMER_NAME", 1024, 1024},
               {"XFORMER_NAME", 1025, 1023},
               {"P", 1025, 1025}};
  for (const auto& c : cases) {
    cfg.setParameterValue(qs(c.name), QString(c.length, QLatin1Char('x')), true);
    EXPECT_EQ(cfg.getParameterValue(qs(c.name)).size(), c.stored) << c.name << c.length;
  }
}

TEST(ConfigValues, ListenerRewritesOnlyWhenNotified) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "TEXT", "", "0"}}));
  RecordingListener listener;
  cfg.setListener(&listener);
  EXPECT_TRUE(cfg.setParameterValue(qs("P"), qs("1"), true));
  EXPECT_TRUE(cfg.setParameterValue(qs("P"), qs("2"), false));
  EXPECT_FALSE(cfg.setParameterValue(qs("NONE"), qs("3"), true));
  EXPECT_EQ(listener.calls, words("P:0>1! P:1!>2"));
  QHash<QString, QString> fields{{qs("PARAMETER_VALUES"), qs("P,9")}};
  cfg.deserialize(fields);
  EXPECT_EQ(cfg.getParameterValue(qs("P")), qs("9"));
  EXPECT_EQ(listener.calls.size(), 2) << "restored values are not told";
}

TEST(ConfigValues, MembersAreReachedByTheirNames) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"Z_PAIR", kTwoMembers, "Pair"}, {"B_PAIR", kTwoMembers, "Pair"}}));
  ASSERT_NE(cfg.getParameterByMacroName(qs("KEY")), nullptr);
  EXPECT_EQ(cfg.getParameterByMacroName(qs("KEY"))->getName(), qs("B_PAIR"))
      << "the first in name order answers";
  EXPECT_FALSE(cfg.hasParameter(qs("KEY")));
  EXPECT_TRUE(cfg.setParameterValue(qs("KEY"), qs("&id"), true));
  EXPECT_TRUE(cfg.setParameterValue(qs("TO"), qs("&x;y"), true));
  EXPECT_EQ(cfg.getParameterValue(qs("KEY")), qs("id"));
  EXPECT_EQ(cfg.getParameterValue(qs("TO")), qs("<commercialat>Value<leftparenthesis>x;y<rightparenthesis>"));
  EXPECT_TRUE(cfg.setParameterValue(qs("KEY"), qs("other"), true));
  EXPECT_EQ(cfg.getParameterValue(qs("TO")), qs("<commercialat>Value<leftparenthesis>x;y<rightparenthesis>"));
  EXPECT_EQ(cfg.getParameterValue(qs("Z_PAIR")), QString());
  EXPECT_EQ(cfg.getParameterDisplayValue(qs("B_PAIR")), qs("Key: other, Target: @Value(x;y)"));
}

TEST(ConfigValues, ShownAsPeopleReadThem) {
  const struct {
    const char* type;
    const char* value;
    const char* shown;
  } cases[] = {
      {"TEXT", "a<space>b", "a<space>b"},
      {"TEXT_ENCODED", "a<space>b", "a b"},
      {"TEXT", "<Unused>", ""},
      {"PASSWORD_ENCODED", "secret", "********"},
      {"LOOKUP_CHOICE \"All of them\",all%None,none", "all", "All of them"},
      {"LOOKUP_CHOICE Every,all%None,none", "other", "other"},
      {"GUI_LINE_TABLE ;,GUI<space>ATTR<space>A<space>A,GUI<space>TEXT_ENCODED<space>B<space>B",
       "a;x<space>y;b;z", "a, x y; b, z"},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type, "Prompt", c.value}}));
    EXPECT_EQ(cfg.getParameterDisplayValue(qs("P")), qs(c.shown)) << c.type;
    EXPECT_EQ(cfg.formatParamDisplayString(qs("P"), qs(c.value), true), qs("Prompt: ") + qs(c.shown));
  }
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "TEXT_ENCODED", "Prompt", "<lessthansign>space<greaterthansign>"}}));
  TransformerCfgListener listener;
  cfg.setListener(&listener);
  EXPECT_EQ(cfg.getParameterDisplayValue(qs("P"), UnpackLevel::Decoded), qs("<space>")) << "decoded once";
}

TEST(ConfigValues, Tooltips) {
  struct Customised : TransformerCfg {
    void tooltipCustomizations(QHash<QString, QString>& tokens, QStringList& lines,
                               QString& title) const override {
      tokens.insert(qs("EXTRA"), qs("$(P) & more"));
      lines << qs("x < y");
      title = qs("A & B");
    }
  };
  TransformerDefinition definition = makeDefinition({{"P", "TEXT", "", "<a>$(Q)"}, {"Q", "TEXT", "", ""}});
  definition.tooltipLines << qs("is $(P), $(Q), $(EXTRA), $(NOBODY) and $(open");
  Customised cfg;
  cfg.configure(definition);
  QStringList lines;
  cfg.getTooltipLines(lines, false);
  EXPECT_EQ(lines, QStringList({qs("A & B"), qs("is <a>$(Q), (not set), $(P) & more, $(NOBODY) and $(open"),
                                qs("x < y")}));
  cfg.getTooltipLines(lines, true);
  EXPECT_EQ(lines, QStringList({qs("<b>A &amp; B</b>"),
                                qs("is &lt;a&gt;$(Q), (not set), $(P) &amp; more, $(NOBODY) and $(open"),
                                qs("x &lt; y")}));
}

TEST(ConfigValues, SupportedValueTypes) {
  const struct {
    const char* type;
    const char* prompt;
    const char* types;
  } cases[] = {
      {"TEXT", "P", "CONSTANT PARAMETER"},
      {"TEXT_OR_ATTR", "P", "CONSTANT ATTRIBUTE PARAMETER EXPRESSION CONDITIONAL"},
      {"ATTR", "P", "ATTRIBUTE PARAMETER"},
      {"TEXT", "", ""},
      {"GROUP A%B", "P", ""},
      {kTwoMembers, "P", "CONSTANT ATTRIBUTE EXPRESSION CONDITIONAL"},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type, c.prompt}}));
    EXPECT_EQ(cfg.getSupportedValueTypes(qs("P")), words(c.types)) << c.type;
  }
}

TEST(ConfigValues, GroupsFollowTheirParameter) {
  TransformerCfg cfg;
  cfg.configure(
      makeDefinition({{"FORMATS", "TEXT", "Formats"}, {"a<space>b_SIZE", "INT"}, {"c_SIZE", "INT"}}));
  cfg.setDynparamsParameters(words("FORMATS"));
  const struct {
    const char* value;
    const char* groups;
  } cases[] = {
      {"a<space>b,c", "DYNGROUP_FORMATS_1=a b:a<space>b_SIZE DYNGROUP_FORMATS_2=c:c_SIZE"},
      {"c,c,,", "DYNGROUP_FORMATS_1=c:c_SIZE"},
      {"<Unused>", ""},
      {"none", "DYNGROUP_FORMATS_1=none:"},
  };
  for (const auto& c : cases) {
    cfg.setParameterValue(qs("FORMATS"), qs(c.value), true);
    QStringList groups;
    for (const QString& name : cfg.getParameters()) {
      if (name.startsWith(qs("DYNGROUP_"))) {
        EXPECT_TRUE(cfg.getGuiLine(name).startsWith(qs("GUI NAMEDGROUP NO_EDIT ") + name));
        groups << name + qs("=") + cfg.getParameterValue(name) + qs(":") +
                      cfg.getParameterGUIType(name).getConfigToken();
      }
    }
    EXPECT_EQ(groups.join(QLatin1Char(' ')), qs(c.groups)) << c.value;
  }
}

TEST(ConfigValues, RecordsStayPutWhileValuesChange) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"A", "TEXT"}, {"B", "TEXT"}}));
  TransformParamCfg* record = cfg.getParameterByMacroName(qs("B"));
  cfg.setParameterValue(qs("A"), qs("1"), true);
  cfg.setParameterValue(qs("B"), qs("2"), true);
  EXPECT_EQ(cfg.getParameterByMacroName(qs("B")), record);
  EXPECT_EQ(record->getValue(), qs("2"));
  record->setTypeFromGUILine(qs("CHOICE a%b"));
  EXPECT_EQ(record->getName(), qs("B"));
  EXPECT_TRUE(record->choices().contains(qs("b")));
  EXPECT_EQ(record->getTypeWithConfig(), qs("CHOICE a%b"));

  TransformParamCfg looked(GUIType::fromTransformerTypeString(qs("CHOICE a%b"), qs("C")), {qs("a,1")});
  looked.setTypeFromGUILine(qs("CHOICE a%b"));
  EXPECT_EQ(looked.choices().toStored(qs("a")), qs("1"));
  looked.setTypeFromGUILine(qs("CHOICE a%c"));
  EXPECT_FALSE(looked.choices().hasLookup());
}

}  // namespace
