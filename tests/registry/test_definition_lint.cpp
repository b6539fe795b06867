#include <platform/qorxcore/qorxcore.h>
#include <tests/registry/RegistryFolders.h>
#include <tests/support/Files.h>
#include <transform/registry/DefinitionLint.h>

#include <QElapsedTimer>
#include <QSet>
#include <gtest/gtest.h>

#include <random>
#include <set>

namespace {

// Nothing in it is worth a word. Each case below spoils one piece.
const QByteArray kSound = readAll(ORX_SOURCE_DIR "/tests/data/definitions/sound.ort");

struct Case {
  const char* rule;
  const char* sound;  // the piece of the definition
  const char* spoilt;
  const char* at = nullptr;  // the beginning of the line that the finding names
};

const Case kDefinitionCases[] = {
    {"not-utf8", "What it does.", "What \xff it does."},
    {"workspace-mark", "# A definition.", "# A definition for the ORW format."},
    {"workspace-mark", "# A definition.", "# <WORKSPACE"},
    {"open-block", "CATEGORY: Tests\n",
     "CATEGORY: Tests\nCATEGORY_DESCRIPTION_START Tests\nCATEGORY_DESCRIPTION_END\n"},
    {"unfinished-definition", "TEMPLATE_END\n", "TEMPLATE_END\nTRANSFORMER_NAME: Lost\n"},
    {"unknown-keyword", "CATEGORY: Tests", "CATEGORY: Tests\nCOLOUR: blue"},
    {"unknown-keyword", "DESCRIPTION_END\n", "DESCRIPTION_END\nDESCRIPTION_END\n"},
    {"unknown-keyword", "CATEGORY: Tests", "CATEGORY: Tests\nLOCALIZED_NAME: Ton"},
    {"repeated-keyword", "CATEGORY: Tests", "CATEGORY: Tests\nCATEGORY: Tests"},
    {"bad-value", "VERSION: 2", "VERSION: two"},
    {"bad-value", "CATEGORY: Tests", "CATEGORY: Tests\nVISIBLE: perhaps"},
    {"bad-value", "FEATURE_HOLDING: GROUPED", "FEATURE_HOLDING: GROUP"},
    {"bad-value", "TRANSFORMER_NAME: Sound\n", ""},
    {"bad-value", "TAG_DESCRIPTION BASE features", "TAG_DESCRIPTION BASE features\nTAG_DESCRIPTION BASE"},
    {"missing-text", "CATEGORY: Tests\n", ""},
    {"missing-text", "What it does.\n", "\n"},
    {"missing-text", "$(TEXT) $(WIDTH)\n", ""},
    {"missing-text", "CHANGE_LOG_START\nFirst.\nCHANGE_LOG_END\n", ""},
    {"missing-text", "TAG_DESCRIPTION EXTRA more\n", ""},
    {"missing-text", "PARAMETER_PROMPT: Mode", "PARAMETER_PROMPT:"},
    {"unknown-port", "PRESERVES_ATTRIBUTES: DONE:BASE", "PRESERVES_ATTRIBUTES: DONE:OTHER"},
    {"unknown-port", "LEFT =id", "RIGHT =id"},
    {"unknown-port", "ATTRIBUTES_ADDED: DONE:", "ATTRIBUTES_ADDED: BASE:"},
    {"unknown-port", "LIST_ACTION: <ALL> KEEP", "LIST_ACTION: SOME KEEP"},
    {"unknown-port", "COLLECT EXTRA", "COLLECT MORE"},
    {"unknown-port", "2:O:GOOD=DONE", "2:I:GOOD=DONE"},
    {"unknown-port", "TAG_DESCRIPTION BASE features",
     "TAG_DESCRIPTION BASE features\nTAG_DESCRIPTION BASIS x"},
    {"unknown-port", "$(INPUT_LINES)", "$(INPUT_LINES) $(INPUT_OTHER_LINES)"},
    {"unknown-port", "TEMPLATE_END", "X $(OUTPUT_NO_FTYPE) $(OUTPUT_NO_FUNCS)\nTEMPLATE_END"},
    {"bad-list-action", "<ALL> KEEP", "<ALL> HOLD"},
    {"bad-list-action", "COLLECT EXTRA $(RESULT)", "COLLECT EXTRA"},
    {"bad-mapping", "1:OLD=TEXT", "OLD->TEXT"},
    {"bad-mapping", "1:OLD=TEXT", "3:OLD=TEXT"},
    {"bad-mapping", "2:O:GOOD=DONE", "2:GOOD=DONE"},
    {"parameter-lines", "PARAMETER_PROMPT: Text\n", ""},
    {"parameter-lines", "PARAMETER_TYPE: TEXT_OR_ATTR_ENCODED\n", ""},
    {"parameter-lines", "PARAMETER_DEFAULT: ALL\n", "PARAMETER_DEFAULT: ALL\nPARAMETER_DEFAULT: SOME\n"},
    {"parameter-lines", "CATEGORY: Tests", "CATEGORY: Tests\nPARAMETER_LOOKUP: a,b"},
    {"duplicate-parameter", "PARAMETER_NAME: FRAME", "PARAMETER_NAME: MODE"},
    {"undeclared-parameter", "MULTIPROCESS: GROUP_BY", "MULTIPROCESS: GROUPING"},
    {"undeclared-parameter", "DONE:$(RESULT)", "DONE:$(RESULTS)"},
    {"undeclared-parameter", "COLLECT EXTRA $(RESULT)", "COLLECT EXTRA $(LIST)"},
    {"undeclared-parameter", "1:OLD=TEXT", "1:OLD=TEXTS"},
    {"undeclared-parameter", "GROUP MODE%RESULT", "GROUP MODE%RESULTS"},
    {"undeclared-parameter", "$(TEXT) $(WIDTH)\n", "$(TEXT) $(HEIGHT)\n"},
    {"undeclared-parameter", "STEPS;3", "STEPS;3;HEIGHT;1"},
    {"unknown-type", "LOOKUP_CHOICE \"All of it\",ALL%Some,SOME", "SELECTION"},
    {"unknown-type", "GUI<space>INT<space>STEPS", "GUI<space>COUNT<space>STEPS"},
    {"plain-text-type", "PARAMETER_TYPE: TEXT_OR_ATTR_ENCODED", "PARAMETER_TYPE: TEXT_OR_ATTR"},
    {"plain-text-type", "GUI<space>FLOAT<space>WIDTH", "GUI<space>STRING<space>WIDTH"},
    {"bad-default", "PARAMETER_DEFAULT: ALL", "PARAMETER_DEFAULT: NONE", "PARAMETER_DEFAULT: NONE"},
    {"unknown-type", "PARAMETER_TYPE: LISTBOX A%B%\"C D\"", "PARAMETER_TYPE: LISTS", "PARAMETER_TYPE: LISTS"},
    {"unknown-token", "MACRO own_macro", "MACRO own_macro $(X)", "MACRO own_macro"},
    {"tcl-syntax", "DEPENDENCY: if", "DEPENDENCY: \"if", "DEPENDENCY:"},
    {"python-syntax", "a<space>=<space>1", "class", "PARAMETER_DEFAULT: class"},
    {"missing-text", "First.\n", "", "TRANSFORMER_NAME"},
    {"bad-default", "A \"C D\"", "A C"},
    {"bad-default", "WIDTH;2.5", "WIDTH;wide"},
    {"bad-default", "STEPS;3", "STEPS;3.5"},
    {"bad-default", "LISTBOX A%B%\"C D\"\nPARAMETER_PROMPT: Tests\nPARAMETER_DEFAULT: A \"C D\"",
     "RANGE_SLIDER 0%1\nPARAMETER_PROMPT: Tests\nPARAMETER_DEFAULT: 2"},
    {"bad-default", "LISTBOX A%B%\"C D\"\nPARAMETER_PROMPT: Tests\nPARAMETER_DEFAULT: A \"C D\"",
     "GUI_LINE_TABLE <semicolon>,GUI<space>INT<space>N<space>N\nPARAMETER_PROMPT: Tests\n"
     "PARAMETER_DEFAULT: 1;x"},
    {"bad-default", "two<space>words", "two words"},
    {"bad-statement", "FACTORY_OPTION $(XFORMER_NAME_ENCODED) RESULT",
     "  FACTORY_OPTION $(XFORMER_NAME_ENCODED) RESULT"},
    {"bad-statement", "MACRO own_macro $(MODE)", "MACRO own_macro $(MODE) \\"},
    {"bad-statement", "OUTPUT DONE FEATURE", "FACTORY_DEF * OUTPUT DONE FEATURE"},
    {"unknown-token", "TEXT $(TEXT)", "TEXT $(TEXT) $(OTHER)"},
    {"output-route", " $(OUTPUT_DONE_FUNCS)", ""},
    {"output-route", "$(OUTPUT_DONE_FTYPE)", "$(TESTS) $(OUTPUT_DONE_FTYPE)"},
    {"output-route", "$(OUTPUT_DONE_FTYPE) $(OUTPUT_DONE_FUNCS)",
     "$(OUTPUT_DONE_FTYPE) $(OUTPUT_DONE_FUNCS) $(OUTPUT_LEFT_FTYPE) $(OUTPUT_LEFT_FUNCS)"},
    {"omittable-line", "TEXT $(TEXT)", "TEXT $(TEXT) R $(RESULT)"},
    {"omittable-line", "RESULT $(RESULT)", "RESULT $(RESULT) $(TEXT)"},
    {"omittable-line", "MULTIPARAMETER", "OPTIONAL OMITTABLE MULTIPARAMETER", "FACTORY_DEF * SoundFactory"},
    {"omittable-line", "GUI<space>INT<space>STEPS", "GUI<space>OMITTABLE<space>INT<space>STEPS"},
    {"unknown-token", "T $(TESTS)", "T $(TESTS) Z $(SIZE)", "FACTORY_DEF * SoundFactory"},
    {"unused-port", "$(INPUT_LINES)", "$(INPUT_BASE_LINES)"},
    {"unused-port", "OUTPUT_TAGS: DONE LEFT\n", "OUTPUT_TAGS: DONE LEFT REST\nTAG_DESCRIPTION REST x\n"},
    {"unplaced-parameter", " S $(STEPS)", ""},
    {"unplaced-parameter", "MACRO own_macro $(MODE)", "MACRO own_macro 1"},
    {"tcl-syntax", "[join {no root}]}", "[join {no root}}"},
    {"tcl-syntax", "{$a eq {}}", "{$a eq}"},
    {"tcl-syntax", "[string length $a]", "[string length \"$a]"},
    {"python-syntax", "a<space>=<space>1", "a<space>=<space>"},
};

QStringList rulesOf(DefinitionLint& lint) {
  QStringList rules;
  for (const orx::Finding& finding : lint.findings()) {
    rules.append(orx::ruleRow(finding.rule).name);
  }
  return rules;
}

std::string describe(DefinitionLint& lint) {
  std::string text;
  for (const orx::Finding& finding : lint.findings()) {
    text += std::to_string(finding.line) + ": " + finding.text.toStdString() + " [" +
            orx::ruleRow(finding.rule).name.data() + "]\n";
  }
  return text;
}

}  // namespace

TEST(DefinitionLint, FindsExactlyWhatIsWrong) {
  RegistryFolders folders;
  QStringList files;
  QList<int> lines;
  for (const Case& c : kDefinitionCases) {
    QByteArray text = kSound;
    ASSERT_EQ(text.count(c.sound), 1) << c.sound;
    text.replace(c.sound, c.spoilt);
    if (c.rule == QLatin1String("open-block"))
      text.append("DESCRIPTION_START\nno end");
    lines << (c.at ? text.left(text.indexOf(c.at)).count('\n') + 1 : 0);
    // One folder each, so that they are no duplicates of each other.
    files << folders.write(QStringLiteral("%1/spoilt.ort").arg(files.size()), text);
  }
  DefinitionLint lint;
  lint.checkPath(folders.path(""));
  for (int i = 0; i < files.size(); ++i) {
    const Case& c = kDefinitionCases[i];
    SCOPED_TRACE(std::string(c.rule) + ": " + c.spoilt);
    bool isFound = false;
    QSet<QString> rules;
    for (const orx::Finding& finding : lint.findings()) {
      if (finding.file != files.at(i))
        continue;
      const QString rule = orx::ruleRow(finding.rule).name;
      EXPECT_TRUE(finding.line > 0 || finding.rule == orx::Rule::NotUtf8) << finding.text.toStdString();
      isFound = isFound || (rule == c.rule && (!c.at || finding.line == lines.at(i)));
      rules.insert(rule);
    }
    EXPECT_TRUE(isFound) << lines.at(i) << '\n' << QStringList(rules.values()).join(' ').toStdString();
    // What is wrong may leave something else unused or unknown, no more.
    EXPECT_LE(rules.size(), 2) << QStringList(rules.values()).join(' ').toStdString();
  }
}

TEST(DefinitionLint, Companions) {
  const QByteArray sound =
      "TRANSFORMER_NAME: Sound\nVERSION: 2\nLOCALIZED_NAME: Ton\nPARAMETER_NAME: TEXT\nPARAMETER_PROMPT: "
      "Text\n"
      "TAG_DESCRIPTION BASE alles\nCATEGORY_NAME: Tests,Prüfungen\nCATEGORY_DESCRIPTION_START Tests\nx\n"
      "CATEGORY_DESCRIPTION_END\nDESCRIPTION_START\nText\nDESCRIPTION_END\n";
  const Case cases[] = {
      {"", "Text", "Text"},
      {"unknown-in-companion", "TRANSFORMER_NAME: Sound", "TRANSFORMER_NAME: Sounds"},
      {"unknown-in-companion", "VERSION: 2", "VERSION: 1"},
      {"unknown-in-companion", "PARAMETER_NAME: TEXT", "PARAMETER_NAME: TEXTE"},
      {"unknown-in-companion", "TAG_DESCRIPTION BASE", "TAG_DESCRIPTION BASIS"},
      {"repeated-keyword", "TAG_DESCRIPTION BASE", "TAG_DESCRIPTION BASE x\nTAG_DESCRIPTION BASE"},
      {"unknown-in-companion", "CATEGORY_NAME: Tests", "CATEGORY_NAME: Test"},
      {"unknown-in-companion", "CATEGORY_DESCRIPTION_START Tests", "CATEGORY_DESCRIPTION_START Test"},
      {"unknown-keyword", "CATEGORY_NAME: Tests,", "CATEGORY_NAME: Tests "},
      {"unknown-keyword", "LOCALIZED_NAME:", "LOCALISED_NAME:"},
      {"open-block", "\nDESCRIPTION_END\n", "\n"},
      {"not-utf8", "alles", "alles \xc3"},
  };
  RegistryFolders folders;
  folders.write("x/sound.ort", kSound);
  for (const Case& c : cases) {
    QByteArray text = sound;
    text.replace(c.sound, c.spoilt);
    DefinitionLint lint;
    lint.checkPath(folders.write("x/sound-localized.de", text));
    EXPECT_EQ(rulesOf(lint).join(' '), c.rule) << c.spoilt << "\n" << describe(lint);
  }
}

TEST(DefinitionLint, ShippedDefinitionsAreTranslated) {
  RegistryFolders folders;
  const QString file = folders.define("sound.ort", kSound);
  {
    DefinitionLint lint;
    lint.checkPath(file);
    EXPECT_EQ(rulesOf(lint), QStringList("missing-translation")) << describe(lint);
  }
  folders.define("sound-localized.de", "TRANSFORMER_NAME: Sound\nVERSION: 2\nLOCALIZED_NAME: Ton\n");
  {
    DefinitionLint lint;
    lint.checkPath(file);
    EXPECT_EQ(describe(lint), "") << "the companion beside it counts";
  }
  DefinitionLint lint;
  lint.checkPath(folders.path("home"));
  QStringList rules = rulesOf(lint);
  // Description, tooltip, change log, eight prompts and four ports.
  EXPECT_EQ(rules.size(), 15) << describe(lint);
  rules.removeDuplicates();
  EXPECT_EQ(rules, QStringList("missing-translation"));
}

TEST(DefinitionLint, FoldersAndOddFiles) {
  RegistryFolders folders;
  folders.write("x/a.ort", kSound);
  folders.write("x/deep/b.ort", kSound);
  folders.write("x/readme.txt", "TRANSFORMER_NAME: none of ours\n");
  folders.write("x/custom.ort", "# ORW custom transformers\n# TRANSFORMER_BEGIN x\n");
  DefinitionLint lint;
  lint.checkPath(folders.path("x"));
  lint.checkPath(folders.path("x/a.ort"));
  EXPECT_EQ(describe(lint), "") << "one name in two folders is no fault, nor is a file given twice";
  folders.write("x/c.ort", kSound);
  lint.checkPath(folders.path("x/c.ort"));
  EXPECT_EQ(rulesOf(lint), QStringList("duplicate-definition"));
  DefinitionLint missing;
  missing.checkPath(folders.path("nothing.ort"));
  folders.write("links/readme", "no definition");
  for (const char* name : {"links/a.ort", "links/a-localized.de", "links/a.txt"})
    ASSERT_TRUE(QFile::link(QStringLiteral("nowhere"), folders.path(name)));
  missing.checkPath(folders.path("links"));
  missing.checkPath("/dev/zero");  // never ends
  EXPECT_EQ(rulesOf(missing).join(' '), "unreadable-file unreadable-file unreadable-file unreadable-file");
}

TEST(DefinitionLint, ScriptsFromStrangers) {
  RegistryFolders folders;
  const QByteArray many(200000, '[');
  const QByteArray scripts[] = {many, QByteArray(200000, '{'), QByteArray("expr {").append(many),
                                QByteArray("a\"").append(QByteArray(600000, '(')),
                                QByteArray(5000, '[') + "\xff\x00"};
  for (const QByteArray& script : scripts) {
    DefinitionLint lint;
    lint.checkPath(
        folders.write("x/s.ort", QByteArray(kSound).replace("DEPENDENCY: ", "DEPENDENCY: " + script)));
    EXPECT_TRUE(rulesOf(lint).contains("tcl-syntax"));
  }
  const QString deep = QORXWwjdEncode(QString(100000, QLatin1Char('(')));
  const QString nothing = QORXWwjdEncode(QString::fromLatin1("x = '") + QChar(0xd800) + QLatin1Char('\''));
  for (const QString& script : {deep, nothing}) {
    DefinitionLint lint;
    lint.checkPath(
        folders.write("x/s.ort", QByteArray(kSound).replace("a<space>=<space>1", script.toUtf8())));
    const QStringList rules = rulesOf(lint);
    EXPECT_TRUE(rules.contains("python-syntax") || rules.contains("unchecked-python") || script == nothing);
  }
  // Without an interpreter nothing passes for checked.
  const QByteArray path = qgetenv("PATH");
  qputenv("PATH", "");
  DefinitionLint lint;
  lint.checkPath(folders.write("x/s.ort", kSound));
  const QStringList rules = rulesOf(lint);
  qputenv("PATH", path);
  EXPECT_EQ(rules, QStringList("unchecked-python"));
}

// Whatever was cut, doubled or changed, every finding has its place and the checks come to an end.
TEST(DefinitionLint, DamagedDefinitions) {
  RegistryFolders folders;
  std::mt19937 random(11);
  const auto below = [&](int bound) { return static_cast<int>(random() % static_cast<unsigned>(bound)); };
  for (int round = 0; round < 150; ++round) {
    QList<QByteArray> lines = QByteArray(kSound).split('\n');
    for (int i = 0; i < 6; ++i) {
      QByteArray& line = lines[below(lines.size())];
      const QByteArray changed[] = {
          line.left(below(20)), line + line.mid(line.size() / 2), lines[below(lines.size())] + '\n' + line,
          QByteArray(line).insert(below(line.size() + 1), "$(<%,\"{}[]:=@\\\xff"[below(14)])};
      line = changed[below(4)];
    }
    folders.write(QStringLiteral("x%1/damaged.ort").arg(round), lines.join('\n'));
  }
  DefinitionLint lint;
  lint.checkPath(folders.path(""));
  EXPECT_GT(lint.findings().size(), 150u);
  for (const orx::Finding& finding : lint.findings())
    EXPECT_TRUE(!finding.text.isEmpty() && finding.line >= 0 && finding.line <= 100) << finding.line;
}

// Nothing is looked up by walking over the rest, which would take minutes here.
TEST(DefinitionLint, LargeDefinitions) {
  RegistryFolders folders;
  QByteArray text = "TRANSFORMER_NAME: Large\n";
  for (int i = 0; i < 60000; ++i) {
    const QByteArray number = QByteArray::number(i);
    text += "INPUT_TAGS: I" + number + " <NO_INPUT>\nTAG_DESCRIPTION I" + number + " x\nPARAMETER_NAME: P" +
            number + "\nPARAMETER_TYPE: INT\nPARAMETER_PROMPT: x\nPARAMETER_DEFAULT: 1\n";
  }
  text += "TEMPLATE_START\n" + QByteArray("X $(P1) $(I)\n").repeated(60000) + "TEMPLATE_END\n";
  QElapsedTimer timer;
  timer.start();
  DefinitionLint lint;
  lint.checkPath(folders.define("large.ort", text));
  EXPECT_GT(lint.findings().size(), 60000u);
  EXPECT_EQ(folders.load().transformerNames().size(), 1);
  EXPECT_LT(timer.elapsed(), 30 * 1000);
}

TEST(DefinitionLint, EveryRuleIsTested) {
  QSet<QString> tested = {"unreadable-file", "duplicate-definition", "unknown-in-companion",
                          "missing-translation", "unchecked-python"};
  for (const Case& c : kDefinitionCases) {
    tested.insert(c.rule);
  }
  for (const orx::RuleRow& row : orx::ruleTable())
    EXPECT_TRUE(row.rule < orx::Rule::UnreadableFile || tested.contains(row.name)) << row.name.data();
}
