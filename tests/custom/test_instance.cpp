// What an instance of a custom transformer answers and writes.
#include "CustomFixtures.h"
#include <platform/qorxcore/qorxcore.h>
#include <tests/text/ScriptRunners.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

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

TEST(Instance, WritesCollectorsMacrosBodyAndRenamers) {
  OpenNetwork network(QStringLiteral("My Net"), 3);
  assemble(network, {QStringLiteral("in IN1"), QStringLiteral("in IN2"), QStringLiteral("out OUT"),
                     QStringLiteral("out REST")});
  network.publish(QStringLiteral("GUI TEXT LABEL Label"), QStringLiteral("plain"));
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier(QStringLiteral("CT"));
  instance.addInputFeatureType(QStringLiteral("IN1"), QStringLiteral("a"));
  instance.addInputFeatureType(QStringLiteral("IN1"), QStringLiteral("b c"));
  instance.setOutputFeatureType(QStringLiteral("REST"), QStringLiteral("CT_REST_OUT"));
  instance.setOutputTagFuncs(QStringLiteral("REST"), {QStringLiteral("@CopyAttributes(x,y)")});
  const QString prefix = makePrefixMacro(QStringLiteral("My Net"));
  const QStringList expected{
      QStringLiteral("FACTORY_DEF * TeeFactory"),
      QStringLiteral("  FACTORY_NAME \"CT IN1 Input Collector\""),
      QStringLiteral("  INPUT FEATURE_TYPE a"),
      QStringLiteral("  INPUT FEATURE_TYPE \"b c\""),
      QStringLiteral("  OUTPUT FEATURE_TYPE CT_IN1"),
      QStringLiteral("MACRO %1 CT").arg(prefix),
      QStringLiteral("MACRO $(%1)_XFORMER_NAME CT").arg(prefix),
      QStringLiteral("MACRO $(%1)_LABEL plain").arg(prefix),
      QStringLiteral("INCLUDE_CUSTOM_TRANSFORMER_VER My Net:3"),
      QStringLiteral("FACTORY_DEF * TeeFactory"),
      QStringLiteral("  FACTORY_NAME \"CT OUT Output Renamer/Nuker\""),
      QStringLiteral("  INPUT FEATURE_TYPE CT_OUT"),
      QStringLiteral("FACTORY_DEF * TeeFactory"),
      QStringLiteral("  FACTORY_NAME \"CT REST Output Renamer/Nuker\""),
      QStringLiteral("  INPUT FEATURE_TYPE CT_REST"),
      QStringLiteral("  OUTPUT FEATURE_TYPE CT_REST_OUT"),
      QStringLiteral("    @CopyAttributes(x,y)"),
  };
  EXPECT_EQ(written(instance), expected);
  EXPECT_EQ(network.subdocPrefixMacro(QStringLiteral("CT")), prefix);
  EXPECT_EQ(instance.getTransformFactoryInputLines(),
            (QStringList{QStringLiteral("   INPUT IN1 FEATURE_TYPE CT_IN1"),
                         QStringLiteral("   INPUT IN2 FEATURE_TYPE CT_IN2")}));
  instance.setTransformerType(TransformerCfg::kBuiltIn);
  EXPECT_TRUE(written(instance).contains(QStringLiteral("INCLUDE_BUILTIN_CUSTOM_TRANSFORMER_VER My Net:3")));
}

TEST(Instance, WritesALoopFactoryInPlaceOfMacros) {
  LoopingNetwork network(QStringLiteral("Looper"), 2);
  assemble(network, {QStringLiteral("in START"), QStringLiteral("in Side In"), QStringLiteral("in Back"),
                     QStringLiteral("out DONE"), QStringLiteral("loop Back")});
  network.addInput(QStringLiteral("Side In"), 77, 3);
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier(QStringLiteral("CT"));
  EXPECT_TRUE(instance.setParameterValue(QStringLiteral("MAX_LOOP_ITERATIONS"), QStringLiteral("7"), false));
  EXPECT_TRUE(
      instance.setParameterValue(QStringLiteral("ITERATION_COUNT_ATTR"), QStringLiteral("_n"), false));
  const QStringList expected{
      QStringLiteral("FACTORY_DEF * TransformFact:2:Looper"),
      QStringLiteral("   FACTORY_NAME CT"),
      QStringLiteral("   FACTORY_META_PARAMS"),
      QStringLiteral("   TRANSFORMER_NAME:CT"),
      QStringLiteral("   TRANSFORMER_PARAMS:") + instance.getTransformerParams(),
      QStringLiteral("   LOOPBACK_INPUT_TAG:Back"),
      QStringLiteral("   LOOPBACK_OUTPUT_TAG:INCOMPLETE"),
      QStringLiteral("   RECURRING_INPUT_TAG:START,Side,Side<space>In"),
      QStringLiteral("   MAX_LOOP_ITERATIONS:7"),
      QStringLiteral("   ITERATION_COUNT_ATTR:_n"),
      QStringLiteral("   INPUT START FEATURE_TYPE CT_START"),
      QStringLiteral("   INPUT Side FEATURE_TYPE CT_Side"),
      QStringLiteral("   INPUT Back FEATURE_TYPE CT_Back"),
      QStringLiteral("   INPUT Side In FEATURE_TYPE \"CT_Side In\""),
      QStringLiteral("   OUTPUT DONE FEATURE_TYPE CT_DONE"),
      QStringLiteral("FACTORY_DEF * TeeFactory"),
      QStringLiteral("  FACTORY_NAME \"CT DONE Output Renamer/Nuker\""),
      QStringLiteral("  INPUT FEATURE_TYPE CT_DONE"),
  };
  EXPECT_EQ(written(instance), expected);
  const QStringList outside = written(instance, false);
  EXPECT_TRUE(outside.contains(QStringLiteral("INCLUDE_CUSTOM_TRANSFORMER_VER Looper:2")));
  EXPECT_EQ(linesFrom(outside, QStringLiteral("MACRO ")).size(), 4) << "prefix, identifier, two of the loop";
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
    assemble(network, {QStringLiteral("in A")});
    ParallelSettings settings;
    settings.groupBy = QLatin1String(row.groupBy);
    settings.parallelism = QLatin1String(row.parallelism);
    network.setParallelSettings(settings);
    network.publish(
        QStringLiteral("GUI OPTIONAL LOOKUP_CHOICE PAR None,NO_PARALLELISM%Extreme,EXTREME Level"),
        QLatin1String(row.value));
    network.doneAdding(true);
    CompoundTransformerCfg instance(&network);
    const QString groups = QStringLiteral("ORX_PROCESS_GROUP_BY");
    EXPECT_EQ(instance.hasParameter(groups), row.groups != nullptr) << row.what;
    if (row.groups)
      instance.setParameterValue(groups, QLatin1String(row.groups), false);
    const QStringList lines = written(instance);
    EXPECT_EQ(linesFrom(lines, QStringLiteral("INCLUDE_CUSTOM")).size(), row.isParallel ? 0 : 1) << row.what;
    EXPECT_EQ(linesFrom(lines, QStringLiteral("FACTORY_DEF * TransformFact")).size(), row.isParallel ? 1 : 0)
        << row.what;
  }
}

TEST(Instance, LeavesNothingBehindWhenItFails) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("out B")});
  ParallelSettings settings;
  settings.groupBy = QStringLiteral("$(PAR)");
  network.setParallelSettings(settings);
  network.publish(QStringLiteral("GUI TEXT PAR Attributes"), QStringLiteral("a"));
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.addInputFeatureType(QStringLiteral("A"), QStringLiteral("flow"));
  EXPECT_FALSE(written(instance).isEmpty());
  instance.setParameterValue(QStringLiteral("PAR"), QStringLiteral("a$["), false);
  TextBuffer buffer;
  EXPECT_FALSE(static_cast<TransformerCfg&>(instance).instantiate(buffer, QString(), true));
  EXPECT_EQ(buffer.lines(), QStringList());
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
  TransformerDefinition setter = passing(QStringLiteral("AttributeSetter"));
  setter.parameterNames = QStringList{QStringLiteral("DEST_ATTR")};
  setter.parameterTypes = QStringList{QStringLiteral("TEXT_ENCODED")};
  setter.parameterPrompts = setter.parameterDefaults = QStringList{QString()};
  for (const MacroCase& row : kMacros) {
    // The attribute setter stands two levels deep.
    OpenNetwork inner(QStringLiteral("Inner"));
    auto inside = configured(setter);
    inside->setParameterValue(QStringLiteral("DEST_ATTR"), QStringLiteral("$(SET)"), false);
    inner.addTransformer(inside.release(), {}, 1);
    inner.doneAdding(true);
    OpenNetwork network;
    network.addTransformer(new CompoundTransformerCfg(&inner), {}, 1);
    for (const char* other : {"A", "B", "OTHER"})
      network.publish(QStringLiteral("GUI TEXT %1 %1").arg(QLatin1String(other)), QStringLiteral("1"));
    network.publish(QLatin1String(row.guiLine), QLatin1String(row.value));
    network.doneAdding(true);
    const CompoundTransformerCfg instance(&network);
    const QString name = instance.getParameters().last();
    for (const bool hasPrefix : {true, false}) {
      TextBuffer buffer;
      instance.writeParametersToMappingFile(buffer, hasPrefix ? QStringLiteral("PRE") : QString(),
                                            !hasPrefix);
      const QString expected =
          hasPrefix ? QStringLiteral("MACRO $(PRE)_") + name + QLatin1Char(' ') + QLatin1String(row.prefixed)
                    : QStringLiteral("DEFAULT_MACRO ") + name + QLatin1Char(' ') + QLatin1String(row.plain);
      EXPECT_EQ(buffer.lines().last(), expected.trimmed()) << row.guiLine << " = " << row.value;
    }
  }
}

struct ScriptCase {
  const char* python;
  const char* tcl;
  const char* value;  // in the instance CT_1, whose BASE is inner_1
};

const ScriptCase kScripts[] = {
    {"'x'", "x", "x"},
    {"ORX_MacroValues['BASE'] + '!'", "$ORX_MacroValues(BASE)!", "%1!"},
    {"a = ORX_MacroValues[\"BASE\"]\n# done\na * 2", "set a $ORX_MacroValues(BASE)\nreturn $a$a", "%1%1"},
    {"if ORX_MacroValues['XFORMER_NAME'] == 'CT_2':\n  return 'two'\nreturn ORX_MacroValues['ORX_HOME']",
     "if {$ORX_MacroValues(XFORMER_NAME) eq \"CT_2\"} {\n  return two\n}\nreturn $ORX_MacroValues(ORX_HOME)",
     "%2"},
    {"k = 'BA'\nORX_MacroValues[k + 'SE']", "set k BA\nreturn $ORX_MacroValues(${k}SE)", "%1"},
};

// Each script in two instances, run with the macros of both and those of the workspace.
TEST(Instance, WritesScriptsThatComputeTheInstancesMacros) {
  OpenNetwork network(QStringLiteral("My Net"));
  network.publish(QStringLiteral("GUI TEXT BASE Base"), QString());
  int count = 0;
  for (const ScriptCase& row : kScripts) {
    network.publish(QStringLiteral("GUI TEXT_EDIT_PYTHON_PARM PY%1 Py").arg(++count),
                    QORXWwjdEncode(QLatin1String(row.python)));
    network.publish(QStringLiteral("GUI TEXT_EDIT_TCL_PARM TC%1 Tcl").arg(count),
                    QORXWwjdEncode(QLatin1String(row.tcl)));
  }
  network.doneAdding(true);
  QMap<QString, QString> macros{{QStringLiteral("BASE"), QStringLiteral("outer")},
                                {QStringLiteral("ORX_HOME"), QStringLiteral("home")}};
  for (const QString& id : {QStringLiteral("CT_1"), QStringLiteral("CT_2")}) {
    const QString base = QStringLiteral("inner") + id.right(2);
    CompoundTransformerCfg instance(&network);
    instance.setIdentifier(id);
    instance.setParameterValue(QStringLiteral("BASE"), base, false);
    EXPECT_TRUE(instance.findUnwritableParameters().isEmpty());
    TextBuffer buffer;
    ASSERT_TRUE(static_cast<TransformerCfg&>(instance).instantiate(buffer, QString(), true));
    QStringList physical = buffer.text().split(QLatin1Char('\n'));
    macros[makePrefixMacro(QStringLiteral("My Net"))] = id;
    macros[id + QStringLiteral("_BASE")] = base;
    macros[id + QStringLiteral("_XFORMER_NAME")] = id;
    QVector<ScriptRun> pythons;
    QMap<QString, QString> defined;
    const auto take = [&](const QMap<QString, QString>& result) {
      for (auto macro = result.cbegin(); macro != result.cend(); ++macro)
        defined.insert(macro.key(), macro.value());
    };
    for (int at = 0; at < physical.size(); ++at) {
      if (!physical.at(at).startsWith(QLatin1String("INCLUDE PYTHON")) &&
          !physical.at(at).startsWith(QLatin1String("INCLUDE TCL")))
        continue;
      const int end = physical.indexOf(QStringLiteral("END_INCLUDE"), at);
      ASSERT_GT(end, at);
      EXPECT_EQ(physical.at(at + 1), QString()) << "each line is a statement of its own";
      const ScriptRun run{physical.mid(at, end + 1 - at), macros};
      if (physical.at(at).endsWith(QLatin1String("PYTHON")))
        pythons.append(run);
      else
        take(runTclBlock(run));
      at = end;
    }
    for (const QMap<QString, QString>& result : runPythonBlocks(pythons))
      take(result);
    EXPECT_EQ(defined.size(), 2 * count);
    for (int number = 1; number <= count; ++number) {
      QString value = QLatin1String(kScripts[number - 1].value);
      value.replace(QLatin1String("%1"), base);
      value.replace(QLatin1String("%2"),
                    id == QLatin1String("CT_2") ? QLatin1String("two") : QLatin1String("home"));
      EXPECT_EQ(defined.value(id + QStringLiteral("_PY%1").arg(number)), value)
          << kScripts[number - 1].python;
      EXPECT_EQ(defined.value(id + QStringLiteral("_TC%1").arg(number)), value) << kScripts[number - 1].tcl;
    }
  }

  CompoundTransformerCfg instance(&network);
  QString message;
  instance.setParameterValue(QStringLiteral("PY1"), QORXWwjdEncode(QStringLiteral("END_INCLUDE")), false);
  EXPECT_FALSE(instance.validateParameter(QStringLiteral("PY1"), message));
  EXPECT_FALSE(message.isEmpty());
  EXPECT_EQ(instance.findUnwritableParameters().keys(), names(QStringLiteral("PY1")));
}

TEST(Instance, ARequiredScriptMayNotBeEmpty) {
  OpenNetwork network;
  network.publish(QStringLiteral("GUI TEXT_EDIT_PYTHON_PARM PY Py"), QString());
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  QString message;
  EXPECT_FALSE(instance.validateParameter(QStringLiteral("PY"), message));
  EXPECT_EQ(message, TransformResString(370608, QStringLiteral("Py")));
  instance.setParameterValue(QStringLiteral("PY"), QStringLiteral("<Unused>"), false);
  EXPECT_TRUE(instance.validateParameter(QStringLiteral("PY"), message));
}

TEST(Instance, RefusesWhatWouldNeverEnd) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("out O")});
  network.publish(QStringLiteral("GUI OPTIONAL TEXT P P"), QString());
  network.publish(QStringLiteral("GUI OPTIONAL TEXT_EDIT_TCL_PARM T T"), QString());
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier(QStringLiteral("CT"));
  TextBuffer buffer;
  TransformerCfg& base = instance;
  for (const char* name : {"P", "T", "XFORMER_NAME"}) {
    const QString old = instance.getParameterValue(QLatin1String(name));
    instance.setParameterValue(QLatin1String(name), QStringLiteral("$[x"), false);
    EXPECT_FALSE(base.instantiate(buffer, QString(), true)) << name;
    instance.setParameterValue(QLatin1String(name), old, false);
  }
  instance.setOutputFeatureType(QStringLiteral("O"), QStringLiteral("$[x"));
  EXPECT_FALSE(base.instantiate(buffer, QString(), true));
  EXPECT_TRUE(buffer.text().isEmpty());
}

// --- parameters, copies, attributes ------------------------------------------------------------------------

TEST(Instance, CopiesShareAndFollowTheNetwork) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("out O"), QStringLiteral("A -> O")});
  network.publish(QStringLiteral("GUI TEXT KEPT Kept"), QStringLiteral("1"));
  network.publish(QStringLiteral("GUI TEXT DROPPED Dropped"), QStringLiteral("2"));
  network.doneAdding(true);
  CompoundTransformerCfg instance(&network);
  instance.setIdentifier(QStringLiteral("CT"));
  instance.setParameterValue(QStringLiteral("KEPT"), QStringLiteral("mine"), false);
  const std::unique_ptr<TransformerCfg> copy(instance.getCopy());
  auto* custom = dynamic_cast<CompoundTransformerCfg*>(copy.get());
  ASSERT_NE(custom, nullptr);
  EXPECT_EQ(custom->getNetwork(), &network);
  EXPECT_EQ(copy->getIdentifier(), QStringLiteral("CT"));
  EXPECT_EQ(copy->getParameterValue(QStringLiteral("KEPT")), QStringLiteral("mine"));
  copy->setParameterValue(QStringLiteral("KEPT"), QStringLiteral("other"), false);
  EXPECT_EQ(instance.getParameterValue(QStringLiteral("KEPT")), QStringLiteral("mine"));

  network.clearNodes();
  network.publish(QStringLiteral("GUI TEXT NEW New"), QStringLiteral("3"));
  network.publish(QStringLiteral("GUI INTEGER KEPT Kept"), QStringLiteral("9"));
  network.doneAdding(true);
  EXPECT_EQ(copy->getParameters(), names(QStringLiteral("XFORMER_NAME,NEW,KEPT")));
  EXPECT_EQ(copy->getParameterType(QStringLiteral("KEPT")), QStringLiteral("INTEGER"));
  EXPECT_EQ(copy->getParameterValue(QStringLiteral("KEPT")), QStringLiteral("other"));
  EXPECT_EQ(copy->getParameterValue(QStringLiteral("NEW")), QStringLiteral("3"));
  EXPECT_EQ(copy->getIdentifier(), QStringLiteral("CT"));
}

TEST(Instance, TakesTurns) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("in B"), QStringLiteral("add T t"),
                     QStringLiteral("out O"), QStringLiteral("A -> T"), QStringLiteral("B -> T"),
                     QStringLiteral("T -> O")});
  const QString a = QStringLiteral("A");
  const QString b = QStringLiteral("B");
  const QString o = QStringLiteral("O");
  CompoundTransformerCfg first(&network);
  CompoundTransformerCfg second(&network);
  first.setInputAttributes(
      QHash<QString, QStringList>{{a, {QStringLiteral("a1")}}, {b, {QStringLiteral("b1")}}});
  second.setInputAttributes(a, {QStringLiteral("a2")});
  EXPECT_EQ(first.getOutputAttributes(o), names(QStringLiteral("a1,b1,t")));
  EXPECT_EQ(second.getOutputAttributes(o), names(QStringLiteral("a2,t")));
  first.setInputAttributes(b, {QStringLiteral("b3")});
  EXPECT_EQ(second.getOutputAttributes(o), names(QStringLiteral("a2,t")));
  EXPECT_EQ(first.getOutputAttributes(o), names(QStringLiteral("a1,b3,t")));
  EXPECT_EQ(first.getInputAttributeUnion(), names(QStringLiteral("a1,b3")));
  // An inner transformer that changes its answer is asked again.
  network.getTransformers().front()->updatePreservesAttributes({QStringLiteral("<NONE>")});
  EXPECT_EQ(first.getOutputAttributes(o), names(QStringLiteral("t")));
}

TEST(Instance, GivesParameterValuesInAttributeNames) {
  TransformerDefinition namer =
      passing(QStringLiteral("Namer"), QStringLiteral("OUT"), QStringLiteral("$(RESULT)"));
  namer.parameterNames = names(QStringLiteral("RESULT,SIZE"));
  namer.parameterTypes = names(QStringLiteral("NEW_ATTR_ENCODED,INTEGER"));
  namer.parameterPrompts = namer.parameterDefaults = QStringList{QString(), QString()};
  OpenNetwork inner(QStringLiteral("Inner"));
  auto cfg = configured(namer);
  cfg->setParameterValue(QStringLiteral("RESULT"), QStringLiteral("$(NAME)"), false);
  cfg->setParameterValue(QStringLiteral("SIZE"), QStringLiteral("$(WIDTH)"), false);
  inner.addTransformer(cfg.release(), {}, 1);
  inner.addOutput(QStringLiteral("O"), 2, kOutgoingArriving, {}, 0);
  inner.addLink(1, QStringLiteral("OUT"), 2, QStringLiteral("O"));
  inner.publish(QStringLiteral("GUI TEXT_ENCODED NAME Name"), QStringLiteral("length"));
  inner.publish(QStringLiteral("GUI INTEGER WIDTH Width"), QStringLiteral("1"));
  inner.doneAdding(true);
  OpenNetwork outer(QStringLiteral("Outer"));
  auto nested = std::make_unique<CompoundTransformerCfg>(&inner);
  nested->setParameterValue(QStringLiteral("NAME"), QStringLiteral("$(KEY)"), false);
  outer.addTransformer(nested.release(), {}, 1);
  outer.addOutput(QStringLiteral("O"), 2, kOutgoingArriving, {}, 0);
  outer.addLink(1, QStringLiteral("O"), 2, QStringLiteral("O"));
  outer.publish(QStringLiteral("GUI TEXT_ENCODED KEY Key"), QStringLiteral("the<space>key"));
  outer.publish(QStringLiteral("GUI TEXT UNUSED Unused"), QString());
  outer.doneAdding(true);
  CompoundTransformerCfg instance(&outer);
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("O")), names(QStringLiteral("the key")));
  EXPECT_TRUE(instance.parmValueAffectsOutputAttrs(QStringLiteral("KEY")));
  EXPECT_FALSE(instance.parmValueAffectsOutputAttrs(QStringLiteral("UNUSED")));
  EXPECT_FALSE(CompoundTransformerCfg(&inner).parmValueAffectsOutputAttrs(QStringLiteral("WIDTH")));
  instance.setParameterValue(QStringLiteral("KEY"), QString(), false);
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("O")), QStringList());
}

// Two instances of the level below in a row on each level; in the lowest, two transformers of `definition`.
std::vector<std::unique_ptr<OpenNetwork>> doubledLevels(int count, const TransformerDefinition& definition) {
  std::vector<std::unique_ptr<OpenNetwork>> levels;
  for (int level = 0; level < count; ++level) {
    const bool isLowest = level == 0;
    const QString in = isLowest ? QStringLiteral("IN") : QStringLiteral("A");
    const QString out = isLowest ? QStringLiteral("OUT") : QStringLiteral("O");
    auto network = std::make_unique<OpenNetwork>(QStringLiteral("Level%1").arg(level));
    network->addInput(QStringLiteral("A"), 0, 0);
    network->addOutput(QStringLiteral("O"), 1, kOutgoingArriving, {}, 0);
    for (const int node : {2, 3}) {
      network->addTransformer(
          isLowest ? configured(definition).release() : new CompoundTransformerCfg(levels.back().get()), {},
          node);
    }
    network->addLink(0, QStringLiteral("A"), 2, in);
    network->addLink(2, out, 3, in);
    network->addLink(3, out, 1, QStringLiteral("O"));
    network->doneAdding(true);
    levels.push_back(std::move(network));
  }
  return levels;
}

TEST(Instance, NestingCostsItsDefinitionsOnly) {
  constexpr int kLevels = 60;
  const auto levels =
      doubledLevels(kLevels, passing(QStringLiteral("Adder"), QStringLiteral("OUT"), QStringLiteral("x")));
  CompoundTransformerCfg instance(levels.back().get());
  instance.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("O")), names(QStringLiteral("a,x")));
  EXPECT_TRUE(instance.getUsesTransformer(QStringLiteral("Adder"), nullptr));
  EXPECT_FALSE(instance.getUsesTransformer(QStringLiteral("None"), nullptr));
  EXPECT_FALSE(instance.getIsBlocking());
  QStringList readers;
  QStringList writers;
  QStringList transformers;
  instance.getUsedComponents(readers, writers, transformers, true);
  EXPECT_EQ(transformers.size(), kLevels + 1);
  EXPECT_TRUE(instance.instantiationFault().isEmpty());
}

// Every transformer on the way makes another name of the attribute, so that no two instances are asked alike.
TEST(Instance, NestingIsBoundedWhenEveryInstanceDiffers) {
  TransformerDefinition collector = passing(QStringLiteral("Collector"));
  collector.listActions = QStringList{QStringLiteral("OUT COLLECT IN L")};
  const auto few = doubledLevels(3, collector);
  CompoundTransformerCfg exact(few.back().get());
  exact.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_EQ(exact.getOutputAttributes(QStringLiteral("O")).last().count(QStringLiteral("L{}.")), 8);
  const auto many = doubledLevels(40, collector);
  CompoundTransformerCfg bounded(many.back().get());
  bounded.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_FALSE(bounded.getOutputAttributes(QStringLiteral("O")).isEmpty());
}

// Values that refer to the values of the level around them, twice each.
TEST(Instance, ValuesMayNotGrowWithoutBound) {
  TransformerDefinition namer =
      passing(QStringLiteral("Namer"), QStringLiteral("OUT"), QStringLiteral("$(P)"));
  namer.parameterNames = names(QStringLiteral("P"));
  namer.parameterTypes = names(QStringLiteral("NEW_ATTR"));
  namer.parameterPrompts = namer.parameterDefaults = QStringList{QString()};
  const QString twice = QStringLiteral("$(P)$(P)");
  std::vector<std::unique_ptr<OpenNetwork>> levels;
  for (int level = 0; level < 60; ++level) {
    auto network = std::make_unique<OpenNetwork>(QStringLiteral("Level%1").arg(level));
    network->addOutput(QStringLiteral("O"), 1, kOutgoingArriving, {}, 0);
    std::unique_ptr<TransformerCfg> inner =
        level == 0 ? configured(namer) : std::make_unique<CompoundTransformerCfg>(levels.back().get());
    inner->setParameterValue(QStringLiteral("P"), twice, false);
    network->addTransformer(inner.release(), {}, 2);
    network->addLink(2, level == 0 ? QStringLiteral("OUT") : QStringLiteral("O"), 1, QStringLiteral("O"));
    network->publish(QStringLiteral("GUI TEXT P P"), QStringLiteral("ab"));
    network->doneAdding(true);
    levels.push_back(std::move(network));
  }
  EXPECT_EQ(CompoundTransformerCfg(levels[2].get()).getOutputAttributes(QStringLiteral("O")),
            QStringList{QStringLiteral("ab").repeated(8)});
  for (const QString& name :
       CompoundTransformerCfg(levels.back().get()).getOutputAttributes(QStringLiteral("O")))
    EXPECT_LT(name.size(), 1 << 20);
}

TEST(Instance, FindsNestingFaults) {
  OpenNetwork outer(QStringLiteral("Outer"));
  OpenNetwork inner(QStringLiteral("Inner"));
  for (OpenNetwork* network : {&outer, &inner}) {
    network->addInput(QStringLiteral("A"), 0, 0);
    network->addOutput(QStringLiteral("O"), 1, kOutgoingArriving, {}, 0);
    network->addTransformer(new CompoundTransformerCfg(network == &outer ? &inner : &outer), {}, 2);
    network->addLink(0, QStringLiteral("A"), 2, QStringLiteral("A"));
    network->addLink(2, QStringLiteral("O"), 1, QStringLiteral("O"));
    network->doneAdding(true);
  }
  CompoundTransformerCfg instance(&outer);
  instance.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("O")), QStringList());
  EXPECT_FALSE(instance.getUsesTransformer(QStringLiteral("None"), nullptr));
  EXPECT_TRUE(instance.instantiationFault().contains(QStringLiteral("Outer > Inner > Outer")));
  TextBuffer buffer;
  EXPECT_FALSE(instance.doInstantiate(buffer, true));
  EXPECT_TRUE(buffer.text().isEmpty());

  std::vector<std::unique_ptr<OpenNetwork>> levels;
  for (int level = 0; level <= CompoundTransformerNetwork::kDeepestNesting; ++level) {
    levels.push_back(std::make_unique<OpenNetwork>(QStringLiteral("Level")));
    if (level > 0)
      levels.back()->addTransformer(new CompoundTransformerCfg(levels[levels.size() - 2].get()), {}, 1);
    const QString fault = CompoundTransformerCfg(levels.back().get()).instantiationFault();
    EXPECT_EQ(fault.isEmpty(), level < CompoundTransformerNetwork::kDeepestNesting) << level;
  }
}

}  // namespace
