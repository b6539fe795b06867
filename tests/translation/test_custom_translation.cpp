// Workspaces with custom transformers, translated as a whole.
#include <tests/support/QtPrinters.h>
#include <tests/translation/TranslatedWorkspace.h>

#include <QElapsedTimer>

namespace {

const QString kInstance = QStringLiteral("SubDocumentTransformer");

// --- statements inside ----------------------------------------------------------------------------

// The attributes that the statement of the transformer "Names" lists, in the blocks of the file.
QStringList namedAttributes(const QString& text) {
  const QRegularExpression statement(
      "# FACTORY_DEF \\* CopyFactory FACTORY_NAME \\S+_Names [^\n]* P (\\S*)\n");
  QStringList named;
  for (auto found = statement.globalMatch(text); found.hasNext();) {
    const QStringList schema = found.next().captured(1).split(',', Qt::SkipEmptyParts);
    for (int i = 0; i < schema.size(); i += 2) {
      named << schema.at(i);
      EXPECT_EQ(schema.value(i + 1), QString("varchar<leftparenthesis>255<rightparenthesis>"));
    }
  }
  return named;
}

// Instances of "Schema" fed by the readers A (id, a) and B (id, b), in this order.
SmallWorkspace schemaWorkspace(const QString& readers) {
  SmallWorkspace workspace;
  workspace.reader(1, "A", {"id", "a"}).reader(2, "B", {"id", "b", "list{}.x"});
  int id = 10;
  for (const QChar reader : readers) {
    workspace.transformer(++id, kInstance,
                          {"SUB_DOC_NAME", "Schema", "XFORMER_NAME", QString("I%1").arg(id), "KEY", "k"});
    workspace.link(reader == 'A' ? 1 : 2, "fo 0", id, "fi 0 IN");
  }
  return workspace;
}

TEST(CustomTranslation, StatementsNameTheAttributesOfAllInstances) {
  const QStringList names = {"XFORMER_NAME", "Names", "VALUE", "$(XFORMER_SCHEMA)"};
  const auto plain = [&](SmallWorkspace& w) {
    w.transformer(3, "Copy", names).link(1, "fo 0", 3, "fi 0 INPUT");
  };
  const auto behind = [&](SmallWorkspace& w) {
    w.transformer(4, "Copy", {"XFORMER_NAME", "Before"}).transformer(3, "Copy", names);
    w.link(1, "fo 0", 4, "fi 0 INPUT").link(4, "fo 1", 3, "fi 0 INPUT");
    w.attributeLink(4, "ao 1 0 id", 3, "ai 0 0 copy");
  };
  const auto looping = [&](SmallWorkspace& w) {
    w.setting("BLOCKED_LOOPING", "yes").port(8, "AGAIN", "loop");
    w.transformer(3, "Copy", names).transformer(4, "Copy", {}).link(4, "fo 0", 8, "fi 0");
    w.link(8, "fo 0", 3, "fi 0 INPUT").link(1, "fo 0", 4, "fi 0 INPUT");
  };
  const auto nested = [&](SmallWorkspace& w) {
    w.transformer(3, kInstance, {"SUB_DOC_NAME", "Inside", "XFORMER_NAME", "X"});
    w.transformer(4, kInstance, {"SUB_DOC_NAME", "Inside", "XFORMER_NAME", "Y"});
    w.link(1, "fo 0", 3, "fi 0 IN").link(3, "fo 0", 4, "fi 0 IN").endCustom();
    w.beginCustom("Inside").port(1, "IN", "true").port(2, "OUT", "false");
    w.transformer(3, "Copy", names).transformer(4, "Add", {"NEW", "new"});
    w.link(1, "fo 0", 3, "fi 0 INPUT").link(1, "fo 0", 4, "fi 0 INPUT").link(4, "fo 0", 2, "fi 0");
  };
  const auto named = [&](SmallWorkspace& w) {
    w.transformer(3, "Copy", names).transformer(4, "Add", {"NEW", "$(KEY)"});
    w.link(1, "fo 0", 4, "fi 0 INPUT").link(4, "fo 0", 3, "fi 0 INPUT");
  };
  const struct {
    const char* promise;
    const char* readers;
    std::function<void(SmallWorkspace&)> inside;
    QStringList named;
  } cases[] = {
      {"of one", "A", plain, {"id", "a"}},
      {"of both, in their order", "AB", plain, {"id", "a", "b"}},
      {"in the other order", "BA", plain, {"id", "b", "a"}},
      {"without an instance that is fed, none", "", plain, {}},
      {"behind others, whatever lies between", "AB", behind, {"id", "a", "b", "copy"}},
      {"what comes back by a loop", "A", looping, {"id", "a"}},
      {"nested, one level further in", "BA", nested, {"id", "b", "a", "new"}},
      {"not one whose name only the instance knows", "A", named, {"id", "a"}},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace = schemaWorkspace(test.readers);
    if (*test.readers == '\0')
      workspace.transformer(20, kInstance, {"SUB_DOC_NAME", "Schema", "XFORMER_NAME", "Unfed"});
    workspace.beginCustom("Schema").parameter("GUI TEXT KEY Key", "none");
    workspace.port(1, "IN", "true").port(2, "OUT", "false");
    test.inside(workspace);
    workspace.endCustom();
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.result, TranslationResult::Done) << outcome.texts.join('\n').toStdString();
    EXPECT_EQ(namedAttributes(outcome.text), test.named) << test.promise << outcome.text.toStdString();
  }
}

TEST(CustomTranslation, ReferencesOfNestedInstancesMeanTheParametersOfTheirScope) {
  const struct {
    const char* type;   // of the parameter P of the inner one, which also has Q
    const char* value;  // of P in an instance inside Outer, which has Q and LIMIT
    const char* written;
  } cases[] = {
      {"TEXT", "$(LIMIT)-$(Q)", "$($(Outer_WORKSPACE_NAME)_LIMIT)-$($(Outer_WORKSPACE_NAME)_Q)"},
      {"INSTANCE_MACROS TEXT", "$(LIMIT)-$(Q)",
       "$($(Outer_WORKSPACE_NAME)_LIMIT)-$($(Inner_WORKSPACE_NAME)_Q)"},
      {"INSTANCE_MACROS TEXT", "$(ORX_HOME)", "$(ORX_HOME)"},
      {"TEXT", "$[LIMIT]", "$($(Outer_WORKSPACE_NAME)_LIMIT)"},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Outer", "XFORMER_NAME", "O"});
    workspace.beginCustom("Outer").parameter("GUI TEXT LIMIT Limit", "1").parameter("GUI TEXT Q Q", "2");
    workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "I", "P", test.value});
    workspace.endCustom().beginCustom("Inner");
    workspace.parameter(QString("GUI %1 P P").arg(test.type), "3").parameter("GUI TEXT Q Q", "4").endCustom();
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.diagnostics, QStringList()) << test.value;
    EXPECT_TRUE(outcome.text.contains(QString("# MACRO $(Inner_WORKSPACE_NAME)_P %1\n").arg(test.written)))
        << outcome.text.toStdString();
  }
}

// --- nesting --------------------------------------------------------------------------------------

// A custom transformer that has `inner` inside, `times` in a row; plain when that is empty.
void addLevel(SmallWorkspace& workspace, const QString& name, const QString& inner, int times) {
  workspace.beginCustom(name).port(1, "IN", "true").port(2, "OUT", "false");
  int from = 1;
  for (int id = 3; id < 3 + times; from = id++) {
    if (inner.isEmpty())
      workspace.transformer(id, "Copy", {"XFORMER_NAME", QString("T%1").arg(id)});
    else
      workspace.transformer(id, kInstance, {"SUB_DOC_NAME", inner, "XFORMER_NAME", QString("T%1").arg(id)});
    workspace.link(from, "fo 0", id, "fi 0");
  }
  workspace.link(from, "fo 0", 2, "fi 0").endCustom();
}

SmallWorkspace nestedWorkspace(int levels, int times) {
  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id"}).writer(2, "Flooded");
  workspace.transformer(3, kInstance,
                        {"SUB_DOC_NAME", QString("L%1").arg(levels - 1), "XFORMER_NAME", "Outer"});
  workspace.link(1, "fo 0", 3, "fi 0").link(3, "fo 0", 2, "fi 0");
  for (int level = 0; level < levels; ++level)
    addLevel(workspace, QString("L%1").arg(level), level == 0 ? QString() : QString("L%1").arg(level - 1),
             times);
  return workspace;
}

TEST(CustomTranslation, NestsUpTo64Deep) {
  const struct {
    int levels;
    int times;
    QStringList diagnostics;
  } cases[] = {
      {3, 1, {}},
      {64, 1, {}},
      {64, 2, {}},
      {65, 1, {"nesting L1/T3"}},
  };
  for (const auto& test : cases) {
    QElapsedTimer timer;
    timer.start();
    const Outcome outcome = translate(nestedWorkspace(test.levels, test.times));
    EXPECT_LT(timer.elapsed(), 30000) << "what is placed twice on each level costs no more than its levels";
    EXPECT_EQ(outcome.diagnostics, test.diagnostics) << outcome.texts.join('\n').toStdString();
    if (!test.diagnostics.isEmpty()) {
      EXPECT_EQ(outcome.result, TranslationResult::Refused);
      EXPECT_TRUE(outcome.texts.first().contains("64")) << outcome.texts.first().toStdString();
      continue;
    }
    EXPECT_EQ(outcome.text.count("# TRANSFORMER_BEGIN L"), test.levels);
    EXPECT_EQ(outcome.text.count("INCLUDE_CUSTOM_TRANSFORMER_VER L"), (test.levels - 1) * test.times + 1);
    int before = 0;
    for (int level = 0; level < test.levels; ++level) {
      const int block = outcome.text.indexOf(QString("# TRANSFORMER_BEGIN L%1,").arg(level));
      EXPECT_GT(block, before) << "innermost first";
      before = block;
    }
  }
}

TEST(CustomTranslation, TellsThatAnAnswerWouldCostTooMuch) {
  for (const int references : {1000, 1001}) {
    SmallWorkspace workspace = nestedWorkspace(0, 0);
    workspace.transformer(4, "Copy", {"XFORMER_NAME", "Behind"}).link(3, "fo 0", 4, "fi 0");
    workspace.beginCustom("L-1")
        .parameter("GUI TEXT N Name", "n")
        .port(1, "IN", "true")
        .port(2, "OUT", "false");
    workspace.transformer(3, "Add", {"XFORMER_NAME", "A", "NEW", QString("$(N)").repeated(references)});
    workspace.link(1, "fo 0", 3, "fi 0").link(3, "fo 0", 2, "fi 0").endCustom();
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.diagnostics.contains("nesting "), references > 1000)
        << outcome.diagnostics.join('|').toStdString();
  }
}

TEST(CustomTranslation, NothingStandsInsideItselfOrUnderItsOwnMacro) {
  const struct {
    QStringList names;
    QStringList inside;  // what stands in each
    const char* way;
  } cases[] = {
      {{"A", "B", "C"}, {"A", "", ""}, "A > A"},
      {{"A", "B", "C"}, {"B", "A", ""}, "A > B > A"},
      {{"A", "B", "C"}, {"B", "C", "B"}, "B > C > B"},
      {{"A B", "B", "A_B"}, {"B", "A_B", ""}, "A_B_WORKSPACE_NAME"},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.transformer(3, kInstance, {"SUB_DOC_NAME", test.names.first(), "XFORMER_NAME", "Outer"});
    for (int i = 0; i < 3; ++i)
      addLevel(workspace, test.names.at(i), test.inside.at(i), 1);
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.result, TranslationResult::Refused) << test.way;
    ASSERT_EQ(outcome.texts.size(), 1) << test.way;
    EXPECT_TRUE(outcome.texts.first().contains(test.way)) << outcome.texts.first().toStdString();
  }
}

// --- names ----------------------------------------------------------------------------------------

TEST(CustomTranslation, FlowsAndNodesInsideKeepApart) {
  const struct {
    const char* promise;
    QString input;   // of Outer, in which stand V and the instance I of Inner, which has X inside
    QString second;  // a node beside V
    QString beside;  // a node beside O, the instance of Outer
    QStringList diagnostics;
    QString flow;  // from V
  } cases[] = {
      {"nothing in the way", "IN", "W", "O2_V", {}, "V_OUTPUT"},
      {"a port is called like an output", "V_OUTPUT", "W", "P", {}, "V_OUTPUT_2"},
      {"a port is called like that of an instance", "I_IN", "W", "P", {"taken-name Outer/I"}, ""},
      {"a node is called like one further in", "IN", "I_X", "P", {"taken-name Outer/I"}, ""},
      {"in the main document too", "IN", "W", "O_V", {"taken-name O"}, ""},
      {"at any depth", "IN", "W", "O_I_X", {"taken-name O"}, ""},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.reader(1, "A").transformer(3, kInstance, {"SUB_DOC_NAME", "Outer", "XFORMER_NAME", "O"});
    workspace.transformer(4, "Copy", {"XFORMER_NAME", test.beside}).link(1, "fo 0", 3, "fi 0");
    workspace.beginCustom("Outer").port(1, test.input, "true").port(2, "OUT", "false");
    workspace.transformer(3, "Copy", {"XFORMER_NAME", "V"}).link(1, "fo 0", 3, "fi 0");
    workspace.transformer(4, "Copy", {"XFORMER_NAME", test.second}).link(3, "fo 0", 4, "fi 0");
    workspace.transformer(5, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "I"}).endCustom();
    workspace.beginCustom("Inner").port(1, "IN", "true").transformer(3, "Copy", {"XFORMER_NAME", "X"});
    const Outcome outcome = translate(workspace.endCustom());
    EXPECT_EQ(outcome.diagnostics, test.diagnostics) << test.promise;
    if (!test.diagnostics.isEmpty())
      continue;
    const QString flow = QString("FEATURE_TYPE \"$(Outer_WORKSPACE_NAME)_%1\" ").arg(test.flow);
    EXPECT_EQ(outcome.text.count("OUTPUT " + flow), 1) << test.promise << outcome.text.toStdString();
    EXPECT_EQ(outcome.text.count("INPUT INPUT " + flow), 1) << test.promise << outcome.text.toStdString();
  }
}

TEST(CustomTranslation, NamesOfDifferentDepthsKeepApart) {
  const auto begin = [](SmallWorkspace& w, const char* name, const char* input) {
    w.beginCustom(name).parameter("GUI TEXT LIMIT Limit", "1").port(1, input, "true").port(2, "OUT", "false");
  };
  // The instance O has B_X inside, which has V inside.
  const struct {
    const char* what;
    const char* second;    // an instance beside O
    const char* inSecond;  // a node and an input in it
    const char* reader;
    const char* writer;
    const char* parameter;
    QStringList diagnostics;
  } cases[] = {
      {"nothing", "P", "V", "R", "W", "G", {}},
      {"nodes in two instances", "O_B", "X_V", "R", "W", "G", {"taken-name O"}},
      {"an input and one further in", "O_B", "X_IN", "R", "W", "G", {"taken-name O"}},
      {"nodes of names in between", "O_B", "X_Y", "R", "W", "G", {}},
      {"a reader's type", "P", "V", "O_B_X_V_OUTPUT", "W", "G", {"taken-name O"}},
      {"a writer's type", "P", "V", "R", "O_B_X_IN", "G", {"taken-name O"}},
      {"a type that nothing inside bears", "P", "V", "O_B_X_V_REST", "O_B_X", "G", {}},
      {"a parameter", "P", "V", "R", "W", "O_B_X_LIMIT", {"taken-name O"}},
      {"a parameter of a name in between", "P", "V", "R", "W", "O_B_LIMIT", {}},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.parameter(QString("GUI TEXT %1 Global").arg(test.parameter), "1");
    workspace.reader(1, test.reader).writer(2, test.writer);
    workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Outer", "XFORMER_NAME", "O"});
    workspace.transformer(4, kInstance, {"SUB_DOC_NAME", "Second", "XFORMER_NAME", test.second});
    workspace.link(1, "fo 0", 3, "fi 0 IN").link(3, "fo 0 OUT", 2, "fi 0");
    begin(workspace, "Outer", "IN");
    workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "B_X"}).endCustom();
    begin(workspace, "Inner", "IN");
    workspace.transformer(3, "Copy", {"XFORMER_NAME", "V"}).link(3, "fo 0 OUTPUT", 2, "fi 0").endCustom();
    begin(workspace, "Second", test.inSecond);
    workspace.transformer(3, "Copy", {"XFORMER_NAME", test.inSecond}).endCustom();
    EXPECT_EQ(translate(workspace).diagnostics, test.diagnostics) << test.what;
  }
}

TEST(CustomTranslation, WhatALoopIsHandedIsJudged) {
  const struct {
    const char* type;  // of the parameter P of the instance, which also has Q
    const char* value;
    const char* maximum;
    QStringList diagnostics;
    const char* written;
  } cases[] = {
      {"TEXT", "$(Q)", "4", {}, "MAX_LOOP_ITERATIONS:4 "},
      {"TEXT", "x", "<Unused>", {}, "MAX_LOOP_ITERATIONS: "},
      {"TEXT", "x", "$(ORX_NUMBER)", {}, "MAX_LOOP_ITERATIONS:$(ORX_NUMBER) "},
      {"TEXT", "x", "0", {"unwritable-value L"}, ""},
      {"TEXT", "x", "4 OUTPUT", {"unwritable-value L", "unfit-number L"}, ""},
      {"INSTANCE_MACROS TEXT", "$[Q]", "4", {"unwritable-value L"}, ""},
      {"INSTANCE_MACROS TEXT",
       "$(ELSEWHERE)",
       "4",
       {},
       "P,<dollarsign><leftparenthesis>ELSEWHERE<rightparenthesis>"},
      {"TEXT_EDIT_TCL_PARM", "return<space>1", "4", {"unwritable-value L"}, ""},
      {"OPTIONAL TEXT_EDIT_TCL_PARM", "<Unused>", "4", {}, "MAX_LOOP_ITERATIONS:4 "},
      {"TEXT", "ORX_CONDITIONAL:1=1;a;b", "4", {"unwritable-value L"}, ""},
      {"TEXT", "@Value(a)", "4", {"unwritable-value L"}, ""},
      {"TEXT", "$(WORDS)", "4", {}, "P,<dollarsign><leftparenthesis>WORDS<rightparenthesis>"},
      {"TEXT_ENCODED", "x$(ENCODED)", "4", {}, "P,x<dollarsign><leftparenthesis>ENCODED<rightparenthesis>"},
      {"TEXT", "x$(ENCODED)", "4", {"unwritable-value L"}, ""},
      {"TEXT_EDIT", "x ", "4", {"unwritable-value L"}, ""},
      {"TEXT", "a,b;c", "4", {}, "P,a<comma>b<semicolon>c"},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.parameter("GUI TEXT WORDS W", "a b").parameter("GUI TEXT_ENCODED ENCODED E", "a<space>b");
    workspace.transformer(3, kInstance,
                          {"SUB_DOC_NAME", "Looper", "XFORMER_NAME", "L", "P", test.value,
                           "MAX_LOOP_ITERATIONS", test.maximum});
    workspace.beginCustom("Looper", {"BLOCKED_LOOPING", "yes"}).port(1, "AGAIN", "loop");
    workspace.parameter(QString("GUI %1 P P").arg(test.type), "").parameter("GUI TEXT Q Q", "1").endCustom();
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.diagnostics, test.diagnostics) << test.type << " " << test.value << test.maximum;
    EXPECT_TRUE(outcome.text.contains(test.written)) << outcome.text.toStdString();
  }
}

TEST(CustomTranslation, InstancesLeaveTheParametersAroundThemAsTheyAre) {
  const struct {
    const char* around;  // a parameter of the workspace and of Outer, in which stands I
    const char* value;   // of P in the instance O and in I
    QStringList diagnostics;
  } cases[] = {
      {"P", "1", {}},        {"O_P", "1", {"unwritable-value O"}},
      {"O_P", "$(O_P)", {}}, {"I_P", "$(I_P)0", {"unwritable-value Outer/I"}},
      {"I_P", "$[I_P]", {}},
  };
  for (const auto& test : cases) {
    const QString line = QString("GUI TEXT %1 Around").arg(test.around);
    SmallWorkspace workspace;
    workspace.parameter(line, "2").transformer(
        3, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "O", "P", test.value});
    workspace.transformer(4, kInstance, {"SUB_DOC_NAME", "Outer", "XFORMER_NAME", "Other"});
    workspace.beginCustom("Outer").parameter(line, "3");
    workspace.transformer(5, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "I", "P", test.value});
    workspace.endCustom().beginCustom("Inner").parameter("GUI TEXT P P", "4").endCustom();
    EXPECT_EQ(translate(workspace).diagnostics, test.diagnostics) << test.around << test.value;
  }
}

TEST(CustomTranslation, WhatNoStatementCanCarryIsRefused) {
  const QString script = "GUI OPTIONAL TEXT_EDIT_TCL_PARM S Script";
  const QStringList looping{"BLOCKED_LOOPING", "yes"};
  const QStringList parallel{"PARALLELISM", "MODERATE"};
  const struct {
    const char* promise;
    QString name;          // of the instance
    QString port;          // its input
    QStringList settings;  // of the custom transformer
    QStringList values;    // of the instance
    QStringList inner;     // values of an instance further in, which stands there when there are some
    const char* diagnostic;
  } cases[] = {
      {"an ordinary one", "A B", "MY IN", {}, {}, {}, ""},
      {"without a script", "A B", "IN", {}, {"S", ""}, {"S", ""}, ""},
      {"a script", "A", "IN", {}, {"S", "return<space>1"}, {}, ""},
      {"a blank before a script", "A B", "IN", {}, {"S", "return<space>1"}, {}, "unwritable-value A B"},
      {"a script further in", "A B", "IN", {}, {}, {"S", "return<space>1"}, "unwritable-value A B"},
      {"a loop", "A", "IN", looping, {"ITERATION_COUNT_ATTR", "n"}, {}, ""},
      {"a counter", "A", "IN", looping, {"ITERATION_COUNT_ATTR", "my n"}, {}, "unwritable-value A"},
      {"the port of a loop", "A", "MY IN", looping, {}, {}, "unwritable-value A"},
      {"a port beside workers", "A", "FEATURE_TYPE", parallel, {}, {}, "unwritable-value A"},
      {"a group", "A", "IN", parallel, {"ORX_PROCESS_GROUP_BY", "a\\\" b"}, {}, "unwritable-value A"},
      {"a port in quotes", "A", "I\"N", {}, {}, {}, "unwritable-value A"},
      {"a reference in a name", "A$[P]", "IN", {}, {}, {}, "unwritable-value A$[P]"},
      {"a reference in a port", "A", "I$(N)", {}, {}, {}, "unwritable-value Cleaner"},
      {"a name in quotes", "A\"", "IN", {}, {}, {}, "unwritable-value A\""},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    const QStringList own{"SUB_DOC_NAME", "Cleaner", "XFORMER_NAME", test.name};
    workspace.transformer(3, kInstance, own + test.values);
    workspace.beginCustom("Cleaner", test.settings).parameter(script, "").port(1, test.port, "true");
    if (test.settings == looping)
      workspace.port(2, "L", "loop");
    if (!test.inner.isEmpty())
      workspace.transformer(5, kInstance,
                            QStringList{"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "I"} + test.inner);
    workspace.endCustom().beginCustom("Inner").parameter(script, "").endCustom();
    const Outcome outcome = translate(workspace);
    EXPECT_EQ(outcome.diagnostics.join('|'), QString(test.diagnostic))
        << test.promise << outcome.texts.join('\n').toStdString();
  }
}

}  // namespace
