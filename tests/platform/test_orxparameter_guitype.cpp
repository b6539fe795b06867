#include <platform/orxparameter/ConfigToken.h>
#include <platform/orxparameter/GUIType.h>
#include <platform/orxparameter/GUITypeTable.h>

#include <QElapsedTimer>
#include <gtest/gtest.h>

#include <algorithm>

namespace {

// Taken while this file's own objects are made, which may be before the library's other objects are.
const GUIType copiedEarly = GUIType::kNullGuiType;
const QString typeReadEarly = GUIType::kNullGuiType.getType();

// One way to write a configuration for each shape it may have.
const QStringList kConfigs = {
    "",    "A",       "A%B",      "\"No Parallelism\"%Minimal", "\"say \"\"a b\"\"\"",
    "a,b", "%%",      "No,<x>%Y", "\"50%, at most\",half",      "5\"%\"\"%\"a\"b",
    "\"",  "\u00a0é", "NO_EDIT"};
// Apart by "|".
const QStringList kPrompts =
    QString(
        "|Source Attribute:|  two blanks before and one behind |\"quoted\" 100%, <Unused> $(X)|<|<<u000a>\n<|"
        "line\nbreak\r\nand more\n|spelt <u000a>, <u000d>, <lessthansign>, <lessthansign>u000a> and <u000A>|"
        "\u00dcber \U0001F600 \u2028")
        .split('|');
const QStringList kNames =
    QString(
        "X|A_1||two "
        "words|\"|\"quoted\"|a\"b|NO_EDIT|OPTIONAL|line\nbreak|<u000a>|$(N)|\u00e9\u00a0\u00e9|\"\"")
        .split('|');

}  // namespace

// Every type of the table, with and without flags, with every shape of configuration, prompt and name.
TEST(GUIType, ParsingAndWritingAreInverse) {
  const unsigned flagSets[] = {0, kGUITypeOptional, kGUITypeOptional | kGUITypeOmittable,
                               kGUITypeOptional | kGUITypeOmittable | kGUITypeInstanceMacros};
  int checked = 0;
  for (const GUITypeEntry& entry : ORX_guiTypes()) {
    for (const unsigned flags : flagSets) {
      for (const QString& config : kConfigs) {
        if (!config.isEmpty() && !entry.takesConfig) {
          continue;
        }
        GUIType type = GUIType::fromTransformerTypeString(entry.word + QLatin1Char(' ') + config);
        if (entry.word == QLatin1String("NAMEDGROUP") && config == QLatin1String("NO_EDIT")) {
          ASSERT_EQ(type.getType(), QLatin1String("NAMEDGROUP NO_EDIT"));
          continue;
        }
        type.setFlag(flags, true);
        ASSERT_EQ(type.getType(), QString(entry.word));
        ASSERT_EQ(GUIType::fromTransformerTypeString(type.getTypeText()), type);
        for (const QString& name : kNames) {
          for (const QString& prompt : kPrompts) {
            type.setName(name);
            type.setDescription(prompt);
            const QString line = type.getAsString();
            const GUIType read = GUIType::fromGuiLine(line);
            ASSERT_EQ(read, type) << qPrintable(line);
            ASSERT_EQ(read.getAsString(), line);
            ASSERT_FALSE(line.contains(QLatin1Char('\n')) || line.contains(QLatin1Char('\r')));
            ++checked;
          }
        }
      }
    }
  }
  EXPECT_GT(checked, 50000);
}

TEST(GUIType, ReadsPromptLines) {
  // `written`: null: the line itself
  const std::tuple<const char*, const char*, const char*, const char*, const char*, unsigned, const char*>
      cases[] = {
          {"GUI TEXT XFORMER_NAME Name:", "TEXT", "XFORMER_NAME", "", "Name:", 0, nullptr},
          {"GUI CHOICE MODE \"No Parallelism\"%Minimal Process mode:", "CHOICE", "MODE",
           "\"No Parallelism\"%Minimal", "Process mode:", 0, nullptr},
          {"GUI OMITTABLE INSTANCE_MACROS OPTIONAL INT N A number", "INT", "N", "", "A number",
           kGUITypeOptional | kGUITypeOmittable | kGUITypeInstanceMacros,
           "GUI OPTIONAL OMITTABLE INSTANCE_MACROS INT N A number"},
          {"GUI  OPTIONAL\tATTR   A\tALLOW_NEW  Pick one\r\n", "ATTR", "A", "ALLOW_NEW", " Pick one",
           kGUITypeOptional, "GUI OPTIONAL ATTR A ALLOW_NEW  Pick one"},
          {"GUI NAMEDGROUP NO_EDIT DYNGROUP_1 A%B Group", "NAMEDGROUP NO_EDIT", "DYNGROUP_1", "A%B", "Group",
           0, nullptr},
          {"GUI NAMEDGROUP G NO_EDIT Group", "NAMEDGROUP", "G", "\"NO_EDIT\"", "Group", 0,
           "GUI NAMEDGROUP G \"NO_EDIT\" Group"},
          {"GUI NAMEDGROUP \"NO_EDIT\" \"\" Group", "NAMEDGROUP", "NO_EDIT", "", "Group", 0, nullptr},
          {"GUI LISTBOX L", "LISTBOX", "L", "", "", 0, "GUI LISTBOX L \"\""},
          {"GUI CHOICE C \"open%B Prompt", "CHOICE", "C", "\"\"\"open\"%B", "Prompt", 0,
           "GUI CHOICE C \"\"\"open\"%B Prompt"},
          {"GUI WIBBLE W a%b Prompt", "WIBBLE", "W", "", "a%b Prompt", 0, nullptr},
          {"GUI TEXT \"two words\"x Prompt", "TEXT", "\"two", "", "words\"x Prompt", 0,
           "GUI TEXT \"\"\"two\" words\"x Prompt"},
      };
  for (const auto& [line, wantedType, name, config, prompt, flags, written] : cases) {
    SCOPED_TRACE(line);
    const GUIType type = GUIType::fromGuiLine(line);
    EXPECT_EQ(type.getType(), wantedType);
    EXPECT_EQ(type.getName(), name);
    EXPECT_EQ(type.getConfigToken(), config);
    EXPECT_EQ(type.getDescription(), prompt);
    EXPECT_EQ(type.getFlags(), flags);
    EXPECT_EQ(type.getAsString(), written ? written : line);
  }
  for (const char* line : {"", "GUI", "GUI ", "GUI TEXT", "GUI TEXT  ", "GUI OPTIONAL TEXT", " GUI TEXT A p",
                           "gui TEXT A p", "GUITEXT A p", "GUI\tTEXT A p", "GUI OPTIONAL OMITTABLE"}) {
    EXPECT_EQ(GUIType::fromGuiLine(line), GUIType::kNullGuiType) << line;
  }
}

TEST(GUIType, ReadsTypeTexts) {
  const std::tuple<const char*, const char*, const char*, const char*> cases[] = {
      {"TEXT", "TEXT", "", "TEXT"},
      {" OMITTABLE  OPTIONAL FLOAT ", "FLOAT", "", "OPTIONAL OMITTABLE FLOAT"},
      {"CHOICE \"\"", "CHOICE", "", "CHOICE"},
      {"CHOICE No Parallelism%Minimal", "CHOICE", "\"No Parallelism\"%Minimal",
       "CHOICE \"No Parallelism\"%Minimal"},
      {"LOOKUP_CHOICE Not now,no%Yes,yes", "LOOKUP_CHOICE", "\"Not now\",no%Yes,yes",
       "LOOKUP_CHOICE \"Not now\",no%Yes,yes"},
      {"NAMEDGROUP NO_EDIT A%B", "NAMEDGROUP NO_EDIT", "A%B", "NAMEDGROUP NO_EDIT A%B"},
      {"TEXT stray", "TEXT", "stray", "TEXT stray"},
      {"WIBBLE a b", "WIBBLE", "\"a b\"", "WIBBLE \"a b\""},
      {"CHOICE \"a\nb\"", "CHOICE", "\"a<u000a>b\"", "CHOICE \"a<u000a>b\""},
  };
  for (const auto& [text, wantedType, config, written] : cases) {
    SCOPED_TRACE(text);
    const GUIType type = GUIType::fromTransformerTypeString(text, "N", "P");
    EXPECT_EQ(type.getType(), wantedType);
    EXPECT_EQ(type.getConfigToken(), config);
    EXPECT_EQ(type.getTypeText(), written);
    EXPECT_EQ(type.getName(), "N");
    EXPECT_EQ(type.getDescription(), "P");
  }
  EXPECT_FALSE(GUIType::fromTransformerTypeString("WIBBLE").isKnown());
  for (const char* text : {"", "  ", "OPTIONAL", "OPTIONAL OMITTABLE "}) {
    EXPECT_TRUE(GUIType::fromTransformerTypeString(text, "N").isNull()) << text;
  }
}

TEST(GUIType, NullTypeServesDuringStaticInitialisation) {
  EXPECT_TRUE(copiedEarly.isNull());
  EXPECT_TRUE(typeReadEarly.isEmpty());
  EXPECT_EQ(GUIType::kNullGuiType.getAsString(), QString());
  GUIType changed = copiedEarly;
  changed.setDescription("P");
  EXPECT_TRUE(GUIType::kNullGuiType.getDescription().isEmpty());
}

TEST(GUITypeTable, IsSortedDocumentedAndTellsEncodedTypes) {
  for (const GUITypeEntry& type : ORX_guiTypes()) {
    EXPECT_FALSE(type.purpose.isEmpty()) << type.word.data();
    EXPECT_TRUE(type.valueIsEncoded || !QString(type.word).endsWith("_ENCODED")) << type.word.data();
    EXPECT_EQ(ORX_findGuiType(type.word), &type) << "the table is sorted";
  }
  for (const char* word : {"", "A", "TEX", "TEXTX", "text", "ZZZ", "NAMEDGROUP  NO_EDIT"})
    EXPECT_EQ(ORX_findGuiType(word), nullptr) << word;
  for (const auto& [type, isEncoded] :
       {std::pair{"TEXT_EDIT_PYTHON_PARM", true}, {"WIBBLE_ENCODED", true}, {"LOOKUP_CHOICE a,b", false}})
    EXPECT_EQ(GUIType::fromTransformerTypeString(type).valueIsEncoded(), isEncoded) << type;
}

TEST(ConfigToken, PiecesComeBackUnquoted) {
  EXPECT_EQ(ORX_splitConfig("a,b%\"c%d\"e%%\"\"%5\"%", QLatin1Char('%')),
            (QStringList{"a,b", "c%de", "", "5\""}));
}

// Content made to hurt: must end soon, with a result that survives being written and read.
TEST(GUIType, HostileTextEndsInAResult) {
  QElapsedTimer timer;
  timer.start();
  for (const char* head :
       {"GUI CHOICE C ", "GUI ", "GUI TEXT ", "GUI MULTIPARAMETER M ", "GUI OPTIONAL TEXT N "}) {
    for (const QString& part :
         QString("\"|\"\"|\",|%|,| |\"a,\"\"b c,|<|<u000a>|OPTIONAL |\n|\\").split('|')) {
      const QString line = head + part.repeated(150000 / part.size());
      const GUIType type = GUIType::fromGuiLine(line);
      EXPECT_EQ(GUIType::fromGuiLine(type.getAsString()), type) << head << qPrintable(part);
      const GUIType text = GUIType::fromTransformerTypeString(line.mid(4));
      EXPECT_EQ(GUIType::fromTransformerTypeString(text.getTypeText()), text) << head << qPrintable(part);
    }
  }
  EXPECT_LT(timer.elapsed(), 20000);
}
