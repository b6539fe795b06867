#include "GenerationSetup.h"
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/definition/CompiledTemplate.h>
#include <transform/core/generation/OrderedSubstitution.h>

#include <gtest/gtest.h>

#include <random>

namespace {

// Takes the ports step by step, as any class of its own does.
class StepwiseCfg : public TransformerCfg {};

TEST(Tokens, NameThatIsNoPlainToken) {
  QStringList lines{"a $($(A)_B) b", "$(A)"};
  TransformerCfg::substToken(lines, "$(A)_B", "x");
  EXPECT_EQ(lines, (QStringList{"a x b", "$(A)"}));
}

TEST(Tokens, LinesThatBecomeBlankGo) {
  QStringList lines{" ", " $(A)", "x$(A)", "$(A)"};
  TransformerCfg::substToken(lines, "A", "");
  EXPECT_EQ(lines, (QStringList{" ", "x"}));
}

TEST(Tokens, RemoveClauses) {
  struct Case {
    QStringList lines;
    bool wildcard;
    QStringList expected;
  };
  const Case cases[] = {
      {{"x", "O FEATURE_TYPE $(OUTPUT_A_FTYPE)", "more", "$(OUTPUT_A_FUNCS)", "y"}, false, {"x", "y"}},
      {{"$(OUTPUT_A_FTYPE) $(OUTPUT_A_FUNCS)", "$(OUTPUT_B_FTYPE)"}, false, {"$(OUTPUT_B_FTYPE)"}},
      {{"$(OUTPUT_A_FTYPE)", "m", "", "$(OUTPUT_A_FUNCS)"}, false, {"", "$(OUTPUT_A_FUNCS)"}},
      {{"$(OUTPUT_A_FTYPE)", "m", "OUTPUT B FEATURE_TYPE b", "z"}, false, {"OUTPUT B FEATURE_TYPE b", "z"}},
      {{"$(OUTPUT_A_FTYPE)", "OUTPUT A FEATURE_TYPE $(OUTPUT_A_FUNCS)", "z"}, false, {"z"}},
      {{"OUTPUT A FEATURE_TYPE \t*", "$(OUTPUT_A_FUNCS)", "OUTPUT B FEATURE_TYPE b"},
       true,
       {"OUTPUT B FEATURE_TYPE b"}},
      {{"OUTPUT A FEATURE_TYPE *"}, false, {"OUTPUT A FEATURE_TYPE *"}},
  };
  for (const Case& c : cases) {
    QStringList lines = c.lines;
    TransformerCfg::removeOutputClause(lines, "A", c.wildcard);
    EXPECT_EQ(lines, c.expected) << c.lines.join('|').toStdString();
  }
}

TEST(Tokens, Ports) {
  const TestDefinition definition{
      {"IN:ALIAS"}, {"NONE"}, {}, {"F $(INPUT_LINES) end", "N $(OUTPUT_NONE_FTYPE)"}, true};
  const auto cfg = makeCfg(definition);
  cfg->addInputFeatureType("IN", "b c");
  cfg->addInputFilter("IN", "WHERE 1");
  EXPECT_EQ(statementsOf(*cfg).join('|').simplified(),
            "F INPUT ALIAS FEATURE_TYPE \"b c\" WHERE 1 end|N \"\"");
  EXPECT_EQ(cfg->getTransformFactoryInputLines(), QStringList("   INPUT ALIAS FEATURE_TYPE \"b c\" WHERE 1"));
}

TEST(Tokens, InstanceTokens) {
  const auto cfg = makeCfg({{},
                            {},
                            {{"XFORMER_NAME", "TEXT", "a b$(M)"},
                             {"A", "TEXT_ENCODED", "x<space>y"},
                             {"G", "GROUP", ""},
                             {"U", "OMITTABLE TEXT", "<Unused>"},
                             {"T", "TEXT", "p \"q"}},
                            {"$(XFORMER_NAME)", "$(ORX_UUID)", "$(XFORMER_NAME_ENCODED)|X",
                             "V $(ORX_PARM_VAL_LIST)", "S $(XFORMER_SCHEMA)", "U $(U) $(T)", "E $(ENGINE)"}});
  cfg->setInputAttributes("", QStringList());
  const QStringList first = statementsOf(*cfg);
  const QStringList second = statementsOf(*cfg);
  EXPECT_EQ(first.value(0), "\"a b$(M)\"");
  EXPECT_EQ(first.value(1), "a b$(M)_g10");
  EXPECT_EQ(second.value(1), "a b$(M)_g11");
  EXPECT_EQ(first.value(2), "a<space>b$(M)|X");
  EXPECT_EQ(first.value(3).simplified(), "V A x<space>y T \"p \\\"q\"");
  EXPECT_EQ(first.value(4), "S");
  EXPECT_EQ(first.value(5), "E $(ENGINE)");
}

TEST(Tokens, ValuesThatHoldTokens) {
  const RunTimeListener listener;
  struct Case {
    QString first;
    QString second;
    QString expected;
  };
  const Case cases[] = {
      {"$(P2)", "x", "x"},         // comes in before its token is substituted
      {"x", "$(P1)", "x"},         // deferred: once more
      {"$(P1)y", "z", "$(P1)yy"},  // its own token: twice and no further
      {"$(GLOBAL)", "$[P1]", "$(GLOBAL)"},
  };
  for (const Case& c : cases) {
    const auto cfg =
        makeCfg({{}, {}, {{"P1", "TEXT", c.first}, {"P2", "TEXT", c.second}}, {"$(P1) | $(P2)"}});
    cfg->setListener(const_cast<RunTimeListener*>(&listener));
    EXPECT_EQ(statementsOf(*cfg).value(0).section(" | ", 0, 0), c.expected) << c.first.toStdString();
  }
}

TEST(Tokens, ValuesThatInsertEachOtherWithoutEnd) {
  TestDefinition definition{{}, {}, {}, {"$(P0)"}};
  for (int i = 0; i < 60; ++i) {
    definition.parameters.append({QString("P%1").arg(i), "TEXT", QString("$(P%1)$(P%1)").arg(i + 1)});
  }
  const auto cfg = makeCfg(definition);
  EXPECT_TRUE(cfg->findUnwritableValues().contains("P0"));
  TextBuffer buffer;
  EXPECT_FALSE(cfg->instantiate(buffer, QString()));
  EXPECT_EQ(buffer.text(), "");
}

// --- the single pass against the order of the contract
// ------------------------------------------------------

QString replaceOne(const QStringList& pieces, std::mt19937& random) {
  return pieces.at(int(random() % unsigned(pieces.size())));
}

TEST(Tokens, SinglePassEqualsOrder) {
  std::mt19937 random(7);
  const QStringList text{" ",    "x",    "$",     "(",    ")",  "$(",     "A",       "$(A)",
                         "$(B)", "$(C)", "$(AB)", "$(M)", "\t", "INPUT ", "$(A)$(B)"};
  const QStringList plainText{" ", "x", "$(A)", "$(B)", "$(C)", "$(AB)", "$(M)", ""};
  const QStringList values{"", " ", "v", "$(B)", "$(M)", "$", "(B)", "B", "$(", "w x", ")"};
  int single = 0;
  for (int round = 0; round < 4000; ++round) {
    QStringList lines;
    for (unsigned i = random() % 5 + 1; i > 0; --i) {
      QString line;
      for (unsigned j = random() % 6; j > 0; --j) {
        line += replaceOne(round % 2 ? text : plainText, random);
      }
      lines << line;
    }
    TestDefinition definition{{}, {}, {{"XFORMER_NAME", "TEXT", "n"}}, lines};
    for (const char* name : {"C", "AB", "A", "B"})
      definition.parameters.append({name, "TEXT", replaceOne(values, random)});
    const auto cfg = makeCfg(definition);
    StepwiseCfg stepwise;
    configure(stepwise, definition);
    TextBuffer buffer;
    TextBuffer stepBuffer;
    ASSERT_TRUE(cfg->doInstantiate(buffer, true));
    ASSERT_TRUE(stepwise.doInstantiate(stepBuffer, true));
    ASSERT_EQ(buffer.text(), stepBuffer.text()) << lines.join("|").toStdString();
    single += cfg->definition()->compiledTemplate && cfg->definition()->compiledTemplate->isPlain();
  }
  EXPECT_GT(single, 1500);  // else the single pass is not tried
}

// Texts that are tokens themselves, wherever they come from; and one text many times.
TEST(Tokens, SinglePassEqualsOrderForEveryText) {
  const QStringList texts{"n",
                          "$(A)",
                          "$(ORX_UUID)",
                          "$(XFORMER_NAME_ENCODED)",
                          "$(XFORMER_SCHEMA)",
                          "$(INPUT_LINES)",
                          "<dollarsign><leftparenthesis>A<rightparenthesis>"};
  const QStringList lines{"F $(XFORMER_NAME_ENCODED) $(ORX_UUID) $(INPUT_LINES)",
                          "$(XFORMER_SCHEMA) $(A) $(L)", "V $(ORX_PARM_VAL_LIST) $(XFORMER_NAME)"};
  for (const QString& name : texts) {
    for (const QString& value : texts) {
      for (const QString& flow : texts) {
        TestDefinition definition{{"IN"}, {}, {}, lines};
        definition.parameters = {
            {"XFORMER_NAME", "TEXT", name},
            {"A", "TEXT_ENCODED", value},
            {"L", "LOOKUP_LISTBOX k,<dollarsign><leftparenthesis>A<rightparenthesis>%l,m", "l k"}};
        StepwiseCfg stepwise;
        TransformerCfg single;
        QStringList written;
        for (TransformerCfg* cfg : {static_cast<TransformerCfg*>(&stepwise), &single}) {
          configure(*cfg, definition);
          cfg->addInputFeatureType("IN", flow);
          cfg->setInputAttributes("IN", {"a$(A)"});
          written << statementsOf(*cfg).join('|');
        }
        EXPECT_EQ(written[0].toStdString(), written[1].toStdString());
      }
    }
  }
  const QString large(100000, 'x');
  const TestDefinition definition{{},
                                  {},
                                  {{"P", "TEXT", large}, {"Q", "TEXT", "$(R)"}, {"R", "TEXT", "r"}},
                                  {QString("$(P) ").repeated(102), "$(Q)"}};
  const QStringList statements = statementsOf(*makeCfg(definition));
  EXPECT_EQ(statements, QStringList({QString(large + ' ').repeated(102).trimmed(), "r"}));
}

// Says in which order it is asked.
class LoggingCfg : public TransformerCfg {
 public:
  QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                          MFBuffer& buffer) const override {
    log += name.left(1);
    return TransformerCfg::getParameterValueForMappingFile(name, parameter, buffer);
  }
  void substInputs(QStringList& lines) const override {
    log += '<';
    TransformerCfg::substInputs(lines);
  }
  void substOutputs(QStringList& lines) const override {
    log += '>';
    TransformerCfg::substOutputs(lines);
  }
  mutable QString log;
};

TEST(Tokens, PortsComeBeforeValues) {
  LoggingCfg cfg;
  configure(cfg, {{}, {}, {{"A", "TEXT", "$(B)"}, {"B", "TEXT", "b"}}, {"$(A) $(B)"}});
  EXPECT_EQ(statementsOf(cfg), QStringList("b b"));
  EXPECT_TRUE(cfg.log.startsWith("<>") && cfg.log.count('<') == 1) << cfg.log.toStdString();
}

}  // namespace
