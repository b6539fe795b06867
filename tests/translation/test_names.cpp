// The search for the name that was meant, and for the names that a text refers to.
#include <tests/support/QtPrinters.h>
#include <translation/NearestSpelling.h>
#include <translation/graph/ReferencedNames.h>

#include <gtest/gtest.h>

namespace {

TEST(NearestSpelling, FindsTheNameThatWasMeant) {
  const QStringList names = {"id", "height", "Street", "weight", "straße", "x"};
  const struct {
    const char* name;
    const char* nearest;
  } cases[] = {
      {"hieght", "height"},
      {"heigh", "height"},
      {"STREET", "Street"},
      {"weihgt", "weight"},
      {"street_name_1", ""},
      {"di", "id"},
      {"y", ""},
      {"", ""},
      {"Stra\xc3\x9f", "straße"},
      {"height", "height"},
  };
  NearestSpelling spelling;
  for (const auto& test : cases)
    EXPECT_EQ(spelling.find(test.name, names), QString(test.nearest)) << test.name;
}

TEST(NearestSpelling, CostsNoMoreThanItMay) {
  QStringList names;
  for (int i = 0; i < 20000; ++i)
    names << QString("attribute_%1").arg(i, 50, 10, QLatin1Char('0'));
  NearestSpelling spelling;
  EXPECT_EQ(spelling.find("attribute", {"attributes"}), QString("attributes"));
  for (int i = 0; i < 300; ++i)
    spelling.find(names.at(i) + "_", names);
  EXPECT_EQ(spelling.find("attribute", {"attributes"}), QString()) << "the bound is reached";
}

TEST(ReferencedNames, AreFoundHoweverTheyAreWritten) {
  ReferencedNames names;
  for (const char* text :
       {"a $(PLAIN) b", "$[DEFERRED]", "<dollarsign><leftparenthesis>ENCODED<rightparenthesis>",
        "name = 'SCRIPTED'; value = ORX_MacroValues[name]", "$($(INNER)_OUTER)", "$(UNCLOSED", "NOWHERE"})
    names.add(text);
  for (const char* name : {"PLAIN", "DEFERRED", "ENCODED", "SCRIPTED", "INNER"})
    EXPECT_TRUE(names.contains(name)) << name;
  for (const char* name : {"UNCLOSED", "NOWHERE", "a"})
    EXPECT_FALSE(names.contains(name)) << name;
  EXPECT_EQ(ReferencedNames::inValue("$(B) $(A) $(B) $(ls -l) $[C] $() $(1)"),
            (QStringList{"B", "A", "C", "1"}));
}

}  // namespace
