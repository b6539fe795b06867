#include <tests/core/ConfigHelpers.h>
#include <transform/core/TransformerCfgListener.h>

#include <gtest/gtest.h>

namespace {

const char kTwoMembers[] =
    "MULTIPARAMETER ;,GUI<space>ATTR<space>KEY<space><quotationmark><quotationmark><space>Key,"
    "GUI<space>TEXT_OR_ATTR_ENCODED<space>TO<space>Target";

struct RecordingListener : TransformerCfgListener {
  QString rewriteValue(const TransformerCfg&, const QString&, const QString& value) override {
    return value + "!";
  }
  void parameterChanged(TransformerCfg&, const QString& parameter, const QString& oldValue,
                        const QString& newValue) override {
    calls << parameter + ":" + oldValue + ">" + newValue;
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
    EXPECT_TRUE(cfg.setParameterValue("P", c.set, true));
    EXPECT_EQ(cfg.getParameterValue("P"), c.stored) << c.type << " " << c.set;
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
    cfg.setParameterValue(c.name, QString(c.length, QLatin1Char('x')), true);
    EXPECT_EQ(cfg.getParameterValue(c.name).size(), c.stored) << c.name << c.length;
  }
}

TEST(ConfigValues, ListenerRewritesOnlyWhenNotified) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "TEXT", "", "0"}}));
  RecordingListener listener;
  cfg.setListener(&listener);
  EXPECT_TRUE(cfg.setParameterValue("P", "1", true));
  EXPECT_TRUE(cfg.setParameterValue("P", "2", false));
  EXPECT_FALSE(cfg.setParameterValue("NONE", "3", true));
  EXPECT_EQ(listener.calls, words("P:0>1! P:1!>2"));
  QHash<QString, QString> fields{{"PARAMETER_VALUES", "P,9"}};
  cfg.deserialize(fields);
  EXPECT_EQ(cfg.getParameterValue("P"), "9");
  EXPECT_EQ(listener.calls.size(), 2) << "restored values are not told";
}

TEST(ConfigValues, MembersAreReachedByTheirNames) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"Z_PAIR", kTwoMembers, "Pair"}, {"B_PAIR", kTwoMembers, "Pair"}}));
  ASSERT_NE(cfg.getParameterByMacroName("KEY"), nullptr);
  EXPECT_EQ(cfg.getParameterByMacroName("KEY")->getName(), "B_PAIR") << "the first in name order answers";
  EXPECT_FALSE(cfg.hasParameter("KEY"));
  EXPECT_TRUE(cfg.setParameterValue("KEY", "&id", true));
  EXPECT_TRUE(cfg.setParameterValue("TO", "&x;y", true));
  EXPECT_EQ(cfg.getParameterValue("KEY"), "id");
  EXPECT_EQ(cfg.getParameterValue("TO"), "<commercialat>Value<leftparenthesis>x;y<rightparenthesis>");
  EXPECT_TRUE(cfg.setParameterValue("KEY", "other", true));
  EXPECT_EQ(cfg.getParameterValue("TO"), "<commercialat>Value<leftparenthesis>x;y<rightparenthesis>");
  EXPECT_EQ(cfg.getParameterValue("Z_PAIR"), QString());
  EXPECT_EQ(cfg.getParameterDisplayValue("B_PAIR"), "Key: other, Target: @Value(x;y)");
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
    EXPECT_EQ(cfg.getParameterDisplayValue("P"), c.shown) << c.type;
    EXPECT_EQ(cfg.formatParamDisplayString("P", c.value, true), QString("Prompt: ") + QString(c.shown));
  }
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "TEXT_ENCODED", "Prompt", "<lessthansign>space<greaterthansign>"}}));
  TransformerCfgListener listener;
  cfg.setListener(&listener);
  EXPECT_EQ(cfg.getParameterDisplayValue("P", UnpackLevel::Decoded), "<space>") << "decoded once";
}

TEST(ConfigValues, Tooltips) {
  struct Customised : TransformerCfg {
    void tooltipCustomizations(QHash<QString, QString>& tokens, QStringList& lines,
                               QString& title) const override {
      tokens.insert("EXTRA", "$(P) & more");
      lines << "x < y";
      title = "A & B";
    }
  };
  TransformerDefinition definition = makeDefinition({{"P", "TEXT", "", "<a>$(Q)"}, {"Q", "TEXT", "", ""}});
  definition.tooltipLines << "is $(P), $(Q), $(EXTRA), $(NOBODY) and $(open";
  Customised cfg;
  cfg.configure(definition);
  QStringList lines;
  cfg.getTooltipLines(lines, false);
  EXPECT_EQ(lines,
            QStringList({"A & B", "is <a>$(Q), (not set), $(P) & more, $(NOBODY) and $(open", "x < y"}));
  cfg.getTooltipLines(lines, true);
  EXPECT_EQ(lines,
            QStringList({"<b>A &amp; B</b>",
                         "is &lt;a&gt;$(Q), (not set), $(P) &amp; more, $(NOBODY) and $(open", "x &lt; y"}));
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
    EXPECT_EQ(cfg.getSupportedValueTypes("P"), words(c.types)) << c.type;
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
    cfg.setParameterValue("FORMATS", c.value, true);
    QStringList groups;
    for (const QString& name : cfg.getParameters()) {
      if (name.startsWith("DYNGROUP_")) {
        EXPECT_TRUE(cfg.getGuiLine(name).startsWith(QString("GUI NAMEDGROUP NO_EDIT ") + name));
        groups << name + "=" + cfg.getParameterValue(name) + ":" +
                      cfg.getParameterGUIType(name).getConfigToken();
      }
    }
    EXPECT_EQ(groups.join(QLatin1Char(' ')), c.groups) << c.value;
  }
}

TEST(ConfigValues, RecordsStayPutWhileValuesChange) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"A", "TEXT"}, {"B", "TEXT"}}));
  TransformParamCfg* record = cfg.getParameterByMacroName("B");
  cfg.setParameterValue("A", "1", true);
  cfg.setParameterValue("B", "2", true);
  EXPECT_EQ(cfg.getParameterByMacroName("B"), record);
  EXPECT_EQ(record->getValue(), "2");
  record->setTypeFromGUILine("CHOICE a%b");
  EXPECT_EQ(record->getName(), "B");
  EXPECT_TRUE(record->choices().contains("b"));
  EXPECT_EQ(record->getTypeWithConfig(), "CHOICE a%b");

  TransformParamCfg looked(GUIType::fromTransformerTypeString("CHOICE a%b", "C"), {"a,1"});
  looked.setTypeFromGUILine("CHOICE a%b");
  EXPECT_EQ(looked.choices().toStored("a"), "1");
  looked.setTypeFromGUILine("CHOICE a%c");
  EXPECT_FALSE(looked.choices().hasLookup());
}

}  // namespace
