// Embedded custom transformers as what a file of their own holds.
#include <platform/qorxcore/qorxcore.h>
#include <tests/support/QtPrinters.h>
#include <tests/translation/TranslatedWorkspace.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/XMLComponentReader.h>
#include <translation/CustomExtraction.h>

namespace {

const QString kInstance = QStringLiteral("SubDocumentTransformer");

// "Outer" with ports, a loop, parameters and settings; "Inner" twice inside it; "Other" is used by nobody.
SmallWorkspace document() {
  SmallWorkspace workspace;
  workspace.header("MACRO HEADER_SET 1").parameter("GUI TEXT GLOBAL Global", "2");
  workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Outer", "XFORMER_NAME", "O"});
  workspace.beginCustom("Outer",
                        {"VERSION", "3", "CATEGORY", "Mine", "GUID", "{A-B}", "BLOCKED_LOOPING", "yes",
                         "PYTHON_COMPATIBILITY", "38", "PARALLELISM", "MODERATE", "DEPRECATED", "yes",
                         "PARALLEL_GROUP_BY", "id", "DESCRIPTION", "Does <this> & \"that\""});
  workspace.port(1, "IN", "true").port(2, "OUT", "false").port(5, "BACK", "loop");
  workspace.parameter("GUI TEXT LIMIT The limit", "a & b").parameter("GUI OPTIONAL INTEGER N Count", "");
  workspace.transformer(3, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "First", "P", "$(LIMIT)"});
  workspace.transformer(4, kInstance, {"SUB_DOC_NAME", "Inner", "XFORMER_NAME", "Second"});
  workspace.transformer(6, "Copy", {"XFORMER_NAME", "C", "VALUE", "$(N)"});
  workspace.link(1, "fo 0", 3, "fi 0 X").link(5, "fo 0", 3, "fi 0 X").link(3, "fo 0 Y", 4, "fi 0 X");
  workspace.link(4, "fo 0", 6, "fi 0").link(6, "fo 0", 2, "fi 0").link(6, "fo 1", 5, "fi 0").endCustom();
  workspace.beginCustom("Other").port(1, "IN", "true").endCustom();
  workspace.beginCustom("Inner").port(1, "X", "true").port(2, "Y", "false");
  workspace.parameter("GUI TEXT P P", "1").transformer(3, "Add", {"XFORMER_NAME", "A", "NEW", "new"});
  workspace.link(1, "fo 0", 3, "fi 0").link(3, "fo 0", 2, "fi 0").endCustom();
  return workspace;
}

// What a network and those inside it are made of, without whose file they stand in.
QStringList contentOf(CompoundTransformerNetwork& root) {
  QStringList all;
  for (CompoundTransformerNetwork* network : nestedNetworks(root)) {
    const ParallelSettings parallel = network->getParallelSettings();
    all << network->getName() << QString::number(network->getVersion()) << network->getCategory()
        << network->getGUID() << network->getPythonVersion() << parallel.parallelism << parallel.groupBy
        << QString("looping %1 deprecated %2").arg(network->blockedLooping()).arg(network->isDeprecated())
        << "in" << network->getInputs() << "out" << network->getOutputs() << "loops" << network->getLoops()
        << network->getDescriptionLines();
    for (const QString& name : network->getParameters()) {
      const CompoundTransformerParm& parameter = *network->getParameterInfo(name);
      all << parameter.type.getAsString() << parameter.defaultValue;
    }
    for (const TransformerCfg* cfg : network->getTransformers()) {
      for (const QString& name : cfg->getParameters())
        all << name + "=" + cfg->getParameterValue(name);
    }
    network->setInputAttributes(QHash<QString, QStringList>{{network->getInputs().value(0), {"id"}}});
    for (const QString& output : network->getOutputs()) {
      QHash<QString, QString> origins;
      all << network->getOutputAttributes(output, origins);
    }
  }
  return all;
}

class Extraction : public testing::Test {
 protected:
  void read(const SmallWorkspace& workspace) {
    headerLines.clear();
    reader.ReadInput(workspace.save(folder), headerLines);
  }
  QStringList rulesOf(CustomExtraction& extraction, const QString& name, bool& isPrepared, int version = 0) {
    orx::Findings diagnostics("test.orw");
    isPrepared = extraction.prepare(name, version, diagnostics);
    return describe(diagnostics);
  }

  QTemporaryDir folder;
  SmallSource source;
  XMLComponentReader reader;
  QStringList headerLines;
};

TEST_F(Extraction, IsReadBackIdentical) {
  read(document());
  CustomExtraction extraction(reader, headerLines, source);
  EXPECT_EQ(extraction.names(), QStringList({"Outer", "Other", "Inner"}));
  for (const QString& name : {QString("Outer"), QString("Inner")}) {
    bool isPrepared = false;
    EXPECT_EQ(rulesOf(extraction, name, isPrepared), QStringList());
    ASSERT_TRUE(isPrepared);
    EXPECT_EQ(extraction.parts(), name == "Outer" ? QStringList({"Outer", "Inner"}) : QStringList("Inner"));
    EXPECT_EQ(extraction.workspaceParameters(), QStringList());
    const QString path = folder.filePath(name + ".ort");
    QString error;
    ASSERT_TRUE(
        VersionStore(path).insert(extraction.fields(), extraction.definition(), extraction.document(), error))
        << error.toStdString();

    ExternalTransformerNetwork linked(path, -1, &source);
    SubDocumentLibrary library(reader, &source);
    EXPECT_EQ(contentOf(linked), contentOf(*library.network(name)));
    EXPECT_TRUE(linked.problems().empty());
    EXPECT_EQ(linked.definitionLines(), extraction.definition());
    EXPECT_EQ(linked.getInsertMode(), 2);

    // What was extracted gives itself once more, and under another number all but that.
    XMLComponentReader again;
    again.ReadBufferInput(extraction.document());
    CustomExtraction second(again, {}, source);
    EXPECT_EQ(rulesOf(second, name, isPrepared), QStringList());
    EXPECT_EQ(second.fields(), extraction.fields());
    EXPECT_EQ(second.definition(), extraction.definition());
    EXPECT_EQ(second.document(), extraction.document());
    EXPECT_EQ(rulesOf(second, name, isPrepared, 8), QStringList());
    EXPECT_EQ(second.fields().value(1), QString("8"));
    EXPECT_EQ(second.definition().filter("INCLUDE"), extraction.definition().filter("INCLUDE"));
    ASSERT_TRUE(VersionStore(path).insert(second.fields(), second.definition(), second.document(), error));
    EXPECT_EQ(ExternalTransformerNetwork(path, -1, &source).getVersion(), 8);
    EXPECT_EQ(contentOf(linked), contentOf(*library.network(name))) << "the version that was there before";
  }
}

TEST_F(Extraction, FindsWhatTheWorkspaceWouldHaveToGive) {
  const QString script = QORXWwjdEncode("ORX_MacroValues['GLOBAL'] + 'x'");
  using Change = std::function<void(SmallWorkspace&)>;
  const auto value = [](const QString& text) -> Change {
    return [=](SmallWorkspace& w) { w.transformer(7, "Copy", {"VALUE", text}); };
  };
  const auto parameter = [](const QString& guiLine, const QString& text) -> Change {
    return [=](SmallWorkspace& w) { w.parameter(guiLine, text); };
  };
  const Change nested = [](SmallWorkspace& w) {
    w.transformer(7, kInstance, {"SUB_DOC_NAME", "In"}).endCustom();
    w.beginCustom("In").transformer(3, "Copy", {"VALUE", "$(GLOBAL)"});
  };
  const struct {
    const char* promise;
    Change inside;
    QStringList needed;
  } cases[] = {
      {"nothing", value(""), {}},
      {"a value", value("x$(GLOBAL)"), {"GLOBAL"}},
      {"a deferred one", value("$[GLOBAL]"), {"GLOBAL"}},
      {"an encoded one", value(QORXWwjdEncode("$[GLOBAL]")), {"GLOBAL"}},
      {"a macro of the header", value("$(HEADER_SET)"), {"HEADER_SET"}},
      {"each once, in their order", value("$(GLOBAL)$(HEADER_SET)$(GLOBAL)"), {"HEADER_SET", "GLOBAL"}},
      {"a default", parameter("GUI TEXT D D", "$(GLOBAL)"), {"GLOBAL"}},
      {"a script", parameter("GUI TEXT_EDIT_PYTHON_PARM S S", script), {"GLOBAL"}},
      {"a parameter of its own", parameter("GUI TEXT GLOBAL G", "$(GLOBAL)"), {}},
      {"in one that stands inside", nested, {"GLOBAL"}},
      {"macros that are always there", value("$(ORX_HOME)"), {}},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.header("MACRO HEADER_SET 1").parameter("GUI TEXT GLOBAL Global", "2").beginCustom("Custom");
    test.inside(workspace);
    read(workspace.endCustom());
    CustomExtraction extraction(reader, headerLines, source);
    bool isPrepared = false;
    EXPECT_EQ(rulesOf(extraction, "Custom", isPrepared), QStringList()) << test.promise;
    EXPECT_EQ(extraction.workspaceParameters(), test.needed) << test.promise;
  }
}

TEST_F(Extraction, RefusesWhatNoFileCanHold) {
  const struct {
    QString name;
    QString inner;  // type of the transformer inside
    QString rule;
  } cases[] = {
      {"Good", "Nothing", "unknown-transformer Good/T"},
      {"Good", "Broken", "not-written Good/T"},
      {"Good", "Good", "nesting Good/T"},
      {"A,B", "Copy", "custom-transformer-fault A,B"},
      {"A\nB", "Copy", "custom-transformer-fault A\nB"},
  };
  for (const auto& test : cases) {
    SmallWorkspace workspace;
    workspace.beginCustom(test.name).transformer(3, test.inner, {"XFORMER_NAME", "T"}).endCustom();
    read(workspace);
    CustomExtraction extraction(reader, headerLines, source);
    bool isPrepared = false;
    EXPECT_EQ(rulesOf(extraction, extraction.names().value(0), isPrepared), QStringList(test.rule));
    EXPECT_FALSE(isPrepared) << test.inner.toStdString();
  }
}

}  // namespace
