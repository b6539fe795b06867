#include <platform/qorxcore/qorxcore.h>
#include <tests/core/ConfigHelpers.h>
#include <transform/core/FormulaChecks.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/core/TransformerSource.h>
#include <transform/text/MessageStrings.h>

#include <QDir>
#include <QFile>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

const char kPair[] =
    "MULTIPARAMETER ;,GUI<space>TEXT<space>K<space>Key,GUI<space>OPTIONAL<space>TEXT<space>T<space>Target,"
    "GUI<space>TEXT<space>ORX_CONTROLLER_QUERY_FILE<space>File";
const char kTable[] =
    "GUI_LINE_TABLE ;,GUI<space>TEXT<space>K<space>K,GUI<space>TEXT_OR_ATTR<space>T<space>T";
const char kLooseTable[] =
    "GUI_LINE_TABLE ;,GUI<space>TEXT<space>K<space>K,GUI<space>OPTIONAL<space>TEXT<space>T<space>T";

struct Connections : DefinitionDirectory {
  bool isConnectionKnown(const QString& encodedName) const override {
    return encodedName == QString("My<space>Base");
  }
  const MemberList* memberDefinitions(const GUIType&) const override { return nullptr; }
};

struct Accepting : TransformerCfgListener {
  bool acceptsValue(const TransformerCfg&, const QString&, const QString& value) const override {
    return value == QString("accepted");
  }
  QString resolveUserTypedMacro(const TransformerCfg&, const QString& value, UnpackLevel) const override {
    return QString(value).replace("$(F_USERTYPED)", "Grüße.txt");
  }
};

constexpr long kNoMessage = 0;

struct ValidationCase {
  const char* type;
  const char* prompt;
  const char* value;
  bool valid;
  long message = kNoMessage;
  const char* argument = "";
};

class ConfigValidation : public ::testing::Test {
 protected:
  void SetUp() override {
    QFile file(m_folder.filePath("Grüße.txt"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    ASSERT_TRUE(QDir::setCurrent(m_folder.path()));
  }
  void TearDown() override {
    QORXSetLanguage("en");
    QDir::setCurrent(QDir::rootPath());
  }

  void check(const ValidationCase& c, TransformerCfgListener* listener = nullptr) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition({{"P", c.type, c.prompt, c.value}}));
    cfg.setInputAttributes("IN", words("here"));
    cfg.setDefinitionDirectory(&m_connections);
    cfg.setListener(listener);
    for (const char* language : {"en", "de", "fr"}) {
      QORXSetLanguage(language);
      const QString untouched = "untouched";
      QString message = untouched;
      EXPECT_EQ(cfg.validateParameter("P", message), c.valid) << c.type << " = " << c.value;
      EXPECT_EQ(message, c.message == kNoMessage ? untouched : TransformResString(c.message, c.argument))
          << c.type << " = " << c.value;
    }
  }

  QTemporaryDir m_folder;
  Connections m_connections;
};

TEST_F(ConfigValidation, WithoutListener) {
  const ValidationCase cases[] = {
      {"TEXT", "Size", "", false, 370608, "Size"},
      {"OPTIONAL TEXT", "Size", "", true},
      {"TEXT", "", "", true},
      {"FILENAME_MUSTEXIST", "", "nothing", true},
      {"TEXT", "Size", "<Unused>", true},
      {"ATTR", "A", "gone", false, 370607, "'gone'"},
      {"ATTR", "A", "here", true},
      {"ATTR ALLOW_NEW", "A", "gone", true},
      {"TEXT_OR_ATTR", "A", "@Value(a)@Value(b)", false, 370607, "'a' 'b'"},
      {"TEXT_OR_ATTR_ENCODED", "A", "@Value<leftparenthesis>here<rightparenthesis>", true},
      {kPair, "Pair", "K;1;T;", true},
      {kPair, "Pair", "K;;T;1", false, 370608, "Key"},
      {kPair, "Pair", "K;1;ORX_CONTROLLER_QUERY_FILE;", true},
      {kPair, "Pair", "K;1;UNKNOWN;", true},
      {kPair, "Pair", "K", true},
      {kTable, "Table", "a;b;c;d", true},
      {kTable, "Table", "a;b;c;", false, 370608, "Table"},
      {kLooseTable, "Table", "a;b;c;", true},
      {kTable, "Table", "a;@Value(here);;x", false, 370608, "Table"},
      {"TEXT", "C", "orx://connect?x=1&connection=My%20Base", true},
      {"TEXT", "C", "orx://connect?connection=None%20Such", false, 370636, "None Such"},
      {"TEXT_ENCODED", "C", "orx:<solidus><solidus>a?connection=My<percentsign>20Base", true},
      {"TEXT_ENCODED", "C", "orx:<solidus><solidus>a?connection=X", false, 370636, "X"},
      {"TEXT", "C", "orx://", false, 370636, ""},
      {"NAMED_CONNECTION", "C", "None Such", true},
      {"TEXT_ENCODED", "E", "a<space>b$(MACRO)", true},
      {"TEXT_ENCODED", "E", "a b", false},
      {"TEXT_ENCODED", "E", "@Value<leftparenthesis>gone<rightparenthesis>", false, 370607, "'gone'"},
      {"TEXT_ENCODED", "E", "<commercialat>Value<leftparenthesis>gone<rightparenthesis>", true},
      {"TEXT_EDIT", "E", "a b", true},
      {"FILENAME_MUSTEXIST", "F", "Grüße.txt", true},
      {"FILENAME_MUSTEXIST_ENCODED", "F", ".<solidus>Grüße.txt", true},
      {"FILENAME_MUSTEXIST", "F", "no.txt", false, 370612, "no.txt"},
      {"FILENAME_MUSTEXIST", "F", ".", false, 370612, "."},
      {"FILEMUSTEXIST", "F", "/", false, 370612, "/"},
      {"FILEMUSTEXIST", "F", "ORX_CONDITIONAL:x", true},
      {"FILENAME_MUSTEXIST", "F", "ORX_CONDITIONAL:x", false, 370612, "ORX_CONDITIONAL:x"},
      {"FILENAME", "F", "no.txt", true},
      // What is asked first decides.
      {"FILENAME_MUSTEXIST", "F", "<Unused>", true},
      {"FILENAME_MUSTEXIST", "F", "@Value(here)", true},
      {"FILENAME_MUSTEXIST", "F", "@Value(gone).txt", false, 370607, "'gone'"},
      {"FILENAME_MUSTEXIST", "F", "orx://x?connection=No", false, 370636, "No"},
      {"FILENAME_MUSTEXIST", "F", "orx://x?connection=My%20Base", false, 370612,
       "orx://x?connection=My%20Base"},
      {"TEXT_ENCODED", "E", "orx://x?connection=My%20Base", false},
      {kPair, "Pair", "K;;T;@Value(gone)", false, 370608, "Key"},
      {kPair, "Pair", "K;1;T;@Value(gone)", false, 370607, "'gone'"},
      {kTable, "Table", "a;@Value(gone);c;", false, 370607, "'gone'"},
  };
  for (const ValidationCase& c : cases) {
    check(c);
  }
}

TEST_F(ConfigValidation, WithListener) {
  const ValidationCase cases[] = {
      {"FILENAME_MUSTEXIST", "F", "accepted", true},
      {"NAMED_CONNECTION", "C", "My Base", true},
      {"NAMED_DB_CONNECTION_ENCODED", "C", "My<space>Base", true},
      {"NAMED_DB_CONNECTION", "C", "None<Such", false, 370636, "None<Such"},
      {"NAMED_DB_CONNECTION", "C", "ORX_CONDITIONAL:x", true},
      {"FILENAME_MUSTEXIST", "F", "$(F_USERTYPED)", true},
      {"FILENAME_MUSTEXIST", "F", "$(F_USERTYPED)x", false, 370612, "Grüße.txtx"},
      {"ATTR", "A", "accepted", false, 370607, "'accepted'"},
      {kTable, "Table", "accepted", true},
  };
  Accepting listener;
  for (const ValidationCase& c : cases) {
    check(c, &listener);
  }
}

TEST_F(ConfigValidation, MissingNamesAreCutAtOneHundredCharacters) {
  QStringList names;
  for (int i = 0; i < 40; ++i) {
    names << QString("a_rather_long_name_") + QString::number(i);
  }
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"P", "ATTR_LIST", "A"}}));
  cfg.setParameterValue("P", names.join(QLatin1Char(',')), true);
  QString message;
  EXPECT_FALSE(cfg.validateParameter("P", message));
  const QString quoted = QString("'") + names.join("' '") + QString("'");
  EXPECT_EQ(message, TransformResString(370607, quoted.left(100)));
}

TEST_F(ConfigValidation, FormulasAreReadWhereverTheyStand) {
  const struct {
    const char* type;
    const char* value;
    bool isSound;
  } cases[] = {
      {"EXPRESSION_ENCODED", "1<space>+<space>2", true},
      {"EXPRESSION_ENCODED", "1+", false},
      {"EXPRESSION_ENCODED", "1+$(P)", true},
      {"OPTIONAL EXPRESSION_ENCODED", "<Unused>", true},
      {"INT_OR_ATTR", "@Value(a)+1", true},
      {"INT_OR_ATTR", "@Value(a)+", false},
      {"INT_OR_ATTR", "@Value(\"c(\")+1", true},
      {"INT_OR_ATTR", "7+", true},  // nothing is computed
      {"TEXT_OR_ATTR", "@Value(a)+", true},
      {"TEXT", "ORX_CONDITIONAL:@Value<leftparenthesis>a<rightparenthesis>=1;x+;", true},
      {"TEXT", "ORX_CONDITIONAL:1=;x", false},
      {"TEXT", "ORX_CONDITIONAL:1=1;x;2=;y", false},
      {"TEXT", "ORX_CONDITIONAL:1=1;x;2=", true},  // the last has no partner
      {"FLOAT", "ORX_CONDITIONAL:1=1;2+;3", false},
      {"RANGE_SLIDER 0%1%0", "ORX_CONDITIONAL:1=1;2;3+", false},
      // What never gives a number.
      {"INT_OR_ATTR", "@Value(@Value(a))", false},
      {"EXPRESSION_ENCODED", "@Value(@Value(a))<space>=<space>1", false},
      {"FLOAT", "\"abc\"+@Value(a)", false},
      {"FLOAT", "@Value(a)*((\"q\"))", false},
      {"FLOAT", "-\"q\"*@Value(a)", false},
      {"FLOAT", "@Value(a)+\" 2.5 \"", true},
      {"FLOAT", "@Value(a)=\"q\"", true},
      {"FLOAT", "f(\"q\")+@Value(a)", true},
      {"FLOAT", "@Value(a)/0", false},
      {"TEXT", "ORX_CONDITIONAL:\"q\"+1;x", false},
      {"TEXT", "ORX_CONDITIONAL:\"q\";x", true},
      {"FLOAT", "ORX_CONDITIONAL:1;(\"q\");3", false},
      {"INT", "ORX_CONDITIONAL:1;<Unused>;3", false},
      {"INT", "ORX_CONDITIONAL:1;;3", true},
      {kPair, "K;x+;T;y", true},
      {kTable, "x+;y+", true},
      {"GUI_LINE_TABLE <semicolon>,GUI<space>TEXT<space>K<space>K,GUI<space>FLOAT_OR_ATTR<space>T<space>T",
       "k;1;k;@Value(a)*", false},
  };
  for (const auto& c : cases) {
    const TransformParamCfg parameter(GUIType::fromTransformerTypeString(c.type, "P", "P"));
    QString message;
    EXPECT_EQ(checkFormulas(parameter, c.value, message), c.isSound) << c.type << " " << c.value;
  }
}

TEST_F(ConfigValidation, AllParameters) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition({{"A", "TEXT", "First"}, {"B", "TEXT", "Second"}}));
  QString message;
  EXPECT_FALSE(cfg.validateParameters(message));
  EXPECT_EQ(message, TransformResString(370608, "First"));
  QStringList names = words("B A NONE");
  QHash<QString, QString> messages;
  EXPECT_FALSE(cfg.validateParameters(names, messages));
  EXPECT_EQ(messages.size(), 3);
  EXPECT_EQ(messages.value("B"), TransformResString(370608, "Second"));
}

}  // namespace
