#include <platform/qorxcore/qorxcore.h>
#include <tests/core/ConfigHelpers.h>
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>

#include <QTextStream>
#include <gtest/gtest.h>

#include <memory>

namespace {

TEST(ConfigDefinition, NewObjectHasTheDocumentedDefaults) {
  const TransformerCfg cfg;
  EXPECT_EQ(cfg.lastParmEditBuild(), 18286);
  EXPECT_EQ(cfg.replacedByVersion(), -1);
  EXPECT_TRUE(cfg.strictParameterValidation() && cfg.isVisible() && cfg.dependencyMet());
  EXPECT_FALSE(cfg.isDeprecated() || cfg.nukersRequired());
  EXPECT_TRUE(cfg.getParameterGUIType("ANY").isNull());
}

TEST(ConfigDefinition, VisibilityAndDeprecation) {
  const struct {
    bool visible;
    bool allowed;
    const char* replacedBy;
    bool isVisible;
    bool isDeprecated;
  } cases[] = {
      {true, true, "", true, false},       {true, true, "Other", true, false},
      {false, true, "", false, false},     {false, true, "Other", false, true},
      {true, false, "Other", false, true},
  };
  for (const auto& c : cases) {
    TransformerDefinition definition = makeDefinition({});
    definition.visible = c.visible;
    definition.allowed = c.allowed;
    definition.replacedBy = c.replacedBy;
    TransformerCfg cfg;
    cfg.configure(definition);
    EXPECT_EQ(cfg.isVisible(), c.isVisible) << c.replacedBy;
    EXPECT_EQ(cfg.isDeprecated(), c.isDeprecated) << c.replacedBy;
  }
}

TEST(ConfigDefinition, TagTokens) {
  const struct {
    const char* token;
    const char* tag;
    const char* alias;
    const char* shown;
  } cases[] = {
      {"IN", "IN", "", ""},
      {"IN:ENTRY", "IN", "ENTRY", ""},
      {"IN::Many<space>Features", "IN", "", "Many Features"},
      {"IN:ENTRY:First", "IN", "ENTRY", "First"},
      {"IN:", "IN", "", ""},
  };
  for (const auto& c : cases) {
    const TagList list = TagList::parse({c.token, "IN:AGAIN", ":NONE"});
    EXPECT_EQ(list.tags, QStringList(c.tag)) << c.token;
    EXPECT_EQ(list.aliases.value(c.tag), c.alias) << c.token;
    EXPECT_EQ(list.shownNames.value(c.tag), c.shown) << c.token;
  }
}

TEST(ConfigDefinition, FaultyParameterEntriesAreReportedAndTheRestIsKept) {
  TransformerDefinition definition = makeDefinition(
      {{"A", "INT", "", "1"}, {"A", "TEXT", "", "2"}, {"", "TEXT"}, {"B", "", "", "x"}, {"C", "SUNDIAL"}});
  definition.parameterTypes.removeLast();  // fewer types than names
  definition.listActions << "OUT COLLECT IN";
  definition.parameterMapping << "OLD";
  definition.tagMapping << ":"
                        << "X:A=B";
  definition.preservesAttributes << "NOWHERE:IN";
  QString text;
  QTextStream log(&text);
  TransformerCfg cfg;
  cfg.configure(definition, nullptr, &log);
  log.flush();
  EXPECT_EQ(cfg.getParameters(), words("A B C XFORMER_NAME"));
  EXPECT_EQ(cfg.getParameterValue("A"), "1");
  EXPECT_EQ(cfg.getParameterType("B"), "TEXT");
  const char* reported[] = {"PARAMETER_NAME: missing or there twice: A\n",
                            "PARAMETER_TYPE: missing, taken as TEXT: B\n",
                            "LIST_ACTION: not understood: OUT COLLECT IN\n",
                            "PARAMETER_MAPPING: no renaming: OLD\n",
                            "TAG_MAPPING: no renaming: X:A=B\n",
                            "PRESERVES_ATTRIBUTES: no output: NOWHERE:IN\n"};
  for (const char* line : reported) {
    EXPECT_TRUE(text.contains(QString("Sorter version 3: ") + line)) << line << "\n" << text.toStdString();
  }
}

TEST(ConfigDefinition, DefaultParameters) {
  TransformerCfg plain;
  plain.configure(makeDefinition({}));
  EXPECT_EQ(plain.getParameters(), words("XFORMER_NAME"));
  EXPECT_EQ(plain.getParameterPrompt("XFORMER_NAME"), "Transformer Name");

  TransformerDefinition definition = makeDefinition({{"GROUP_BY", "OPTIONAL ATTR_LIST", "Group By"}});
  definition.multiProcess = "GROUP_BY";
  definition.attributesAdded = words("OUT:$(GROUP_BY) OUT:parts");
  definition.tooltipLines = words("$(GROUP_BY)");
  TransformerCfg grouped;
  grouped.configure(definition);
  EXPECT_EQ(
      grouped.getParameters(),
      words("GROUP_BY XFORMER_NAME ORX_PROCESS_COUNT ORX_PROCESS_COUNTDISP ORX_PROCESS_GROUPS_ORDERED"));
  EXPECT_EQ(grouped.getParameterValue("GROUP_BY"), "<UNUSED>");
  EXPECT_EQ(grouped.getParameterValue("ORX_PROCESS_COUNT"), "No Parallelism");
  const ChoiceList& levels = grouped.getParameterByMacroName("ORX_PROCESS_COUNT")->choices();
  EXPECT_EQ(levels.entries().size(), 5u);
  for (const auto& [value, shown] :
       {std::pair("EXTREME", "Extreme"), {"Minimal", "Minimal"}, {"$(X)", "$(X)"}}) {
    grouped.setParameterValue("ORX_PROCESS_COUNT", value, false);
    grouped.setParameterValue("ORX_PROCESS_COUNTDISP", "Moderate", false);
    EXPECT_EQ(grouped.getParameterValue("ORX_PROCESS_COUNTDISP"), shown);
  }
  EXPECT_EQ(levels.toStored("Extreme"), "EXTREME");
  // Unused, it names no attribute, wherever it is looked at.
  QString message;
  for (const char* unused : {"<UNUSED>", ""}) {
    QStringList lines;
    grouped.setParameterValue("GROUP_BY", unused, false);
    grouped.getTooltipLines(lines, false);
    EXPECT_EQ(lines, QStringList("(not set)"));
    EXPECT_EQ(grouped.getOutputAttributes("OUT"), words("parts"));
    EXPECT_TRUE(grouped.validateParameter("GROUP_BY", message)) << message.toStdString();
    EXPECT_TRUE(grouped.getAttributeNamesInValue("GROUP_BY").isEmpty());
  }
  grouped.setParameterValue("GROUP_BY", "zone,b", false);
  EXPECT_EQ(grouped.getOutputAttributes("OUT"), words("zone b parts"));
  QHash<QString, QString> table;
  EXPECT_TRUE(grouped.getParameterLookupTable("ORX_PROCESS_GROUPS_ORDERED", QString(), table));
  EXPECT_EQ(table.size(), 2);
}

TEST(ConfigDefinition, ATransformerUnderTheHomeIsBuiltIn) {
  for (const bool isBuiltIn : {true, false}) {
    TransformerDefinition definition = makeDefinition({});
    definition.filePath =
        (isBuiltIn ? QORXOrxHome() : QORXOrxHome() + QString("2")) + QString("/transformers/x.ort");
    TransformerCfg cfg;
    cfg.configure(definition);
    EXPECT_EQ(cfg.transformerType() == TransformerCfg::kBuiltIn, isBuiltIn);
  }
}

TEST(ConfigDefinition, CopiesShareTheDefinitionUntilOneIsLocalised) {
  TransformerCfg prototype;
  prototype.configure(makeDefinition({{"A", "TEXT"}}));
  const std::unique_ptr<TransformerCfg> copy(prototype.getCopy());
  EXPECT_EQ(copy->definition(), prototype.definition());
  copy->setLocalizedName("Sortierer");
  EXPECT_NE(copy->definition(), prototype.definition());
  EXPECT_EQ(copy->getVisualName(), "Sortierer");
  EXPECT_EQ(prototype.getLocalizedName(), "Sorter");
  EXPECT_EQ(copy->getSavedName(), "Sorter");
  copy->setSavedName("Ordner");
  EXPECT_EQ(copy->getSavedName(), "Ordner");
}

TEST(ConfigDefinition, CopiesHoldTheirOwnValuesPortsAndIdentity) {
  TransformerCfg prototype;
  prototype.configure(makeDefinition({{"A", "TEXT", "A", "1"}}));
  prototype.setBaseGuid("stem");
  prototype.setInputAttributes("IN", words("x"));
  const std::unique_ptr<TransformerCfg> copy(prototype.getCopy());
  EXPECT_EQ(copy->getBaseGuid(), QString());
  copy->setParameterValue("A", "2", true);
  copy->setInputAttributes("IN", words("y"));
  copy->addInputFeatureType("roads");
  copy->addParameter(TransformParamCfg(GUIType::fromTransformerTypeString("TEXT", "B")));
  EXPECT_EQ(prototype.getParameterValue("A"), "1");
  EXPECT_EQ(prototype.getInputAttributeUnion(), words("x"));
  EXPECT_TRUE(prototype.getInputFeatureTypes("IN").isEmpty());
  EXPECT_EQ(prototype.getParameters(), words("A XFORMER_NAME"));
  copy->setLastParmEditBuild(15179);
  prototype.copyValues(copy.get());
  EXPECT_EQ(prototype.lastParmEditBuild(), 15179);
}

TEST(ConfigDefinition, UpgradeFollowsTheMappings) {
  TransformerDefinition old = makeDefinition(
      {{"MODE", "TEXT", "", "a"}, {"GONE", "TEXT", "", "d"}, {"KEPT", "TEXT"}, {"EARLY", "TEXT"}});
  old.version = 1;
  old.inputTags = words("A B");
  TransformerCfg older;
  older.configure(old);
  older.setBaseGuid("stem");
  older.setIdentifier("S_1");
  older.setParameterValue("MODE", "b", true);
  older.setParameterValue("KEPT", "k", true);
  older.setParameterValue("EARLY", "e", true);
  older.addInputFeatureType("A", "roads");
  older.setInputAttributes("B", words("x"));
  older.setOutputFeatureType("OUT", "sorted");

  TransformerDefinition now =
      makeDefinition({{"METHOD", "TEXT"}, {"KEPT", "TEXT"}, {"EARLY", "TEXT"}, {"LATE", "TEXT"}});
  now.inputTags = words("FIRST SECOND");
  now.outputTags = words("SORTED REST");
  now.parameterMapping = words("2:MODE=WAY 3:WAY=METHOD 1:EARLY=LATE");
  now.tagMapping = words("I:A=FIRST 2:I:B=SECOND O:OUT=SORTED");
  TransformerCfg newer;
  newer.configure(now);
  EXPECT_TRUE(newer.upgradeTransformer(&older));
  EXPECT_EQ(newer.getParameterValue("METHOD"), "b");
  EXPECT_EQ(newer.getParameterValue("KEPT"), "k");
  EXPECT_EQ(newer.getParameterValue("EARLY"), "e");  // renamed in a version it already has
  EXPECT_EQ(newer.getParameterValue("LATE"), QString());
  EXPECT_EQ(newer.getIdentifier(), "S_1");
  EXPECT_EQ(newer.getBaseGuid(), "stem");
  EXPECT_EQ(newer.getInputFeatureTypes("FIRST"), words("roads"));
  EXPECT_EQ(newer.getInputAttributes().value("SECOND"), words("x"));
  QString featureType;
  EXPECT_TRUE(newer.getOutputFeatureType("SORTED", featureType));
  EXPECT_EQ(featureType, "sorted");

  older.setParameterValue("GONE", "something", true);
  EXPECT_FALSE(newer.upgradeTransformer(&older)) << "a value without a place has to be told";
}

}  // namespace
