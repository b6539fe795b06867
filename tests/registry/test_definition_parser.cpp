#include <tests/registry/AwkwardDefinitions.h>
#include <tests/registry/DefinitionFields.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionIndex.h>
#include <transform/registry/loading/DefinitionKeywords.h>

#include <QBuffer>
#include <gtest/gtest.h>

#include <random>

namespace {

DefinitionFileParser parse(const QByteArray& text) {
  QBuffer buffer;
  buffer.setData(text);
  buffer.open(QIODevice::ReadOnly);
  DefinitionFileParser parser;
  EXPECT_TRUE(parser.parse(buffer, QStringLiteral("f.ort"))) << parser.errorString().toStdString();
  return parser;
}

// The fields of a definition with this header.
TransformerDefinition fieldsOf(const QByteArray& header) {
  const DefinitionFileParser parser = parse(header + "\nTEMPLATE_START\nTEMPLATE_END\n");
  EXPECT_EQ(parser.definitions().size(), 1u);
  return parser.definitions().empty() ? TransformerDefinition()
                                      : DefinitionFileParser::interpret(parser.definitions().front());
}

CompanionFileParser parseCompanion(const QByteArray& text) {
  QBuffer buffer;
  buffer.setData(text);
  buffer.open(QIODevice::ReadOnly);
  CompanionFileParser parser;
  EXPECT_TRUE(parser.parse(buffer));
  return parser;
}

QStringList list(std::initializer_list<const char*> items) {
  QStringList result;
  for (const char* item : items) {
    result.append(QString::fromUtf8(item));
  }
  return result;
}

}  // namespace

TEST(DefinitionParser, Lists) {
  struct Case {
    const char* header;
    QStringList TransformerDefinition::*field;
    QStringList expected;
  };
  const Case cases[] = {
      {"INPUT_TAGS: A  B\nINPUT_TAGS: C", &TransformerDefinition::inputTags, list({"A", "B", "C"})},
      {"INPUT_TAGS: <NO_INPUT>", &TransformerDefinition::inputTags, {}},
      {"INPUT_TAGS: <NO_INPUT>\nINPUT_TAGS: A <NO_INPUT>", &TransformerDefinition::inputTags, list({"A"})},
      {"VERSION: 1", &TransformerDefinition::inputTags, {}},
      {"OUTPUT_TAGS: <BLANK> X", &TransformerDefinition::outputTags, list({"", "X"})},
      {"OUTPUT_TAGS: A<space>B <NO_INPUT>", &TransformerDefinition::outputTags,
       list({"A<space>B", "<NO_INPUT>"})},
      {"DYNAMIC_INPUT_TAGS: A<space>B <BLANK>", &TransformerDefinition::dynamicInputTags, list({"A B", ""})},
      {"TAG_MAPPING: I:A=B", &TransformerDefinition::tagMapping, list({":", "I:A=B"})},
      {"TAG_MAPPING I:A=B", &TransformerDefinition::tagMapping, list({"I:A=B"})},
      {"LIST_ACTION: A KEEP\nLIST_ACTION: B DROP", &TransformerDefinition::listActions,
       list({"A KEEP", "B DROP"})},
      {"DEPENDENCY: a b\nDEPENDENCY: c", &TransformerDefinition::dependencyScripts, list({"a b", "c"})},
      {"PARAMETER_NAME: A\nPARAMETER_NAME: B\nPARAMETER_NAME: C\nPARAMETER_DEFAULT: 1",
       &TransformerDefinition::parameterDefaults, list({"1", "", ""})},
      {"PARAMETER_NAME: A\nPARAMETER_PROMPT: 1\nPARAMETER_PROMPT: 2",
       &TransformerDefinition::parameterPrompts, list({"1", "2"})},
      {"ALIASES: X\nALIASES: X Y", &TransformerDefinition::aliases, list({"X", "X", "Y"})},
      {"transformer_name: T\ninput_tags: A", &TransformerDefinition::inputTags, {}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(fieldsOf(c.header).*c.field, c.expected) << c.header;
  }
}

TEST(DefinitionParser, SingleValues) {
  struct Number {
    const char* header;
    int TransformerDefinition::*field;
    int expected;
  };
  const Number numbers[] = {
      {"VERSION: 12", &TransformerDefinition::version, 12},
      {"VERSION: 1\nVERSION: 2", &TransformerDefinition::version, 2},
      {"VERSION: 3.5", &TransformerDefinition::version, 0},
      {"VERSION:7", &TransformerDefinition::version, 7},
      {"VERSION: 99999999999", &TransformerDefinition::version, 0},
      {"OTHER: 1", &TransformerDefinition::version, 0},
      {"FEATURE_HOLDING: GROUPED ALL", &TransformerDefinition::featureHolding, 6},
      {"FEATURE_HOLDING: NONE\nFEATURE_HOLDING: ALL ALL", &TransformerDefinition::featureHolding, 5},
      {"FEATURE_HOLDING: none", &TransformerDefinition::featureHolding, 0},
  };
  for (const Number& c : numbers) {
    EXPECT_EQ(fieldsOf(c.header).*c.field, c.expected) << c.header;
  }
  struct Flag {
    const char* header;
    bool TransformerDefinition::*field;
    bool expected;
  };
  const Flag flags[] = {
      {"VISIBLE: No", &TransformerDefinition::visible, false},
      {"VISIBLE: FALSE\nVISIBLE: maybe", &TransformerDefinition::visible, false},
      {"VISIBLE: 0", &TransformerDefinition::visible, true},
      {"NUKERS_REQUIRED: yes", &TransformerDefinition::nukersRequired, true},
      {"NUKERS_REQUIRED: y", &TransformerDefinition::nukersRequired, false},
      {"DECORATION_LEFT: no", &TransformerDefinition::decorationLeft, false},
  };
  for (const Flag& c : flags) {
    EXPECT_EQ(fieldsOf(c.header).*c.field, c.expected) << c.header;
  }
  EXPECT_EQ(fieldsOf("  CATEGORY:  A,B  ").category, "A,B");
  EXPECT_EQ(fieldsOf("MULTIPROCESS: A\nMULTIPROCESS:").multiProcess, "");
}

TEST(DefinitionParser, LookupsAndTagDescriptions) {
  const TransformerDefinition fields = fieldsOf(
      "PARAMETER_LOOKUP: lost\nPARAMETER_NAME: A\nPARAMETER_NAME: B\nPARAMETER_LOOKUP: x,1\n"
      "PARAMETER_TYPE: CHOICE x\nPARAMETER_LOOKUP: y,2\nTAG_DESCRIPTION IN: all   that  comes\n"
      "TAG_DESCRIPTION ALONE\nTAG_DESCRIPTION OUT: one\nTAG_DESCRIPTION OUT two");
  EXPECT_EQ(fields.parameterLookups.keys(), list({"B"}));
  EXPECT_EQ(fields.parameterLookups.value("B"), list({"x,1", "y,2"}));
  EXPECT_EQ(fields.tagDescriptions.size(), 2);
  EXPECT_EQ(fields.tagDescriptions.value("IN"), "all that comes");
  EXPECT_EQ(fields.tagDescriptions.value("OUT"), "two");
}

TEST(DefinitionParser, BlocksAndTheirEnds) {
  const QByteArray text =
      "\xEF\xBB\xBF# comment\n"
      "TRANSFORMER_NAME: First\r\n"
      "DESCRIPTION_START\n one \n\n# two\nDESCRIPTION_END\n"
      "CATEGORY_DESCRIPTION_START  My Group \nfirst\nCATEGORY_DESCRIPTION_END\n"
      "DESCRIPTION_START\nthree\n  DESCRIPTION_END  \n"
      "TEMPLATE_START\n  indented  \n\n# kept\n TEMPLATE_END\nTEMPLATE_END \t\n"
      "VERSION: 2\n"
      "TEMPLATE_START\nTEMPLATE_END\n"
      "CATEGORY_DESCRIPTION_START My Group\nsecond\nCATEGORY_DESCRIPTION_END\n"
      "TRANSFORMER_NAME: Third\n"
      "TEMPLATE_START\nnever ends";
  const DefinitionFileParser parser = parse(text);
  ASSERT_EQ(parser.definitions().size(), 2u);
  const TransformerDefinition first = DefinitionFileParser::interpret(parser.definitions()[0]);
  EXPECT_EQ(first.name, "First");
  EXPECT_EQ(first.filePath, "f.ort");
  EXPECT_EQ(first.descriptionLines, list({"one", "", "# two", "three"}));
  EXPECT_EQ(first.templateLines, list({"  indented", "", "# kept", " TEMPLATE_END"}));
  const TransformerDefinition second = DefinitionFileParser::interpret(parser.definitions()[1]);
  EXPECT_EQ(second.name, "") << "nothing is left of the definition before";
  EXPECT_EQ(second.version, 2);
  EXPECT_TRUE(second.descriptionLines.isEmpty());
  ASSERT_EQ(parser.categories().size(), 2u);
  EXPECT_EQ(parser.categories()[0].name, "My Group");
  EXPECT_EQ(parser.categories()[1].texts(), list({"second"}));
  EXPECT_EQ(parser.unfinished().header.size(), 1u);
  EXPECT_EQ(parser.openBlockLine(), 27);
}

// The index finds the same definitions, and their bytes alone give them whole.
TEST(DefinitionIndex, AgreesWithTheParser) {
  for (const QByteArray& text : awkwardDefinitions()) {
    SCOPED_TRACE(text.toStdString());
    const DefinitionFileParser parser = parse(text);
    DefinitionIndex index;
    index.read(text);
    ASSERT_EQ(index.definitions().size(), parser.definitions().size());
    for (std::size_t i = 0; i < parser.definitions().size(); ++i) {
      const TransformerDefinition whole = DefinitionFileParser::interpret(parser.definitions()[i]);
      const TransformerDefinition& facts = index.definitions()[i].facts;
      const TransformerDefinition alone =
          DefinitionFileParser::definitionAlone(index.definitions()[i].bytes, QStringLiteral("f.ort"));
      EXPECT_EQ(facts.name, whole.name);
      EXPECT_EQ(facts.version, whole.version);
      EXPECT_EQ(facts.category, whole.category);
      EXPECT_EQ(facts.aliases, whole.aliases);
      EXPECT_EQ(facts.visible, whole.visible);
      EXPECT_EQ(facts.dependencyScripts, whole.dependencyScripts);
      EXPECT_TRUE(definitionFields(alone) == definitionFields(whole));
    }
    ASSERT_EQ(index.categories().size(), parser.categories().size());
    for (std::size_t i = 0; i < parser.categories().size(); ++i) {
      EXPECT_EQ(index.categories()[i].name, parser.categories()[i].name);
      EXPECT_EQ(index.categories()[i].texts(), parser.categories()[i].texts());
    }
  }
}

TEST(DefinitionParser, NoKeywordHidesAnother) {
  for (const DefinitionKeyword& a : definitionKeywords()) {
    for (const DefinitionKeyword& b : definitionKeywords()) {
      EXPECT_TRUE(&a == &b || !QString(a.word).startsWith(b.word)) << a.word.data() << " " << b.word.data();
    }
  }
}

// Any bytes end in a result, and what stood before them is not lost.
TEST(DefinitionParser, HostileContent) {
  std::mt19937 random(7);
  const char* const words[] = {"TEMPLATE_START\n",    "TEMPLATE_END\n",
                               "DESCRIPTION_START\n", "CHANGE_LOG_END\n",
                               "PARAMETER_NAME:",     "PARAMETER_LOOKUP:",
                               "INPUT_TAGS: <BLANK>", "\n",
                               "\xff\xfe\x00",        "CATEGORY_DESCRIPTION_START",
                               "TAG_DESCRIPTION :",   "VERSION:"};
  for (int round = 0; round < 300; ++round) {
    QByteArray text = "TRANSFORMER_NAME: Sound\nTEMPLATE_START\nx\nTEMPLATE_END\n";
    for (int i = 0; i < 40; ++i) {
      if (random() % 4 == 0) {
        text.append(static_cast<char>(random() & 0xff));
      } else {
        text.append(words[random() % std::size(words)]);
      }
    }
    const DefinitionFileParser parser = parse(text);
    ASSERT_FALSE(parser.definitions().empty());
    EXPECT_EQ(DefinitionFileParser::interpret(parser.definitions()[0]).name, "Sound");
    for (const DefinitionText& definition : parser.definitions()) {
      const TransformerDefinition fields = DefinitionFileParser::interpret(definition);
      EXPECT_GE(fields.parameterDefaults.size(), fields.parameterNames.size());
      EXPECT_GE(fields.parameterPrompts.size(), fields.parameterNames.size());
    }
    parseCompanion(text);
  }
}

namespace {

// Never ends, like a device file.
class EndlessDevice : public QIODevice {
 public:
  EndlessDevice() { open(QIODevice::ReadOnly); }
  bool isSequential() const override { return true; }

 protected:
  qint64 readData(char* data, qint64 size) override {
    std::fill(data, data + size, 'x');
    return size;
  }
  qint64 writeData(const char*, qint64) override { return -1; }
};

}  // namespace

TEST(DefinitionParser, RefusesWhatNeverEnds) {
  EndlessDevice device;
  DefinitionFileParser parser;
  EXPECT_FALSE(parser.parse(device, QString()));
  EXPECT_FALSE(parser.errorString().isEmpty());
  EXPECT_TRUE(parser.definitions().empty());
}

TEST(CompanionParser, EntriesEndWithTheNextName) {
  const CompanionFileParser parser = parseCompanion(
      "PARAMETER_PROMPT: too early\n"
      "CATEGORY_NAME: Attributes,Attribute, auch Listen\nCATEGORY_NAME: nothing\n"
      "TRANSFORMER_NAME: A\nVERSION: 2\nLOCALIZED_NAME: Ä\nPARAMETER_NAME: P\nPARAMETER_NAME: Q\n"
      "PARAMETER_PROMPT: Frage\nDESCRIPTION_START\nText\nDESCRIPTION_END\nTAG_DESCRIPTION IN: der Eingang\n"
      "TEMPLATE_START\nCATEGORY: x\n"
      "TRANSFORMER_NAME: B\nCHANGE_LOG_START\nNeu\n");
  ASSERT_EQ(parser.entries().size(), 2u);
  const CompanionEntry& a = parser.entries()[0];
  EXPECT_EQ(a.name, "A");
  EXPECT_TRUE(a.hasVersion);
  EXPECT_EQ(a.version, 2);
  EXPECT_EQ(a.localizedName, QString::fromUtf8("Ä"));
  ASSERT_EQ(a.prompts.size(), 2u);
  EXPECT_EQ(a.prompts[0].text, "");
  EXPECT_EQ(a.prompts[1].text, "Frage");
  EXPECT_EQ(a.descriptionLines, list({"Text"}));
  ASSERT_EQ(a.tagDescriptions.size(), 1u);
  EXPECT_EQ(a.tagDescriptions[0].text, "der Eingang");
  const CompanionEntry& b = parser.entries()[1];
  EXPECT_FALSE(b.hasVersion);
  EXPECT_TRUE(b.descriptionLines.isEmpty());
  EXPECT_EQ(b.changeLog, list({"Neu"}));
  ASSERT_EQ(parser.categoryNames().size(), 1u);
  EXPECT_EQ(parser.categoryNames()[0].localizedName, "Attribute, auch Listen");
  EXPECT_EQ(parser.strayLines().size(), 4u);
  EXPECT_EQ(parser.openBlockLine(), 17);
}
