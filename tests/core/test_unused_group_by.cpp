// The group-by parameter of a transformer that does not use it names no attribute, wherever it is looked at.
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>

#include <gtest/gtest.h>

namespace {

struct GroupByCase {
  const char* value;
  QStringList leaving;
  QString tooltip;
};

TransformerDefinition dissolving() {
  TransformerDefinition fields;
  fields.name = "Dissolver";
  fields.inputTags = QStringList{"IN"};
  fields.outputTags = QStringList{"OUT"};
  fields.multiProcess = "GROUP_BY";
  fields.attributesAdded = QStringList{"OUT:$(GROUP_BY)", "OUT:parts"};
  fields.tooltipLines = QStringList{"$(GROUP_BY)"};
  fields.parameterNames = QStringList{"GROUP_BY"};
  fields.parameterTypes = QStringList{"OPTIONAL ATTR_LIST_ENCODED"};
  fields.parameterPrompts = QStringList{"Groups"};
  fields.parameterDefaults = QStringList{"<UNUSED>"};
  return fields;
}

}  // namespace

TEST(UnusedGroupBy, NamesNoAttribute) {
  TransformerCfg unset;
  unset.configure(dissolving());
  QStringList lines;
  unset.getTooltipLines(lines, false);
  const QString notSet = lines.join('\n');

  const GroupByCase cases[] = {
      {"<UNUSED>", {"parts"}, notSet},
      {"", {"parts"}, notSet},
      {"zone,land<space>use", {"zone", "land use", "parts"}, "zone,land use"},
  };
  for (const GroupByCase& c : cases) {
    SCOPED_TRACE(c.value);
    TransformerCfg cfg;
    cfg.configure(dissolving());
    cfg.setInputAttributes("IN", QStringList{"zone", "land use"});
    ASSERT_TRUE(cfg.setParameterValue("GROUP_BY", c.value, false));
    EXPECT_EQ(cfg.getOutputAttributes("OUT"), c.leaving);
    cfg.getTooltipLines(lines, false);
    EXPECT_EQ(lines, QStringList(c.tooltip));
    EXPECT_FALSE(lines.join('\n').contains("UNUSED"));
    QString message;
    EXPECT_TRUE(cfg.validateParameter("GROUP_BY", message)) << message.toStdString();
  }
}
