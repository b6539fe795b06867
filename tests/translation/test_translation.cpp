#include <tests/support/QtPrinters.h>
#include <tests/translation/TranslatedWorkspace.h>

#include <QRegularExpression>

namespace {

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
  EXPECT_EQ(outcome.diagnostics, QStringList("repeated-declaration "));
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

// Not every text that a lookup can carry is one of the choices.
QStringList unwritable(const Outcome& outcome) {
  return outcome.diagnostics.filter(QRegularExpression("^(cycle|unwritable)"));
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
    const QStringList expected =
        test.isRound ? QStringList{"cycle ", "unwritable-value P"} : QStringList("unwritable-value P");
    EXPECT_EQ(unwritable(translate(workspace)), test.isFine ? QStringList() : expected)
        << test.value.toStdString() << ' ' << test.globals.join(' ').left(40).toStdString();
  }
  // A value that the header or the call gives counts.
  SmallWorkspace workspace = copyBetween();
  workspace.header("MACRO A {").transformer(7, "Pick", {"XFORMER_NAME", "P", "MODE", "$(A)"});
  EXPECT_EQ(unwritable(translate(workspace)), QStringList("unwritable-value P"));
  EXPECT_EQ(translate(workspace, {{"A", "Fast"}}).diagnostics, QStringList());
  SmallWorkspace continued = copyBetween();
  continued.header("MACRO A x\\").header("{").transformer(7, "Pick", {"XFORMER_NAME", "P", "MODE", "$(A)"});
  EXPECT_EQ(unwritable(translate(continued)), QStringList("unwritable-value P"));
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
    EXPECT_EQ(unwritable(translate(workspace)), test.diagnostics) << test.inner << ' ' << test.value;
  }
}

}  // namespace
