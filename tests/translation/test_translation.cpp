#include <tests/support/QtPrinters.h>
#include <tests/translation/TranslatedWorkspace.h>

namespace {

using Change = std::function<void(SmallWorkspace&)>;

Change node(const QString& type, const QStringList& parameters, const QStringList& extra = {}, int id = 7) {
  return [=](SmallWorkspace& w) { w.transformer(id, type, parameters, extra); };
}
Change valued(const QString& value) {
  return node("Copy", {"XFORMER_NAME", "N", "VALUE", value});
}
Change linked(int from, const QString& output, int to, const QString& input) {
  return [=](SmallWorkspace& w) { w.link(from, output, to, input); };
}
Change parameter(const QString& guiLine, const QString& value) {
  return [=](SmallWorkspace& w) { w.parameter(guiLine, value); };
}
Change reading(const QString& name) {
  return [=](SmallWorkspace& w) { w.reader(9, name).link(9, "fo 0", 3, "fi 0 INPUT"); };
}
Change port(const QString& name) {
  return [=](SmallWorkspace& w) { w.port(9, name, "false").link(3, "fo 0", 9, "fi 0"); };
}

SmallWorkspace copyBetween() {
  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id", "area"})
      .writer(2, "Flooded")
      .transformer(3, "Copy", {"XFORMER_NAME", "C"});
  workspace.link(1, "fo 0 Parcels", 3, "fi 0 INPUT").link(3, "fo 0 OUTPUT", 2, "fi 0");
  return workspace;
}

TEST(Translation, WritesTheStatementsInOrder) {
  SmallWorkspace workspace = copyBetween();
  workspace.header("# kept as it stands ").header("MACRO Set 1");
  workspace.parameter("GUI TEXT Set Prompt", "2").parameter("GUI TEXT Free Prompt", "a b");
  const Outcome outcome = translate(workspace, {{"Free", "c"}});
  EXPECT_EQ(outcome.result, TranslationResult::Done);
  EXPECT_EQ(outcome.diagnostics, QStringList());
  const QStringList lines = outcome.text.split('\n', Qt::SkipEmptyParts);
  ASSERT_EQ(lines.size(), 8) << outcome.text.toStdString();
  EXPECT_TRUE(lines.at(0).startsWith("# Written by orxt "));
  EXPECT_EQ(lines.mid(1), (QStringList{
                              "# kept as it stands ",
                              "MACRO Set 1",
                              "DEFAULT_MACRO Free a b",
                              "MACRO Free c",
                              "FACTORY_DEF * CopyFactory FACTORY_NAME C INPUT INPUT FEATURE_TYPE Parcels P ",
                              "FACTORY_DEF * TeeFactory FACTORY_NAME C|OUTPUT_Router INPUT FEATURE_TYPE "
                              "C|OUTPUT OUTPUT FEATURE_TYPE C_OUTPUT ",
                              "FACTORY_DEF * TeeFactory FACTORY_NAME \"DATA Flooded Output Renamer/Nuker\" "
                              "INPUT FEATURE_TYPE C_OUTPUT OUTPUT FEATURE_TYPE Flooded",
                          }));
}

TEST(Translation, FlowsKeepApart) {
  SmallWorkspace workspace;
  // The writer keeps its name, the readers give way; the transformer's own flow name is taken by a reader.
  workspace.reader(1, "Roads").reader(2, "Roads").reader(4, "C_OUTPUT").writer(3, "Roads");
  workspace.transformer(5, "Copy", {"XFORMER_NAME", "C"});
  for (const int reader : {1, 2, 4})
    workspace.link(reader, "fo 0", 5, "fi 0 INPUT");
  workspace.link(5, "fo 0 OUTPUT", 3, "fi 0");
  const QString text = translate(workspace).text;
  for (const char* statement :
       {"READER_FEATURE_TYPE DATA Roads Roads_2\n", "READER_FEATURE_TYPE DATA Roads Roads_3\n",
        "INPUT INPUT FEATURE_TYPE Roads_2 INPUT INPUT FEATURE_TYPE Roads_3 INPUT INPUT FEATURE_TYPE C_OUTPUT "
        "P",
        "INPUT FEATURE_TYPE C|OUTPUT OUTPUT FEATURE_TYPE C_OUTPUT_2 ",
        "INPUT FEATURE_TYPE C_OUTPUT_2 OUTPUT FEATURE_TYPE Roads\n"})
    EXPECT_TRUE(text.contains(statement)) << statement << "\n" << text.toStdString();
}

TEST(Translation, SourcesOfOneInputStandInTheirOrder) {
  struct {
    const char* promise;
    QString order;              // of the input port
    QList<int> executionIndex;  // of the links from A, B, C
    const char* expected;
  } const cases[] = {
      {"document order", "", {-1, -1, -1}, "A B C"},
      {"execution index from 0 up, others behind", "", {-1, 1, 0}, "C B A"},
      {"the port's order first", "INPUT B A", {0, 1, 2}, "B A C"},
      {"an order of another port does nothing", "REST B A", {-1, -1, -1}, "A B C"},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.reader(1, "A").reader(2, "B").reader(3, "C");
    workspace.transformer(4, "Copy", {"XFORMER_NAME", "T"}, {"INPUT_FT_ORDER", test.order});
    for (int reader = 1; reader <= 3; ++reader) {
      workspace.link(reader, "fo 0", 4, "fi 0 INPUT",
                     {"EXECUTION_IDX", QString::number(test.executionIndex.at(reader - 1))});
    }
    QStringList found;
    QRegularExpressionMatchIterator match =
        QRegularExpression("INPUT INPUT FEATURE_TYPE (\\w)").globalMatch(translate(workspace).text);
    while (match.hasNext())
      found << match.next().captured(1);
    EXPECT_EQ(found.join(' '), QString(test.expected)) << test.promise;
  }
}

TEST(Translation, DisabledNodesAndLinksAreLeftOut) {
  SmallWorkspace workspace = copyBetween();
  workspace.transformer(4, "NoSuchThing", {"XFORMER_NAME", "D"}, {"ENABLED", "false"});
  workspace.link(3, "fo 1 REST", 4, "fi 0 INPUT").link(1, "fo 0", 2, "fi 0", {"ENABLED", "false"});
  const Outcome outcome = translate(workspace);
  EXPECT_EQ(outcome.diagnostics, QStringList());
  EXPECT_FALSE(outcome.text.contains("REST"));
  EXPECT_FALSE(outcome.text.contains("INPUT FEATURE_TYPE Parcels OUTPUT"));
}

TEST(Translation, AttributeLinksCopyAttributes) {
  SmallWorkspace workspace = copyBetween();
  workspace.attributeLink(1, "ao 0 0 id", 3, "ai 0 0 parcel<space>id")
      .attributeLink(3, "ao 0 0 area", 2, "ai 0 0 size");
  workspace.attributeLink(3, "ao 0 0 id", 2, "ai 0 1 id");
  const QString text = translate(workspace).text;
  for (const char* statement :
       {"INPUT FEATURE_TYPE Parcels OUTPUT FEATURE_TYPE Parcels_2 @CopyAttribute(parcel<space>id,id)\n",
        "INPUT INPUT FEATURE_TYPE Parcels_2 P", "C_OUTPUT @CopyAttribute(size,area)\n"})
    EXPECT_TRUE(text.contains(statement)) << statement << "\n" << text.toStdString();
  EXPECT_FALSE(text.contains("(id,id)"));
}

// A custom transformer with a parameter, an inner "Copy" and an output fed by two inner ports.
SmallWorkspace withCustom(const std::function<void(SmallWorkspace&)>& change = {}) {
  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id"}).writer(2, "Flooded");
  workspace.transformer(3, "SubDocumentTransformer",
                        {"SUB_DOC_NAME", "Cleaner", "XFORMER_NAME", "First", "LIMIT", "7"});
  workspace.link(1, "fo 0", 3, "fi 0 IN").link(3, "fo 0 OUT", 2, "fi 0");
  workspace.beginCustom("Cleaner", {"CATEGORY", "Mine"}).port(1, "IN", "true").port(2, "OUT", "false");
  workspace.parameter("GUI TEXT LIMIT Limit", "5");
  workspace.transformer(3, "Copy", {"XFORMER_NAME", "C", "VALUE", "$(LIMIT)"});
  workspace.link(1, "fo 0", 3, "fi 0 INPUT")
      .link(3, "fo 0 OUTPUT", 2, "fi 0")
      .link(3, "fo 1 REST", 2, "fi 0");
  if (change)
    change(workspace);
  workspace.endCustom();
  return workspace;
}

TEST(Translation, MacrosInLookupsAreJudgedByTheirValues) {
  const struct {
    QString value;        // of the choice
    QStringList globals;  // name, value, name, value
    bool isFine;
    bool isRound = false;
  } cases[] = {
      {"$(A)", {"A", "Slow one"}, true},
      {"$(A)", {"A", "a {b} c"}, true},
      {"$(A)", {"A", "}"}, false},
      {"$(A)", {"A", "a [exit]"}, false},
      {"$(A)", {"A", "say \"x\""}, false},
      {"$(A)", {"A", "$x"}, false},
      {"x$(A)$(B)", {"A", "cost$", "B", "x"}, false},  // a variable only together
      {"$(A)", {"A", "$(B)", "B", "{"}, false},
      {"$(X_$(A))", {"A", "B", "X_B", "{"}, false},
      {"$[A]", {"A", "{"}, false},
      {"$[A]", {"A", "Fast"}, true},
      {"$(A)", {"A", "{" + QString("x").repeated(2 << 20)}, false},
      {"$(A)", {"A", "$(B)", "B", "$(A)"}, false, true},
      {"$(ORX_HOME) $(A)", {"A", "x"}, true},
      {"Fast", {"A", "{"}, true},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace = copyBetween();
    for (int i = 0; i < test.globals.size(); i += 2)
      workspace.parameter("GUI TEXT " + test.globals.at(i) + " Prompt", test.globals.at(i + 1));
    workspace.transformer(7, "Pick", {"XFORMER_NAME", "P", "MODE", test.value});
    const Outcome outcome = translate(workspace);
    const QStringList expected =
        test.isRound ? QStringList{"cycle ", "unwritable-value P"} : QStringList("unwritable-value P");
    EXPECT_EQ(outcome.diagnostics, test.isFine ? QStringList() : expected)
        << test.value.toStdString() << ' ' << test.globals.join(' ').left(40).toStdString();
  }
  // A value that the header or the call gives counts.
  SmallWorkspace workspace = copyBetween();
  workspace.header("MACRO A {").transformer(7, "Pick", {"XFORMER_NAME", "P", "MODE", "$(A)"});
  EXPECT_EQ(translate(workspace).diagnostics, QStringList("unwritable-value P"));
  EXPECT_EQ(translate(workspace, {{"A", "Fast"}}).diagnostics, QStringList());
  SmallWorkspace continued = copyBetween();
  continued.header("MACRO A x\\").header("{").transformer(7, "Pick", {"XFORMER_NAME", "P", "MODE", "$(A)"});
  EXPECT_EQ(translate(continued).diagnostics, QStringList("unwritable-value P"));
}

TEST(Translation, LookupsInsideCustomTransformersAreJudgedByTheInstances) {
  const struct {
    const char* type;        // inside
    const char* inner;       // its choice
    const char* value;       // of the instance's parameter
    const char* identifier;  // of the instance
    QStringList diagnostics;
  } cases[] = {
      {"Pick", "$(LIMIT)", "Slow one", "First", {}},
      {"Pick", "$(LIMIT)", "}", "First", {"unwritable-value First"}},
      {"Pick", "x$[LIMIT]", "}", "First", {"unwritable-value First"}},
      {"Pick", "$(LIMIT)", "$(A)", "First", {"unwritable-value First"}},
      {"Pick", "Fast", "}", "First", {}},
      {"Map", "$(A)", "Fast", "First", {"unwritable-value Cleaner/P"}},
      {"Pick", "$(LIMIT)", "Fast", "[exit]", {"unwritable-value [exit]"}},
      {"Pick", "Fast", "Fast", "[exit]", {}},
      {"Pick", "Fast", "a\\", "First", {"unwritable-value First"}},
      {"Pick", "Fast", "Fast", "a\"b", {"unwritable-value a\"b"}},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.parameter("GUI TEXT A Prompt", "{");
    workspace.transformer(3, "SubDocumentTransformer",
                          {"SUB_DOC_NAME", "Cleaner", "XFORMER_NAME", test.identifier, "LIMIT", test.value});
    workspace.beginCustom("Cleaner", {"CATEGORY", "Mine"}).parameter("GUI TEXT LIMIT Limit", "Fast");
    workspace.transformer(3, test.type, {"XFORMER_NAME", "P", "MODE", test.inner}).endCustom();
    EXPECT_EQ(translate(workspace).diagnostics, test.diagnostics) << test.inner << ' ' << test.value;
  }
}

void expectRefused(const SmallWorkspace& workspace, const QStringList& diagnostics) {
  const Outcome outcome = translate(workspace);
  for (const QString& diagnostic : diagnostics)
    EXPECT_TRUE(outcome.diagnostics.contains(diagnostic)) << outcome.diagnostics.join('|').toStdString();
  EXPECT_EQ(outcome.result, TranslationResult::Refused);
  EXPECT_EQ(outcome.text, QString());
}

TEST(Translation, RefusesFaultyCustomTransformers) {
  const std::pair<Change, const char*> cases[] = {
      {node("Nothing", {"XFORMER_NAME", "N"}, {}, 9), "unknown-transformer Cleaner/N"},
      {linked(1, "fo 0", 77, "fi 0"), "dangling-link Cleaner"},
      {linked(3, "fo 0 OUTPUT", 3, "fi 0 INPUT"), "cycle Cleaner"},
      {valued("$[x"), "unwritable-value Cleaner/N"},
      {node("Broken", {"XFORMER_NAME", "N"}), "not-written Cleaner/N"},
      {port("A\nB"), "line-break Cleaner"},
      {port("IN"), "duplicate-name Cleaner/IN"},
  };
  for (const auto& [change, diagnostic] : cases)
    expectRefused(withCustom(change), {diagnostic});
  for (const char* name : {"Cleaner (2)", "A,B", "A$B", "A "}) {
    SmallWorkspace workspace;
    workspace.transformer(3, "SubDocumentTransformer", {"SUB_DOC_NAME", name, "XFORMER_NAME", "First"});
    expectRefused(workspace.beginCustom(name, {}).endCustom(), {"nesting First"});
  }
}

TEST(Translation, RefusesWhatItCannotTranslate) {
  const QString tooLong = QString("x").repeated(1030);
  const std::pair<Change, QStringList> cases[] = {
      {node("Nothing", {"XFORMER_NAME", "N"}), {"unknown-transformer N"}},
      {node("Copy", {"XFORMER_NAME", "N"}, {"VERSION", "9"}), {"unknown-version N"}},
      {node("SubDocumentTransformer", {"XFORMER_NAME", "N"}), {"custom-transformer N"}},
      {node("Copy", {"COLOUR", "red"}), {"unknown-parameter Copy_7"}},
      {node("Copy", {"XFORMER_NAME", "C"}), {"duplicate-name C"}},
      {[&](SmallWorkspace& w) {
         node("Copy", {"XFORMER_NAME", tooLong})(w);
         node("Copy", {"XFORMER_NAME", tooLong + "x"}, {}, 8)(w);
       },
       {"duplicate-name " + tooLong.left(1023)}},
      {node("Copy", {"XFORMER_NAME", "N"}, {}, 1), {"duplicate-number N"}},
      {linked(3, "fo 0 OUTPUT", 77, "fi 0"), {"dangling-link "}},
      {linked(2, "fo 0", 3, "fi 0 INPUT"), {"bad-port Flooded"}},
      {linked(3, "xo 0 OUTPUT", 2, "fi 0"), {"bad-port C"}},
      {linked(3, "fo 0 OUTPUT", 2, "fo 0"), {"bad-port Flooded"}},
      {linked(1, "fo 0", 3, "fi 0 MIDDLE"), {"unknown-input C"}},
      {linked(3, "fo 2", 2, "fi 0"), {"unknown-output C"}},
      {linked(3, "fo 1 REST", 3, "fi 0 INPUT"), {"cycle C"}},
      {parameter("nonsense", ""), {"bad-prompt-line "}},
      {parameter("GUI TEXT A P", "$[B"), {"unclosed-reference "}},
      {parameter("GUI TEXT A P", "a\nb"), {"line-break "}},
      {parameter("GUI TEXT A P", "a\\"), {"unwritable-value "}},
      {parameter("GUI TEXT \"A B\" P", "a"), {"unwritable-value "}},
      {parameter("GUI TEXT A<u000a>B P", "a"), {"unwritable-value "}},
      {reading("$[B]$["), {"unclosed-reference $[B]$["}},
      {reading("a\\\" b"), {"unwritable-value a\\\" b"}},
      {valued("$[x"), {"unwritable-value N"}},
      {valued("a OUTPUT x FEATURE_TYPE y"), {"unwritable-value N"}},
      {valued("@EvaluateExpression("), {"unwritable-value N"}},
      {valued("P"), {"unwritable-value N"}},
      {node("Copy", {"XFORMER_NAME", "a\\\" b"}), {"unwritable-value a\\\" b"}},
      {[](SmallWorkspace& w) {
         node("Nothing", {})(w);
         node("Copy", {"XFORMER_NAME", "C"}, {}, 8)(w);
         w.link(3, "fo 8", 2, "fi 0");
       },
       {"unknown-transformer Nothing_7", "duplicate-name C", "unknown-output C"}},
  };
  for (const auto& [change, diagnostics] : cases) {
    SmallWorkspace workspace = copyBetween();
    change(workspace);
    expectRefused(workspace, diagnostics);
  }
}

}  // namespace
