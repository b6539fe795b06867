#include <tests/support/QtPrinters.h>
#include <translation/GlobalParameters.h>

#include <gtest/gtest.h>

namespace {

TEST(GlobalParameters, HeaderLinesSetValues) {
  struct {
    const char* promise;
    QStringList header;
    const char* value;  // of A
    bool known;
  } const cases[] = {
      {"a default", {"DEFAULT_MACRO A one two"}, "one two", true},
      {"a setting", {"MACRO A x"}, "x", true},
      {"the first default stands", {"DEFAULT_MACRO A x", "DEFAULT_MACRO A y"}, "x", true},
      {"the last setting stands", {"MACRO A x", "MACRO A y"}, "y", true},
      {"a default does not undo a setting", {"MACRO A x", "DEFAULT_MACRO A y"}, "x", true},
      {"a setting without value", {"MACRO A"}, "", true},
      {"any blanks", {" MACRO\tA \t x y "}, "x y", true},
      {"known references are expanded when the line is read",
       {"MACRO N A", "MACRO $(N) x", "MACRO A $(A)y$(B)"},
       "xy$(B)",
       true},
      {"another keyword", {"MACROS A x", "# MACRO A x", "INCLUDE A x"}, "", false},
  };
  for (const auto& test : cases) {
    GlobalParameters parameters;
    for (const QString& line : test.header)
      parameters.readHeaderLine(line, 7);
    const GlobalParameters::Parameter* found = parameters.find("A");
    ASSERT_EQ(found != nullptr, test.known) << test.promise;
    if (found) {
      EXPECT_EQ(found->value, QString(test.value)) << test.promise;
      EXPECT_TRUE(found->setInHeader);
      EXPECT_EQ(found->line, 7);
    }
  }
}

TEST(GlobalParameters, DirectoryTellsThreeKindsApart) {
  GlobalParameters parameters;
  parameters.readHeaderLine("MACRO Hidden 1", 1);
  parameters.declare("Shown", "2", 2);
  const struct {
    const char* reference;
    bool published, isPrivate, builtIn;
  } cases[] = {{"$(Shown)", true, false, false},    {"$(Hidden)", false, true, false},
               {"$(ORX_HOME)", false, false, true}, {"Shown", false, false, false},
               {"$(None)", false, false, false},    {"$(", false, false, false}};
  for (const auto& test : cases) {
    EXPECT_EQ(parameters.isPublishedParameter(test.reference), test.published) << test.reference;
    EXPECT_EQ(parameters.isPrivateParameter(test.reference), test.isPrivate) << test.reference;
    EXPECT_EQ(parameters.isBuiltInParameter(test.reference), test.builtIn) << test.reference;
  }
}

TEST(GlobalParameters, ReferencesResolve) {
  GlobalParameters parameters;
  parameters.declare("A", "one", 1);
  parameters.declare("B", "<$(A)>", 1);
  parameters.declare("SELF", "x$(SELF)", 1);
  parameters.declare("X_one", "nested", 1);
  const std::pair<const char*, const char*> cases[] = {
      {"", ""},
      {"plain", "plain"},
      {"$(A)", "one"},
      {"a $(B) c $(A)", "a <one> c one"},
      {"$(UNKNOWN) $(A", "$(UNKNOWN) $(A"},
      {"$(SELF)", "x$(SELF)"},
      {"$(X_$(A))", "$(X_one)"},
      {")$(A)(", ")one("},
  };
  for (const auto& [text, expected] : cases)
    EXPECT_EQ(parameters.resolve(text), QString(expected)) << text;
  EXPECT_TRUE(parameters.override("A", "two"));
  EXPECT_EQ(parameters.resolve("$(B)"), QString("<two>"));
  EXPECT_FALSE(parameters.override("UNKNOWN", ""));
}

TEST(GlobalParameters, Circles) {
  const struct {
    QStringList values;  // of P0, P1, ...; the first one of the header
    int members;
  } cases[] = {
      {{"a", "$(P0)", "$(P1)$(P0)"}, 0},
      {{"$(P0)"}, 1},
      {{"$(P1)", "$(P0)"}, 2},
      {{"", "x$[P1]"}, 1},
      {{"", "$($(P2))", "P1"}, 1},
      {{"$($(P1))", "$(P2)", "P0"}, 1},
      {{"", "$(P$(P2))", "1", "$($(P4))", "P3"}, 2},
      {{"", "$($(P2))", "P3", ""}, 0},
  };
  for (const auto& c : cases) {
    GlobalParameters parameters;
    parameters.readHeaderLine("MACRO P0 " + c.values.first(), 1);
    for (int i = 1; i < c.values.size(); ++i)
      parameters.declare(QString("P%1").arg(i), c.values.at(i), 1);
    std::size_t members = 0;
    for (const auto& circle : parameters.circles())
      members += circle.size();
    EXPECT_EQ(int(members), c.members) << qPrintable(c.values.join(" "));
  }
}

TEST(GlobalParameters, ValuesThatMultiplyEachOtherEnd) {
  for (const char* leaf : {"", "0123456789"}) {
    GlobalParameters parameters;
    for (int i = 0; i < 40; ++i)
      parameters.declare(QString("P%1").arg(i), QString("$(P%1)$(P%1)$(P%1)").arg(i + 1), 1);
    parameters.declare("P40", leaf, 1);
    EXPECT_LT(parameters.resolve("$(P0)").size(), 1 << 22);
  }
}

}  // namespace
