// Networks from documents: inside a workspace, and in files of their own.
#include "CustomFixtures.h"
#include <tests/support/Files.h>
#include <tests/support/QtPrinters.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLComponentReader.h>

#include <QDir>
#include <QTemporaryDir>
#include <gtest/gtest.h>

#include <functional>

namespace {

using orx::Rule;

QStringList split(const char* text) {
  return QString::fromUtf8(text).split(';');
}

Definitions someDefinitions() {
  Definitions definitions;
  TransformerDefinition adder = passing("Adder", "OUT,REST", "$(ATTR)");
  adder.parameterNames = names("ATTR");
  adder.parameterTypes = names("NEW_ATTR");
  adder.parameterPrompts = adder.parameterDefaults = QStringList{QString()};
  definitions.add(adder);
  return definitions;
}

class DocumentNetwork : public testing::Test {
 protected:
  void read(const std::vector<DocumentText>& documents) { reader.ReadBufferInput(documentXml(documents)); }

  QString path(const char* name) const { return folder.filePath(QLatin1String(name)); }

  QString write(const char* name, const QByteArray& bytes) const {
    put(path(name), bytes);
    return path(name);
  }

  // Puts a version into a file of versions.
  QString store(const char* name, const QStringList& fields,
                const std::vector<DocumentText>& documents) const {
    QString error;
    EXPECT_TRUE(
        VersionStore(path(name))
            .insert(fields, {QStringLiteral("DEFINITION ") + fields.value(1)}, documentXml(documents), error))
        << qPrintable(error);
    return path(name);
  }

  Definitions definitions = someDefinitions();
  XMLComponentReader reader;
  QTemporaryDir folder;
};

QStringList attributesOf(CompoundTransformerNetwork& network, const char* output) {
  QHash<QString, QString> origins;
  return network.getOutputAttributes(QLatin1String(output), origins);
}

TEST_F(DocumentNetwork, IsBuiltFromItsSubDocument) {
  read({{"Net",
         split("set VERSION 4;set CATEGORY Cat;set DESCRIPTION Does things;set BLOCKED_LOOPING yes;"
               "set ORT_ATTRIBUTE_PROPOGATION_MODE ALL;set PYTHON_COMPATIBILITY 36;set OTHER x;"
               "gui GUI TEXT LABEL The label | none;in A declared;in B;out O;own P x,y;loop L;t T Adder;"
               "parm T ATTR added;A -> T ;B -> T ;T -> O OUT;T -> P REST;T -> L REST")}});
  ExternalDocNetwork network;
  Definitions none;
  network.build(reader, "Net", none);
  EXPECT_FALSE(network.problems().empty());
  network.build(reader, "Net", definitions);
  EXPECT_TRUE(network.problems().empty()) << qPrintable(network.problems().front().text);
  EXPECT_EQ(network.getName(), "Net");
  EXPECT_EQ(network.getVersion(), 4);
  EXPECT_EQ(network.getCategory(), "Cat");
  EXPECT_EQ(network.getDescriptionLines(), names("Does things"));
  EXPECT_FALSE(network.getProperties().contains("OTHER"));
  EXPECT_TRUE(network.blockedLooping());
  EXPECT_EQ(network.getPythonVersion(), "36");
  EXPECT_EQ(network.getIncomingAttributePropogationMode(), kIncomingAll);
  EXPECT_EQ(network.getInputs(), names("A,B"));
  EXPECT_EQ(network.getOutputs(), names("O,P"));
  EXPECT_EQ(network.getLoops(), names("L"));
  EXPECT_EQ(network.getParameters(), names("LABEL"));
  EXPECT_EQ(network.getParameterInfo("LABEL")->defaultValue, "none");
  EXPECT_TRUE(network.hasTransformerNamed("T"));
  EXPECT_FALSE(network.hasTransformerNamed("t"));
  network.setInputAttributes(QHash<QString, QStringList>{{"B", {"b"}}});
  EXPECT_EQ(attributesOf(network, "O"), names("declared,b,added"));
  EXPECT_EQ(attributesOf(network, "P"), names("x,y"));
  EXPECT_EQ(network.getUpstreamInputs("P"), names("A,B"));
  CompoundTransformerCfg instance(&network);
  EXPECT_EQ(instance.getParameters(), names("XFORMER_NAME,LABEL,MAX_LOOP_ITERATIONS,ITERATION_COUNT_ATTR"));
}

struct Fault {
  const char* document;
  Rule rule;
  const char* node;
  const char* inText;
};

const Fault kFaults[] = {
    {"t T Nothing", Rule::UnknownTransformer, "T", "Nothing"},
    {"use T ", Rule::CustomTransformer, "T", "SUB_DOC_NAME"},
    {"t T Adder;parm T SIZE 3", Rule::UnknownParameter, "T", "SIZE"},
    {"t T Adder;in A;A -> T  NONE", Rule::UnknownInput, "T", "NONE"},
    {"t T Adder;out O;T -> O NONE", Rule::UnknownOutput, "T", "OUT, REST"},
    {"in A;A -> T", Rule::DanglingLink, "", "999"},
    {"in A;out O;O -> A", Rule::BadPort, "O", "fo 0"},
    {"in A;out O;raw <FEAT_LINK SOURCE_NODE=\"0\" TARGET_NODE=\"1\" SOURCE_PORT_DESC=\"fi 0\" "
     "TARGET_PORT_DESC=\"fi 0\"/>",
     Rule::BadPort, "A", "fi 0"},
    {"t T Adder;t T Adder", Rule::DuplicateName, "T", "T"},
    {"in A;out A", Rule::DuplicateName, "A", "A"},
    {"in A;in A", Rule::DuplicateName, "A", "A"},
    {"set BLOCKED_LOOPING yes;loop A;out A", Rule::DuplicateName, "A", "'A'"},
    {"set BLOCKED_LOOPING yes;loop A;out INCOMPLETE", Rule::DuplicateName, "INCOMPLETE", "INCOMPLETE"},
    {"gui NONSENSE | 1", Rule::BadPromptLine, "", "NONSENSE"},
    {"use T Net", Rule::Nesting, "T", "Net > Net"},
    {"set BLOCKED_LOOPING yes", Rule::CustomTransformerFault, "", "BLOCKED_LOOPING"},
    {"loop L;t T Adder;T -> L OUT", Rule::CustomTransformerFault, "L", "BLOCKED_LOOPING"},
    {"loop L", Rule::LoopPoint, "L", "BLOCKED_LOOPING"},
    {"set BLOCKED_LOOPING yes;loop L;loop M", Rule::LoopPoint, "M", "'L'"},
};

TEST_F(DocumentNetwork, TellsWhatIsWrongAndBuildsTheRest) {
  for (const Fault& row : kFaults) {
    read({{"Net", split(row.document) + split("in GOOD;out FINE;GOOD -> FINE")}});
    SubDocumentLibrary library(reader, &definitions);
    ExternalDocNetwork* network = library.network("Net");
    ASSERT_NE(network, nullptr);
    ASSERT_EQ(network->problems().size(), 1U) << row.document;
    const orx::Finding& problem = network->problems().front();
    EXPECT_EQ(problem.rule, row.rule) << row.document;
    EXPECT_FALSE(TransformResString(problem.message).isEmpty()) << row.document;
    EXPECT_EQ(problem.node, row.node) << row.document;
    EXPECT_TRUE(problem.text.contains(row.inText)) << qPrintable(problem.text);
    EXPECT_GT(problem.line, 0) << row.document;
    network->setInputAttributes("GOOD", {"g"});
    EXPECT_EQ(attributesOf(*network, "FINE"), names("g")) << row.document;
  }
}

// What stands two levels deep answers for the instance.
TEST_F(DocumentNetwork, InstancesAnswerForWhatStandsInside) {
  TransformerDefinition creator = passing("Creator");
  creator.inputTags.clear();
  definitions.add(creator);
  definitions.add(passing("Inspector"));
  TransformerDefinition caller = passing("Caller");
  caller.parameterNames = names("CODE");
  caller.parameterTypes = names("TEXT_EDIT_PYTHON");
  caller.parameterPrompts = caller.parameterDefaults = QStringList{QString()};
  definitions.add(caller);
  const struct {
    const char* inside;
    const char* outside;
    const char* answers;  // source, visualizer, python, markdown, python version, change log
  } rows[] = {
      {"t T Adder", "", "0,0,0,0,,"},
      {"t T Creator", "", "1,0,0,0,,"},
      {"t T Inspector", "", "0,1,0,0,,"},
      {"t T Caller;parm T CODE x", "", "0,0,1,0,,"},
      {"t T Caller", "", "0,0,0,0,,"},
      {"set USE_MARKDOWN yes", "", "0,0,0,1,,"},
      {"set PYTHON_COMPATIBILITY 37", "", "0,0,0,0,37,"},
      {"set PYTHON_COMPATIBILITY 37", "set PYTHON_COMPATIBILITY 39", "0,0,0,0,39,"},
      {"set HISTORY inner", "set HISTORY made", "0,0,0,0,,made"},
  };
  for (const auto& row : rows) {
    read({{"Inner", split(row.inside)},
          {"Middle", split("use I Inner")},
          {"Outer", split("use M Middle;in A") + split(row.outside)}});
    auto library = std::make_unique<SubDocumentLibrary>(reader, &definitions);
    const std::unique_ptr<TransformerCfg> cfg = library->makeTransformer("Outer", 1);
    auto& instance = static_cast<CompoundTransformerCfg&>(*cfg);
    const auto answers = [&] {
      return QStringList{QString::number(instance.getIsSource()),
                         QString::number(instance.getRequiresVisualizerLauncher()),
                         QString::number(instance.containsPython()),
                         QString::number(instance.getUseMarkdown()),
                         instance.pythonVersion(),
                         instance.getChangeLog().join(' ')}
          .join(',');
    };
    EXPECT_EQ(answers(), row.answers) << row.inside;
    library.reset();
    EXPECT_EQ(instance.getNetwork(), nullptr);
    EXPECT_EQ(answers(), "0,0,0,0,,") << "the network is gone";
    EXPECT_EQ(instance.getFileName() + instance.getTransformerFile() + instance.getGUID(), QString());
    EXPECT_FALSE(instance.getIsDefinitionValid() || instance.isDefinitionDeletable() ||
                 instance.getIsEmbeddable() || instance.getIsBlocking());
    TextBuffer buffer;
    EXPECT_FALSE(instance.doInstantiate(buffer, true));
  }
}

// --- files of their own
// -------------------------------------------------------------------------------------

struct Header {
  const char* line;
  const char* answers;  // name;version;category;GUID;insert mode;embeddable;blocked;parallelism;group-by;
                        // setting;count;deprecated;python
};

const Header kHeaders[] = {
    {"Foo,0,Cat,{1234}", "Foo;1;Cat;1234;1;1;0;NO_PARALLELISM;;;0;0;27"},
    {"Foo,7,Cat", "Foo;7;Cat;;1;1;0;NO_PARALLELISM;;;0;0;27"},
    {" Foo , 2 ,\tCat ,{{A}-B},Linked Always,yes,yes,g,s,5,-,yes,36",
     "Foo;2;Cat;A-B;4;0;1;NO_PARALLELISM;g;s;5;1;36"},
    {"Foo,2,Cat,A,Linked by Default,no,MODERATE,,,x,,no,", "Foo;2;Cat;A;2;1;0;MODERATE;;;0;0;"},
    {"Foo,2,Cat,A,Embedded Always,Yes,no", "Foo;2;Cat;A;3;1;0;NO_PARALLELISM;;;0;0;27"},
    {"Foo,2,Cat,A,Anything", "Foo;2;Cat;A;1;1;0;NO_PARALLELISM;;;0;0;27"},
    {"Foo,2", ";1;;;1;1;0;NO_PARALLELISM;;;0;0;27"},
};

TEST_F(DocumentNetwork, ReadsHeaders) {
  for (const Header& row : kHeaders) {
    const QString file =
        write("h.ort",
              QByteArray("# ORW custom transformers\n#! <?xml version=\"1.0\"?> # TRANSFORMER_BEGIN A,1,B\n"
                         "# TRANSFORMER_BEGIN ") +
                  row.line + "\r\n# one\n#two\n# TRANSFORMER_END\nrest\n");
    const ExternalTransformerNetwork network(file, -1, nullptr);
    const ParallelSettings parallel = network.getParallelSettings();
    const QStringList answers{network.getName(),
                              QString::number(network.getVersion()),
                              network.getCategory(),
                              network.getGUID(),
                              QString::number(network.getInsertMode()),
                              QString::number(network.getIsEmbeddable()),
                              QString::number(network.blockedLooping()),
                              parallel.parallelism,
                              parallel.groupBy,
                              parallel.processSetting,
                              QString::number(parallel.countSetting),
                              QString::number(network.isDeprecated()),
                              network.getPythonVersion()};
    EXPECT_EQ(answers.join(';'), row.answers) << row.line;
    EXPECT_EQ(network.isLoaded(), !network.getName().isEmpty());
    EXPECT_EQ(network.getStartLine(), network.isLoaded() ? 6 : 0);
    EXPECT_EQ(network.definitionLines(), network.isLoaded() ? names("one,#two") : QStringList());
  }
}

TEST_F(DocumentNetwork, PicksTheVersionAndLoadsItsBodyLate) {
  store("v.ort", names("Net,1,Cat"), {{"Net", split("in OLD")}});
  const QString file = store("v.ort", names("Net,2,Cat,{G},,,,,,,,,"),
                             {{"Net", split("set TITLE T;set PYTHON_COMPATIBILITY 38;gui GUI TEXT P P | d;in "
                                            "NEW;out O;use I Inner;NEW -> I;I -> O Y")},
                              {"Inner", split("in X;out Y;t T Adder;parm T ATTR x;X -> T;T -> Y OUT")}});
  const struct {
    int wanted;
    int version;
    const char* input;
  } rows[] = {{-1, 2, "NEW"}, {-2, 2, "NEW"}, {1, 1, "OLD"}, {2, 2, "NEW"}, {3, 1, ""}};
  for (const auto& row : rows) {
    ExternalTransformerNetwork network(file, row.wanted, &definitions);
    EXPECT_EQ(network.isLoaded(), row.wanted != 3);
    EXPECT_EQ(network.isBodyLoaded(), row.wanted == 3);
    EXPECT_EQ(network.getVersion(), row.version) << row.wanted;
    EXPECT_EQ(network.getInputs(), names(row.input)) << row.wanted;
    EXPECT_TRUE(network.isBodyLoaded());
    EXPECT_EQ(network.getPythonVersion(),
              QLatin1String(network.getVersion() == 2 && row.wanted != 3 ? "38" : "27"));
    EXPECT_TRUE(network.problems().empty());
  }
  ExternalTransformerNetwork network(file, 2, &definitions);
  CompoundTransformerCfg prototype(&network, CompoundTransformerCfg::Body::Deferred);
  EXPECT_FALSE(network.isBodyLoaded());
  EXPECT_EQ(prototype.getName(), "Net");
  EXPECT_EQ(prototype.getVersion(), 2);
  const std::unique_ptr<TransformerCfg> copy(prototype.getCopy());
  EXPECT_TRUE(network.isBodyLoaded());
  EXPECT_EQ(copy->getParameters(), names("XFORMER_NAME,P"));
  EXPECT_EQ(copy->getParameterValue("P"), "d");
  copy->setInputAttributes("NEW", {"a"});
  EXPECT_EQ(copy->getOutputAttributes("O"), names("a,x"));
  EXPECT_EQ(network.getProperties().value("TITLE"), "T");
  EXPECT_TRUE(copy->getIsDefinitionValid());
  QFile::remove(file);
  EXPECT_FALSE(copy->getIsDefinitionValid());
}

TEST_F(DocumentNetwork, QuestionsAboutTheInsideLoadTheBody) {
  const QString file = store("v.ort", names("Net,2,Cat,{G}"),
                             {{"Net", split("in A;out O;gui GUI TEXT P P | d;t T Adder;A -> O")}});
  using Network = ExternalTransformerNetwork;
  QHash<QString, QString> origins;
  QStringList none;
  const QString port = "A";
  const std::function<void(Network&)> inside[] = {
      [](Network& n) { n.getInputs(); },
      [](Network& n) { n.getOutputs(); },
      [](Network& n) { n.getLoops(); },
      [](Network& n) { n.getTransformers(); },
      [](Network& n) { n.getParameters(); },
      [](Network& n) { n.hasParameter("P"); },
      [](Network& n) { n.getParameterInfo("P"); },
      [&](Network& n) { n.getOutputAttributes("O", origins); },
      [](Network& n) { n.setInputAttributes(QHash<QString, QStringList>()); },
      [&](Network& n) { n.setInputAttributes(port, none); },
      [](Network& n) { n.hasTransformerNamed("T"); },
      [](Network& n) { n.getUpstreamInputs("O"); },
      [](Network& n) { n.getIncomingAttributePropogationMode(); },
      [](Network& n) { n.getProperties(); },
      [](Network& n) { n.getDescriptionLines(); },
      [](Network& n) { n.getUsesTransformer("X", nullptr); },
      [&](Network& n) { n.getUsedComponents(none, none, none, true); },
      [](Network& n) { n.containsPythonTransformer(); },
      [](Network& n) { n.getIsAsynchronous(); },
      [](Network& n) { n.getIsBlocking(); },
      [](Network& n) { n.forceLoad(); },
  };
  for (std::size_t i = 0; i < std::size(inside); ++i) {
    Network network(file, -1, &definitions);
    ASSERT_FALSE(network.isBodyLoaded());
    inside[i](network);
    EXPECT_TRUE(network.isBodyLoaded()) << "question " << i;
  }
  Network network(file, -1, &definitions);
  EXPECT_EQ(network.getName() + network.getCategory() + network.getGUID(), "NetCatG");
  EXPECT_TRUE(network.getIsDefinitionValid() && network.getIsEmbeddable() && network.getInsertMode() == 1);
  EXPECT_FALSE(network.isDeprecated() || network.blockedLooping() || network.getPythonVersion().isEmpty());
  network.turnOffMultiProcessing();
  network.setBlockedLooping(true);
  EXPECT_TRUE(network.extractToFile(path("copy.ort")));
  EXPECT_FALSE(network.isBodyLoaded()) << "the header answers these";
}

TEST_F(DocumentNetwork, ExtractsAndDeletesVersions) {
  store("v.ort", names("Net,1,Cat"), {{"Net", split("in OLD")}});
  const QByteArray onlyFirst = readAll(path("v.ort"));
  const QString file =
      store("v.ort", names("Net,2,Cat,{G},Linked by Default,no,HIGH,g"), {{"Net", split("in NEW")}});
  ExternalTransformerNetwork first(file, 1, &definitions);
  EXPECT_TRUE(first.extractToFile(path("copy.ort"))) << qPrintable(first.extractError());
  EXPECT_EQ(readAll(path("copy.ort")), onlyFirst);

  ExternalTransformerNetwork network(file, 2, &definitions);
  network.turnOffMultiProcessing();
  network.setBlockedLooping(true);
  EXPECT_TRUE(network.extractToFile(path("copy.ort")));
  const ExternalTransformerNetwork copy(path("copy.ort"), -1, &definitions);
  EXPECT_EQ(copy.getVersion(), 2);
  EXPECT_EQ(copy.getGUID(), "G");
  EXPECT_EQ(copy.getInsertMode(), 2);
  EXPECT_TRUE(copy.blockedLooping());
  EXPECT_FALSE(copy.getParallelSettings().isEnabled());
  EXPECT_EQ(copy.getInputs(), names("NEW"));
  EXPECT_EQ(copy.definitionLines(), network.definitionLines());
  EXPECT_FALSE(network.extractToFile(path("none/copy.ort")));
  EXPECT_FALSE(network.extractError().isEmpty());

  EXPECT_TRUE(network.isDefinitionDeletable());
  EXPECT_TRUE(network.deleteDefinition());
  EXPECT_EQ(readAll(file), onlyFirst);
  EXPECT_FALSE(network.deleteDefinition()) << "it is gone already";
  EXPECT_FALSE(network.extractToFile(path("copy.ort")));
  EXPECT_TRUE(ExternalTransformerNetwork(file, 1, &definitions).deleteDefinition());
  EXPECT_FALSE(QFile::exists(file));
}

}  // namespace
