#include <tests/core/ConfigHelpers.h>
#include <transform/core/ValueFit.h>

#include <gtest/gtest.h>

namespace {

using Misfit = ValueFit::Misfit;

TEST(ValueFit, OnlyPlainValuesAreJudged) {
  const struct {
    const char* type;
    const char* fitting;  // separated by "|"
    const char* unfit;
    Misfit misfit;
  } cases[] = {
      {"CHOICE Red%\"Deep Blue\"",
       "|<Unused>|Red|Deep "
       "Blue|$(COLOUR)|@Value(c)|ORX_CONDITIONAL:x;Red;y;Deep<space>Blue|ORX_CONDITIONAL:x;"
       "$(C);@Value(c)|@Lower(x)",
       "red| |Deep|@Lower|ORX_CONDITIONAL:x;red|ORX_CONDITIONAL:x;Red;Deep", Misfit::Choice},
      {"CHOICE \"\"", "anything", "", Misfit::None},
      {"LOOKUP_CHOICE \"Deep Blue\",a<space>b%Red,R", "Deep Blue|a b|R", "a<space>b|Blue", Misfit::Choice},
      {"LOOKUP_LISTBOX \"Deep Blue\",B%Red,R",
       "B R|\"Deep Blue\"  R|Deep Blue|R|R @Value(a b)|$(C) R|ORX_CONDITIONAL:x;<quotationmark>Deep<space>"
       "Blue<quotationmark><space>R",
       "B X|Deep|X @Value(a)|ORX_CONDITIONAL:x;B<space>X|{Deep", Misfit::Choice},
      {"CHECKBOX", "YES|NO|ORX_CONDITIONAL:x;YES;NO", "yes|1|ORX_CONDITIONAL:x;maybe", Misfit::Choice},
      {"CHECKBOX on%off", "on|off|$(X)", "YES|@Value", Misfit::Choice},
      {"INT", "0|-12| 7 |+3|99999999999999999999|@Value(n)", "5$(|$()|1.0|1e3|--1|-|x|&n|0x10|@Abs(1)",
       Misfit::WholeNumber},
      {"INTEGER_OR_ATTR", "@Value(n)|@Abs(1)", "n|&n", Misfit::WholeNumber},
      {"FLOAT_OR_ATTR", "1|-.5|1e-3|2.|$(X)", "&n|1,5|inf|nan|1e999|1 2|n", Misfit::Number},
      {"RANGE_SLIDER -1%2.5%1", "-1|2.5|0|ORX_CONDITIONAL:9;2;9;1<plussign>1",
       "-1.01|3|ORX_CONDITIONAL:1;3;2", Misfit::Range},
      {"RANGE_SLIDER", "1e9", "many", Misfit::Number},
      {"TEXT", "x|1", "", Misfit::None},
  };
  for (const auto& c : cases) {
    const GUIType type = GUIType::fromTransformerTypeString(c.type, "P");
    for (const QString& value : QString(c.fitting).split('|'))
      EXPECT_TRUE(ValueFit::of(type, value).fits()) << c.type << ": " << value.toStdString();
    for (const QString& value : QString(c.unfit).split('|', Qt::SkipEmptyParts)) {
      const ValueFit fit = ValueFit::of(type, value);
      EXPECT_EQ(fit.misfit, c.misfit) << c.type << ": " << value.toStdString();
      EXPECT_TRUE(value.contains(fit.value));
    }
  }
}

TEST(ValueFit, PartsAreJudgedByTheirOwnTypes) {
  const struct {
    const char* type;
    const char* value;
    const char* misfits;
    const char* known = "";  // what references lead to
  } cases[] = {
      {"GUI_LINE_TABLE "
       "<semicolon>,GUI<space>CHOICE<space>A<space>x<percentsign>y<space>First,GUI<space>INT<space>B<space>"
       "Second",
       "x;1;z;two;y", "First=z Second=two"},
      {"MULTIPARAMETER <semicolon>,GUI<space>INT<space>A<space>First", "A;1.5;B;x", "First=1.5"},
      {"MULTIPARAMETER <semicolon>,GUI<space>INT<space>A<space>First", "ORX_CONDITIONAL:A;1.5", ""},
      {"MULTIPARAMETER "
       "<semicolon>,GUI<space>INT<space>A<space>First,GUI<space>OPTIONAL<space>INT<space>B<space>S",
       "A;$(R);B;$(R)", "First=$(R)"},
      {"MULTIPARAMETER <semicolon>,GUI<space>INT<space>A<space>First", "A;1.$(R)", "First=1.5", "5"},
      {"MULTIPARAMETER <semicolon>,GUI<space>TEXT<space>A<space>First", "A;$(R)x", ""},
      {"GUI_LINE_TABLE <semicolon>,GUI<space>CHOICE<space>A<space>x<percentsign>y<space>First", "x;$(R)",
       "First=z", "z"},
  };
  for (const auto& c : cases) {
    const TransformParamCfg parameter(GUIType::fromTransformerTypeString(c.type, "P"));
    QStringList found;
    for (const ValueFit& fit : ValueFit::misfitsOf(parameter, c.value, [&](QString& text) {
           text.replace("$(R)", c.known);
           return true;
         }))
      found.append(fit.prompt + '=' + fit.value);
    EXPECT_EQ(found.join(' '), c.misfits) << c.value;
  }
}

}  // namespace
