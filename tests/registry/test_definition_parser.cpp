#include <tests/registry/DefinitionFields.h>
#include <tests/support/Files.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionIndex.h>
#include <transform/registry/loading/DefinitionKeywords.h>

#include <QBuffer>
#include <QDirIterator>
#include <gtest/gtest.h>

namespace {

template <class Parser = DefinitionFileParser, class... Name>
Parser parse(const QByteArray& text, const Name&... name) {
  QBuffer buffer;
  buffer.setData(text);
  buffer.open(QIODevice::ReadOnly);
  Parser parser;
  EXPECT_TRUE(parser.parse(buffer, name...)) << parser.errorString().toStdString();
  return parser;
}

// The fields of a definition with this header.
TransformerDefinition fieldsOf(const QByteArray& header) {
  const DefinitionFileParser parser = parse(header + "\nTEMPLATE_START\nTEMPLATE_END\n", "f.ort");
  EXPECT_EQ(parser.definitions().size(), 1u);
  return parser.definitions().empty() ? TransformerDefinition()
                                      : DefinitionFileParser::interpret(parser.definitions().front());
}

}  // namespace

TEST(DefinitionParser, Lists) {
  struct Case {
    const char* header;
    QStringList TransformerDefinition::*field;
    QStringList expected;
  };
  const Case cases[] = {
      {"INPUT_TAGS: A  B\nINPUT_TAGS: C", &TransformerDefinition::inputTags, (QStringList{"A", "B", "C"})},
      {"INPUT_TAGS: <NO_INPUT>", &TransformerDefinition::inputTags, {}},
      {"INPUT_TAGS: <NO_INPUT>\nINPUT_TAGS: A <NO_INPUT>", &TransformerDefinition::inputTags,
       (QStringList{"A"})},
      {"VERSION: 1", &TransformerDefinition::inputTags, {}},
      {"OUTPUT_TAGS: <BLANK> X", &TransformerDefinition::outputTags, (QStringList{"", "X"})},
      {"OUTPUT_TAGS: A<space>B <NO_INPUT>", &TransformerDefinition::outputTags,
       (QStringList{"A<space>B", "<NO_INPUT>"})},
      {"DYNAMIC_INPUT_TAGS: A<space>B <BLANK>", &TransformerDefinition::dynamicInputTags,
       (QStringList{"A B", ""})},
      {"TAG_MAPPING: I:A=B", &TransformerDefinition::tagMapping, (QStringList{":", "I:A=B"})},
      {"TAG_MAPPING I:A=B", &TransformerDefinition::tagMapping, (QStringList{"I:A=B"})},
      {"LIST_ACTION: A KEEP\nLIST_ACTION: B DROP", &TransformerDefinition::listActions,
       (QStringList{"A KEEP", "B DROP"})},
      {"DEPENDENCY: a b\nDEPENDENCY: c", &TransformerDefinition::dependencyScripts,
       (QStringList{"a b", "c"})},
      {"PARAMETER_NAME: A\nPARAMETER_NAME: B\nPARAMETER_NAME: C\nPARAMETER_DEFAULT: 1",
       &TransformerDefinition::parameterDefaults, (QStringList{"1", "", ""})},
      {"PARAMETER_NAME: A\nPARAMETER_PROMPT: 1\nPARAMETER_PROMPT: 2",
       &TransformerDefinition::parameterPrompts, (QStringList{"1", "2"})},
      {"ALIASES: X\nALIASES: X Y", &TransformerDefinition::aliases, (QStringList{"X", "X", "Y"})},
      {"transformer_name: T\ninput_tags: A", &TransformerDefinition::inputTags, {}},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(fieldsOf(c.header).*c.field, c.expected) << c.header;
  }
}

TEST(DefinitionParser, SingleValues) {
  const auto version = [](const TransformerDefinition& d) { return d.version; };
  const auto holding = [](const TransformerDefinition& d) { return d.featureHolding; };
  const auto visible = [](const TransformerDefinition& d) { return int(d.visible); };
  const auto nukers = [](const TransformerDefinition& d) { return int(d.nukersRequired); };
  const auto left = [](const TransformerDefinition& d) { return int(d.decorationLeft); };
  const struct {
    const char* header;
    int (*value)(const TransformerDefinition&);
    int expected;
  } cases[] = {
      {"VERSION: 12", version, 12},
      {"VERSION: 1\nVERSION: 2", version, 2},
      {"VERSION: 3.5", version, 0},
      {"VERSION:7", version, 7},
      {"VERSION: 99999999999", version, 0},
      {"OTHER: 1", version, 0},
      {"FEATURE_HOLDING: GROUPED ALL", holding, 6},
      {"FEATURE_HOLDING: NONE\nFEATURE_HOLDING: ALL ALL", holding, 5},
      {"FEATURE_HOLDING: none", holding, 0},
      {"VISIBLE: No", visible, false},
      {"VISIBLE: FALSE\nVISIBLE: maybe", visible, false},
      {"VISIBLE: 0", visible, true},
      {"NUKERS_REQUIRED: yes", nukers, true},
      {"NUKERS_REQUIRED: y", nukers, false},
      {"DECORATION_LEFT: no", left, false},
  };
  for (const auto& c : cases)
    EXPECT_EQ(c.value(fieldsOf(c.header)), c.expected) << c.header;
  EXPECT_EQ(fieldsOf("  CATEGORY:  A,B  ").category, "A,B");
  EXPECT_EQ(fieldsOf("MULTIPROCESS: A\nMULTIPROCESS:").multiProcess, "");
}

TEST(DefinitionParser, LookupsAndTagDescriptions) {
  const TransformerDefinition fields = fieldsOf(
      "PARAMETER_LOOKUP: lost\nPARAMETER_NAME: A\nPARAMETER_NAME: B\nPARAMETER_LOOKUP: x,1\n"
      "PARAMETER_TYPE: CHOICE x\nPARAMETER_LOOKUP: y,2\nTAG_DESCRIPTION IN: all   that  comes\n"
      "TAG_DESCRIPTION ALONE\nTAG_DESCRIPTION OUT: one\nTAG_DESCRIPTION OUT two");
  EXPECT_EQ(fields.parameterLookups.keys(), (QStringList{"B"}));
  EXPECT_EQ(fields.parameterLookups.value("B"), (QStringList{"x,1", "y,2"}));
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
  const DefinitionFileParser parser = parse(text, "f.ort");
  ASSERT_EQ(parser.definitions().size(), 2u);
  const TransformerDefinition first = DefinitionFileParser::interpret(parser.definitions()[0]);
  EXPECT_EQ(first.name, "First");
  EXPECT_EQ(first.filePath, "f.ort");
  EXPECT_EQ(first.descriptionLines, (QStringList{"one", "", "# two", "three"}));
  EXPECT_EQ(first.templateLines, (QStringList{"  indented", "", "# kept", " TEMPLATE_END"}));
  const TransformerDefinition second = DefinitionFileParser::interpret(parser.definitions()[1]);
  EXPECT_EQ(second.name, "") << "nothing is left of the definition before";
  EXPECT_EQ(second.version, 2);
  EXPECT_TRUE(second.descriptionLines.isEmpty());
  ASSERT_EQ(parser.categories().size(), 2u);
  EXPECT_EQ(parser.categories()[0].name, "My Group");
  EXPECT_EQ(parser.categories()[1].texts(), (QStringList{"second"}));
  EXPECT_EQ(parser.unfinished().header.size(), 1u);
  EXPECT_EQ(parser.openBlockLine(), 27);
}

// The index finds the same definitions, and their bytes alone give them whole: also where files are awkward.
TEST(DefinitionIndex, AgreesWithTheParser) {
  QDirIterator files(ORX_SOURCE_DIR "/fuzz/corpus/definitions", {"*.ort"});
  std::size_t found = 0;
  while (files.hasNext()) {
    const QByteArray text = readAll(files.next());
    SCOPED_TRACE(files.filePath().toStdString());
    const auto parser = parse(text, "f.ort");
    DefinitionIndex index;
    index.read(text);
    ASSERT_EQ(index.definitions().size(), parser.definitions().size());
    found += index.definitions().size();
    for (std::size_t i = 0; i < parser.definitions().size(); ++i) {
      const TransformerDefinition whole = DefinitionFileParser::interpret(parser.definitions()[i]);
      const TransformerDefinition& facts = index.definitions()[i].facts;
      EXPECT_TRUE(definitionFields(whole) == definitionFields(DefinitionFileParser::definitionAlone(
                                                 index.definitions()[i].bytes, QStringLiteral("f.ort"))));
      EXPECT_TRUE(std::tie(facts.name, facts.version, facts.category, facts.aliases, facts.visible,
                           facts.dependencyScripts) == std::tie(whole.name, whole.version, whole.category,
                                                                whole.aliases, whole.visible,
                                                                whole.dependencyScripts));
    }
    ASSERT_EQ(index.categories().size(), parser.categories().size());
    for (std::size_t i = 0; i < parser.categories().size(); ++i) {
      EXPECT_EQ(index.categories()[i].name, parser.categories()[i].name);
      EXPECT_EQ(index.categories()[i].texts(), parser.categories()[i].texts());
    }
  }
  EXPECT_GT(found, 20u);
}

TEST(DefinitionParser, NoKeywordHidesAnother) {
  for (const DefinitionKeyword& a : definitionKeywords()) {
    for (const DefinitionKeyword& b : definitionKeywords()) {
      EXPECT_TRUE(&a == &b || !QString(a.word).startsWith(b.word)) << a.word.data() << " " << b.word.data();
    }
  }
}

TEST(CompanionParser, EntriesEndWithTheNextName) {
  const CompanionFileParser parser = parse<CompanionFileParser>(
      "PARAMETER_PROMPT: too early\n"
      "CATEGORY_NAME: Attributes,Attribute, auch Listen\nCATEGORY_NAME: nothing\n"
      "TRANSFORMER_NAME: A\nVERSION: 2\nLOCALIZED_NAME: Ä\nPARAMETER_NAME: P\nPARAMETER_NAME: Q\n"
      "PARAMETER_PROMPT: Frage\nDESCRIPTION_START\nText\nDESCRIPTION_END\nTAG_DESCRIPTION IN: der Eingang\n"
      "TEMPLATE_START\nCATEGORY: x\n"
      "TRANSFORMER_NAME: B\nCHANGE_LOG_START\nNeu\n");
  QStringList entries;
  for (const CompanionEntry& entry : parser.entries()) {
    entries << QStringList{entry.name, entry.hasVersion ? QString::number(entry.version) : "-",
                           entry.localizedName}
                   .join('|');
    for (const CompanionEntry::Text& prompt : entry.prompts)
      entries << "prompt " + prompt.name + '|' + prompt.text;
    for (const CompanionEntry::Text& tag : entry.tagDescriptions)
      entries << "tag " + tag.name + '|' + tag.text;
    entries << "lines " + (entry.descriptionLines + QStringList("/") + entry.changeLog).join('|');
  }
  EXPECT_EQ(entries, (QStringList{"A|2|Ä", "prompt P|", "prompt Q|Frage", "tag IN|der Eingang",
                                  "lines Text|/", "B|-|", "lines /|Neu"}));
  ASSERT_EQ(parser.categoryNames().size(), 1u);
  EXPECT_EQ(parser.categoryNames()[0].localizedName, "Attribute, auch Listen");
  EXPECT_EQ(parser.strayLines().size(), 4u);
  EXPECT_EQ(parser.openBlockLine(), 17);
}
