// Of charts and of reports.
#include "SpecialisedSetup.h"
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

QString inRow(int row, const QString& reason) {
  return TransformResString(370714, {QString::number(row), reason});
}

QString missing(const char* prompt) {
  return TransformResString(370608, prompt);
}

const char kReference[] = "@Value<leftparenthesis>b<rightparenthesis>";

}  // namespace

TEST(ChartGenerator, SeriesFitTheKindOfChart) {
  struct Case {
    const char* kind;
    const char* series;
    QString refusal;
    QStringList attributes;
    const char* written;
  };
  const Case cases[] = {
      {"BAR", "One;a;b;Two;a;c", "", {"a", "b", "c"}, "One;a;b;Two;a;c"},
      {"Bars", "\"\";a;b", "", {"a", "b"}, "b;a;b"},
      {"LINE", "One;\"\";b", inRow(1, missing("Position")), {"b"}, "One;\"\";b"},
      {"LINE", "One;a;b;Two;a;\"\"", missing("Series"), {"a", "b"}, nullptr},
      {"LINE", "One;a;b;Two;a", inRow(2, missing("Value")), {"a", "b"}, nullptr},
      {"BAR", "One;nope;b", TransformResString(370607, "'nope'"), {"nope", "b"}, nullptr},
      {"HISTOGRAM", "One;nope;b", "", {"b"}, "One;\"\";b"},
      {"HISTOGRAM", "One;\"\";b;\"\";\"\";c", "", {"b", "c"}, "One;\"\";b;c;\"\";c"},
      {"PIE", "One;a;b", "", {"a", "b"}, "One;a;b"},
      {"PIE", "One;a;b;Two;a;c", TransformResString(370716), {"a", "b", "c"}, nullptr},
      {"BAR", "One;a;b;One;a;c", inRow(2, TransformResString(370717)), {"a", "b", "c"}, nullptr},
      {"$(KIND)", "One;a;b;Two;a;c", "", {"a", "b", "c"}, "One;a;b;Two;a;c"},
      {"BAR", "", missing("Series"), {}, ""},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.kind) + " " + c.series);
    const auto cfg = makeShipped("ChartGenerator");
    cfg->setInputAttributes("INPUT", {"a", "b", "c"});
    EXPECT_TRUE(cfg->setParameterValue("CHART_TYPE", c.kind, false));
    EXPECT_TRUE(cfg->setParameterValue("SERIES", c.series, false));
    EXPECT_EQ(refusalOf(*cfg, "SERIES"), c.refusal);
    EXPECT_EQ(cfg->getAttributeNamesInValue("SERIES"), c.attributes);
    if (c.written) {
      EXPECT_EQ(writtenValue(*cfg, "SERIES"), c.written);
    }
  }
}

TEST(ChartGenerator, SizesAndEarlierForms) {
  struct Size {
    const char* value;
    bool isAccepted;
  };
  const auto cfg = makeShipped("ChartGenerator");
  for (const Size& c : {Size{"16", true},
                        {"15", false},
                        {"16384", true},
                        {"16385", false},
                        {"800.5", false},
                        {"-800", false},
                        {"wide", false},
                        {"$(WIDTH_OF_PAGE)", true}}) {
    for (const char* parameter : {"WIDTH", "HEIGHT"}) {
      EXPECT_TRUE(cfg->setParameterValue(parameter, c.value, false));
      EXPECT_EQ(refusalOf(*cfg, parameter),
                c.isAccepted ? QString() : TransformResString(370715, {c.value, "16", "16384"}));
    }
  }
  EXPECT_TRUE(cfg->setParameterValue("SERIES", "One;&a;&b", false));
  EXPECT_TRUE(cfg->setParameterValue("CHART_TYPE", "COLUMN", false));
  cfg->autoUpgradeTransformer();
  EXPECT_EQ(cfg->getParameterValue("SERIES"), "One;a;b");
  EXPECT_EQ(cfg->getParameterValue("CHART_TYPE"), "BAR");
  EXPECT_TRUE(cfg->isAutoUpgraded());
  const auto current = makeShipped("ChartGenerator");
  EXPECT_TRUE(current->setParameterValue("SERIES", "R&D;a;b", false));
  current->autoUpgradeTransformer();
  EXPECT_FALSE(current->isAutoUpgraded());
}

TEST(ReportGenerator, PartsHaveWhatTheyNeed) {
  struct Case {
    QString parts;
    QString refusal;
    QStringList attributes;
    QString written;  // empty: as stored
  };
  const QString reference = kReference;
  const QString evaluated = "@EvaluateExpression(FDIV,STRING_ENCODED,PARTS.CONTENT,@Value(b))";
  const Case cases[] = {
      {"HEADING;News;\"\";TABLE;\"\";\"a,b\";LINE;\"\";\"\"", "", {"a", "b"}, ""},
      {"TEXT;" + reference + ";nope", "", {"b"}, "TEXT;" + evaluated + ";\"\""},
      {"LINE;" + reference + ";nope", "", {}, "LINE;\"\";\"\""},
      {"TABLE;Caption;nope", TransformResString(370607, "'nope'"), {"nope"}, ""},
      {"HEADING;\"\";a", inRow(1, missing("Content")), {}, "HEADING;\"\";\"\""},
      {"LINE;\"\";\"\";TABLE;x", inRow(2, missing("Attributes")), {}, ""},
      {"PICTURE;http:<solidus><solidus>[x;\"\"", inRow(1, TransformResString(370719, "http://[x")), {}, ""},
      {"PICTURE;pictures<solidus>a.png;\"\"", "", {}, ""},
      {"LINK;https:<solidus><solidus>example.org<solidus>?q=1;\"\"", "", {}, ""},
      {"LINK;$(HOST)<solidus>%zz;\"\"", "", {}, ""},
      {"LINK;" + reference + ";\"\"", "", {"b"}, "LINK;" + evaluated + ";\"\""},
      {"CHAPTER;x;\"\"", inRow(1, TransformResString(370718, "CHAPTER")), {}, ""},
      {"$(KIND);x;a", "", {"a"}, ""},
      {"", missing("Parts of the Page"), {}, ""},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.parts.toStdString());
    const auto cfg = makeShipped("HTMLReportGenerator");
    cfg->setInputAttributes("INPUT", {"a", "b"});
    EXPECT_TRUE(cfg->setParameterValue("PARTS", c.parts, false));
    EXPECT_EQ(refusalOf(*cfg, "PARTS"), c.refusal);
    EXPECT_EQ(cfg->getAttributeNamesInValue("PARTS"), c.attributes);
    EXPECT_EQ(writtenValue(*cfg, "PARTS"), c.written.isEmpty() ? c.parts : c.written);
    cfg->autoUpgradeTransformer();
    EXPECT_FALSE(cfg->isAutoUpgraded());
  }
}

TEST(ReportGenerator, EarlierFormsAreUpgraded) {
  const auto cfg = makeShipped("HTMLReportGenerator");
  EXPECT_TRUE(cfg->setParameterValue(
      "PARTS", "HEADER;&b;\"\";SEPARATOR;\"\";\"\";IMAGE;x;\"\";PARAGRAPH;R&D;\"\"", false));
  cfg->autoUpgradeTransformer();
  EXPECT_EQ(cfg->getParameterValue("PARTS"),
            "HEADING;<commercialat>Value<leftparenthesis>b<rightparenthesis>;\"\";LINE;\"\";\"\";PICTURE;x;"
            "\"\";TEXT;R&D;\"\"");
  EXPECT_TRUE(cfg->isAutoUpgraded());
}
