// What an instance of a custom transformer answers and writes.
#include "CustomFixtures.h"

#include <QRegularExpression>
#include <gtest/gtest.h>

namespace {

class LoopingNetwork : public OpenNetwork {
 public:
  using OpenNetwork::OpenNetwork;
  bool isLooping = true;
  bool blockedLooping() const override { return isLooping; }
};

QStringList written(CompoundTransformerCfg& instance, bool inlineFlag = true) {
  TextBuffer buffer;
  EXPECT_TRUE(static_cast<TransformerCfg&>(instance).instantiate(buffer, QString(), inlineFlag));
  return buffer.lines();
}

QStringList linesFrom(const QStringList& lines, const QString& start) {
  return lines.filter(QRegularExpression(QLatin1Char('^') + QRegularExpression::escape(start)));
}

TEST(Instance, ALoopIsIncludedWhereItIsNotWrittenInline) {
  LoopingNetwork network("Looper", 2);
  assemble(network, {"in START", "in Side", "in Back", "out DONE", "loop Back"});
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier("CT");
  EXPECT_TRUE(written(instance).contains("FACTORY_DEF * TransformFact:2:Looper"));
  EXPECT_TRUE(written(instance).contains("   RECURRING_INPUT_TAG:START,Side"));
  EXPECT_EQ(linesFrom(written(instance), "MACRO ").size(), 0);
  EXPECT_TRUE(written(instance, false).contains("INCLUDE_CUSTOM_TRANSFORMER_VER Looper:2"));
  EXPECT_EQ(linesFrom(written(instance, false), "MACRO ").size(), 4) << "prefix, identifier, two of the loop";
  network.isLooping = false;
  instance.setTransformerType(TransformerCfg::kBuiltIn);
  EXPECT_TRUE(written(instance).contains("INCLUDE_BUILTIN_CUSTOM_TRANSFORMER_VER Looper:2"));
}

struct Parallel {
  const char* what;
  const char* groupBy;
  const char* parallelism;
  const char* value;   // of the parameter PAR
  const char* groups;  // of ORX_PROCESS_GROUP_BY; null where the instance has none
  bool isParallel;
};

const Parallel kParallels[] = {
    {"off", "", "NO_PARALLELISM", "", nullptr, false},
    {"a level", "", "MODERATE", "", "", true},
    {"reference that says no", "", "$(PAR)", "NO_PARALLELISM", "", false},
    {"reference that shows no", "", "$(PAR)", "None", "", false},
    {"reference that says yes", "", "$(PAR)", "EXTREME", "", true},
    {"reference without a value", "", "$(PAR)", "<Unused>", "", false},
    {"group-by alone", "id", "NO_PARALLELISM", "", "id", true},
    {"the instance's own groups", "id", "NO_PARALLELISM", "", "<UNUSED>", false},
    {"group-by by reference", "$(PAR)", "NO_PARALLELISM", "id", nullptr, true},
    {"group-by by reference, unset", "$(PAR)", "NO_PARALLELISM", "<Unused>", nullptr, false},
};

TEST(Instance, ResolvesParallelSettings) {
  for (const Parallel& row : kParallels) {
    OpenNetwork network;
    assemble(network, {"in A"});
    ParallelSettings settings;
    settings.groupBy = row.groupBy;
    settings.parallelism = row.parallelism;
    network.setParallelSettings(settings);
    network.publish("GUI OPTIONAL LOOKUP_CHOICE PAR None,NO_PARALLELISM%Extreme,EXTREME Level", row.value);
    network.doneAdding(true);
    CompoundTransformerCfg instance(&network);
    const QString groups = "ORX_PROCESS_GROUP_BY";
    EXPECT_EQ(instance.hasParameter(groups), row.groups != nullptr) << row.what;
    if (row.groups)
      instance.setParameterValue(groups, row.groups, false);
    const QStringList lines = written(instance);
    EXPECT_EQ(linesFrom(lines, "INCLUDE_CUSTOM").size(), row.isParallel ? 0 : 1) << row.what;
    EXPECT_EQ(linesFrom(lines, "FACTORY_DEF * TransformFact").size(), row.isParallel ? 1 : 0) << row.what;
  }
}

struct MacroCase {
  const char* guiLine;
  const char* value;
  const char* prefixed;  // the macro's value under the prefix PRE
  const char* plain;     // and without a prefix
};

const MacroCase kMacros[] = {
    {"GUI TEXT P P", "$(OTHER)_x", "$(OTHER)_x", "$(OTHER)_x"},
    {"GUI INSTANCE_MACROS TEXT P P", "$(OTHER)_x", "$($(PRE)_OTHER)_x", "$(OTHER)_x"},
    {"GUI INSTANCE_MACROS TEXT P P", "$(A)-$(B)$(", "$($(PRE)_A)-$($(PRE)_B)$(", "$(A)-$(B)$("},
    {"GUI INSTANCE_MACROS TEXT P P", "$[A]$(ELSEWHERE)$(ORX_MF_DIR)", "$($(PRE)_A)$(ELSEWHERE)$(ORX_MF_DIR)",
     "$[A]$(ELSEWHERE)$(ORX_MF_DIR)"},
    {"GUI STRING_OR_ATTR_ENCODED SET P", "a<space>b", "@Value(a<space>b)", "@Value(a<space>b)"},
    {"GUI STRING_OR_ATTR_ENCODED SET P", "@Value<leftparenthesis>a<rightparenthesis>", "@Value(a)",
     "@Value(a)"},
    {"GUI STRING_OR_ATTR_ENCODED P P", "a<space>b", "a<space>b", "a<space>b"},
    {"GUI OPTIONAL TEXT_EDIT_PYTHON_PARM P P", "", "", ""},
};

TEST(Instance, WritesParameterMacros) {
  TransformerDefinition setter = passing("AttributeSetter");
  setter.parameterNames = QStringList{"DEST_ATTR"};
  setter.parameterTypes = QStringList{"TEXT_ENCODED"};
  setter.parameterPrompts = setter.parameterDefaults = QStringList{QString()};
  for (const MacroCase& row : kMacros) {
    // The attribute setter stands two levels deep.
    OpenNetwork inner("Inner");
    auto inside = configured(setter);
    inside->setParameterValue("DEST_ATTR", "$(SET)", false);
    inner.addTransformer(inside.release(), {}, 1);
    inner.doneAdding(true);
    OpenNetwork network;
    network.addTransformer(new CompoundTransformerCfg(&inner), {}, 1);
    for (const char* other : {"A", "B", "OTHER"})
      network.publish(QStringLiteral("GUI TEXT %1 %1").arg(QLatin1String(other)), "1");
    network.publish(row.guiLine, row.value);
    network.doneAdding(true);
    const CompoundTransformerCfg instance(&network);
    const QString name = instance.getParameters().last();
    for (const bool hasPrefix : {true, false}) {
      TextBuffer buffer;
      instance.writeParametersToMappingFile(buffer, hasPrefix ? "PRE" : QString(), !hasPrefix);
      const QString expected = hasPrefix
                                   ? QStringLiteral("MACRO $(PRE)_") + name + QLatin1Char(' ') + row.prefixed
                                   : QStringLiteral("DEFAULT_MACRO ") + name + QLatin1Char(' ') + row.plain;
      EXPECT_EQ(buffer.lines().last(), expected.trimmed()) << row.guiLine << " = " << row.value;
    }
  }
}

TEST(Instance, RefusesWhatWouldNeverEnd) {
  for (const char* groupBy : {"", "$(P)"}) {
    OpenNetwork network;
    assemble(network, {"in A", "out O"});
    ParallelSettings settings;
    settings.groupBy = groupBy;
    network.setParallelSettings(settings);
    network.publish("GUI OPTIONAL TEXT P P", QString());
    network.publish("GUI OPTIONAL TEXT_EDIT_TCL_PARM T T", QString());
    network.doneAdding(true);
    CompoundTransformerCfg instance(&network);
    instance.setIdentifier("CT");
    TextBuffer buffer;
    TransformerCfg& base = instance;
    for (const char* name : {"P", "T", "XFORMER_NAME"}) {
      const QString old = instance.getParameterValue(QLatin1String(name));
      instance.setParameterValue(QLatin1String(name), "$[x", false);
      EXPECT_FALSE(base.instantiate(buffer, QString(), true)) << name;
      instance.setParameterValue(QLatin1String(name), old, false);
    }
    instance.setOutputFeatureType("O", "$[x");
    EXPECT_FALSE(base.instantiate(buffer, QString(), true));
    EXPECT_TRUE(buffer.text().isEmpty());
  }
}

// --- parameters, copies, attributes ------------------------------------------------------------------------

TEST(Instance, CopiesShareAndFollowTheNetwork) {
  OpenNetwork network;
  assemble(network, {"in A", "out O", "A -> O"});
  network.publish("GUI TEXT KEPT Kept", "1");
  network.publish("GUI TEXT DROPPED Dropped", "2");
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier("CT");
  instance.setParameterValue("KEPT", "mine", false);
  const std::unique_ptr<TransformerCfg> copy(instance.getCopy());
  auto* custom = dynamic_cast<CompoundTransformerCfg*>(copy.get());
  ASSERT_NE(custom, nullptr);
  EXPECT_EQ(custom->getNetwork(), &network);
  EXPECT_EQ(copy->getIdentifier(), "CT");
  EXPECT_EQ(copy->getParameterValue("KEPT"), "mine");
  copy->setParameterValue("KEPT", "other", false);
  EXPECT_EQ(instance.getParameterValue("KEPT"), "mine");

  network.clearNodes();
  network.publish("GUI TEXT NEW New", "3");
  network.publish("GUI INTEGER KEPT Kept", "9");
  network.doneAdding(true);
  EXPECT_EQ(copy->getParameters(), names("XFORMER_NAME,NEW,KEPT"));
  EXPECT_EQ(copy->getParameterType("KEPT"), "INTEGER");
  EXPECT_EQ(copy->getParameterValue("KEPT"), "other");
  EXPECT_EQ(copy->getParameterValue("NEW"), "3");
  EXPECT_EQ(copy->getIdentifier(), "CT");
}

TEST(Instance, TakesTurns) {
  OpenNetwork network;
  assemble(network, {"in A", "in B", "add T t", "out O", "A -> T", "B -> T", "T -> O"});
  const QString a = "A";
  const QString b = "B";
  const QString o = "O";
  CompoundTransformerCfg first(&network);
  CompoundTransformerCfg second(&network);
  first.setInputAttributes(QHash<QString, QStringList>{{a, {"a1"}}, {b, {"b1"}}});
  second.setInputAttributes(a, {"a2"});
  EXPECT_EQ(first.getOutputAttributes(o), names("a1,b1,t"));
  EXPECT_EQ(second.getOutputAttributes(o), names("a2,t"));
  first.setInputAttributes(b, {"b3"});
  EXPECT_EQ(second.getOutputAttributes(o), names("a2,t"));
  EXPECT_EQ(first.getOutputAttributes(o), names("a1,b3,t"));
  EXPECT_EQ(first.getInputAttributeUnion(), names("a1,b3"));
  // An inner transformer that changes its answer is asked again.
  network.getTransformers().front()->updatePreservesAttributes({"<NONE>"});
  EXPECT_EQ(first.getOutputAttributes(o), names("t"));
}

TEST(Instance, GivesParameterValuesInAttributeNames) {
  TransformerDefinition namer = passing("Namer", "OUT", "$(RESULT)");
  namer.parameterNames = names("RESULT,SIZE");
  namer.parameterTypes = names("NEW_ATTR_ENCODED,INTEGER");
  namer.parameterPrompts = namer.parameterDefaults = QStringList{QString(), QString()};
  OpenNetwork inner("Inner");
  auto cfg = configured(namer);
  cfg->setParameterValue("RESULT", "$(NAME)", false);
  cfg->setParameterValue("SIZE", "$(WIDTH)", false);
  inner.addTransformer(cfg.release(), {}, 1);
  inner.addOutput("O", 2, kOutgoingArriving, {}, 0);
  inner.addLink(1, "OUT", 2, "O");
  inner.publish("GUI TEXT_ENCODED NAME Name", "length");
  inner.publish("GUI INTEGER WIDTH Width", "1");
  inner.doneAdding(true);
  OpenNetwork outer("Outer");
  auto nested = std::make_unique<CompoundTransformerCfg>(&inner);
  nested->setParameterValue("NAME", "$(KEY)", false);
  outer.addTransformer(nested.release(), {}, 1);
  outer.addOutput("O", 2, kOutgoingArriving, {}, 0);
  outer.addLink(1, "O", 2, "O");
  outer.publish("GUI TEXT_ENCODED KEY Key", "the<space>key");
  outer.publish("GUI TEXT UNUSED Unused", QString());
  outer.doneAdding(true);
  CompoundTransformerCfg instance(&outer);
  EXPECT_EQ(instance.getOutputAttributes("O"), names("the key"));
  EXPECT_TRUE(instance.parmValueAffectsOutputAttrs("KEY"));
  EXPECT_FALSE(instance.parmValueAffectsOutputAttrs("UNUSED"));
  EXPECT_FALSE(CompoundTransformerCfg(&inner).parmValueAffectsOutputAttrs("WIDTH"));
  instance.setParameterValue("KEY", QString(), false);
  EXPECT_EQ(instance.getOutputAttributes("O"), QStringList());
}

// Two instances of the level below in a row on each level; in the lowest, two transformers of `definition`.
std::vector<std::unique_ptr<OpenNetwork>> doubledLevels(int count, const TransformerDefinition& definition) {
  std::vector<std::unique_ptr<OpenNetwork>> levels;
  for (int level = 0; level < count; ++level) {
    const bool isLowest = level == 0;
    const QString in = isLowest ? "IN" : "A";
    const QString out = isLowest ? "OUT" : "O";
    auto network = std::make_unique<OpenNetwork>(QStringLiteral("Level%1").arg(level));
    network->addInput("A", 0, 0);
    network->addOutput("O", 1, kOutgoingArriving, {}, 0);
    for (const int node : {2, 3}) {
      network->addTransformer(
          isLowest ? configured(definition).release() : new CompoundTransformerCfg(levels.back().get()), {},
          node);
    }
    network->addLink(0, "A", 2, in);
    network->addLink(2, out, 3, in);
    network->addLink(3, out, 1, "O");
    network->doneAdding(true);
    levels.push_back(std::move(network));
  }
  return levels;
}

// Every transformer on the way makes another name of the attribute, so that no two instances are asked alike.
TEST(Instance, NestingIsBoundedWhenEveryInstanceDiffers) {
  TransformerDefinition collector = passing("Collector");
  collector.listActions = QStringList{"OUT COLLECT IN L"};
  const auto few = doubledLevels(3, collector);
  CompoundTransformerCfg exact(few.back().get());
  exact.setInputAttributes("A", {"a"});
  EXPECT_EQ(exact.getOutputAttributes("O").last().count("L{}."), 8);
  const auto many = doubledLevels(40, collector);
  CompoundTransformerCfg bounded(many.back().get());
  bounded.setInputAttributes("A", {"a"});
  EXPECT_FALSE(bounded.getOutputAttributes("O").isEmpty());
}

// Values that refer to the values of the level around them, twice each.
TEST(Instance, ValuesMayNotGrowWithoutBound) {
  TransformerDefinition namer = passing("Namer", "OUT", "$(P)");
  namer.parameterNames = names("P");
  namer.parameterTypes = names("NEW_ATTR");
  namer.parameterPrompts = namer.parameterDefaults = QStringList{QString()};
  const QString twice = "$(P)$(P)";
  std::vector<std::unique_ptr<OpenNetwork>> levels;
  for (int level = 0; level < 60; ++level) {
    auto network = std::make_unique<OpenNetwork>(QStringLiteral("Level%1").arg(level));
    network->addOutput("O", 1, kOutgoingArriving, {}, 0);
    std::unique_ptr<TransformerCfg> inner =
        level == 0 ? configured(namer) : std::make_unique<CompoundTransformerCfg>(levels.back().get());
    inner->setParameterValue("P", twice, false);
    network->addTransformer(inner.release(), {}, 2);
    network->addLink(2, level == 0 ? "OUT" : "O", 1, "O");
    network->publish("GUI TEXT P P", "ab");
    network->doneAdding(true);
    levels.push_back(std::move(network));
  }
  EXPECT_EQ(CompoundTransformerCfg(levels[2].get()).getOutputAttributes("O"),
            QStringList{QStringLiteral("ab").repeated(8)});
  for (const QString& name : CompoundTransformerCfg(levels.back().get()).getOutputAttributes("O"))
    EXPECT_LT(name.size(), 1 << 20);
}

}  // namespace
