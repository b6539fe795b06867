// What the classes change about ports, attributes and statements.
#include "SpecialisedSetup.h"

#include <gtest/gtest.h>

TEST(BulkAttributeRemover, RemovesWhatMatches) {
  struct Case {
    const char* settings;
    const char* left;
  };
  const QString all = "id Name tmp_a part{}.tmp_b orx_feature_type";
  for (const Case& c :
       {Case{"EXPRESSION=^tmp_", "id Name part{}.tmp_b orx_feature_type"},
        {"EXPRESSION=tmp_", "id Name orx_feature_type"},
        {"MODE=All other attributes | EXPRESSION=tmp_", "tmp_a part{}.tmp_b orx_feature_type"},
        {"MODE=KEEP | EXPRESSION=^tmp_", "tmp_a orx_feature_type"},
        {"EXPRESSION=^name$", nullptr},
        {"IGNORE_CASE=YES | EXPRESSION=^name$", "id tmp_a part{}.tmp_b orx_feature_type"},
        {"EXPRESSION=.", "orx_feature_type"},
        {"EXPRESSION=(a", nullptr},
        {"EXPRESSION=.$(P)", nullptr},
        {"MODE=KEEP | EXPRESSION=<Unused>", nullptr}}) {
    const auto cfg = makeShippedWith("BulkAttributeRemover", c.settings);
    cfg->setInputAttributes("INPUT", all.split(' '));
    EXPECT_EQ(cfg->getOutputAttributes("OUTPUT").join(' '), c.left ? c.left : all) << c.settings;
    EXPECT_TRUE(cfg->parmValueAffectsOutputAttrs("MODE"));
    EXPECT_FALSE(cfg->parmValueAffectsOutputAttrs("XFORMER_NAME"));
  }
}

TEST(Generators, UnusedCellsReferToNothing) {
  const auto names = [](const char* transformer, const char* settings) {
    QString parameter;
    const auto cfg = makeShippedWith(transformer, settings, &parameter);
    return cfg->getAttributeNamesInValue(parameter).join(' ');
  };
  EXPECT_EQ(names("ChartGenerator", "CHART_TYPE=BAR | SERIES=One;a;b;Two;a;c"), "a b c");
  EXPECT_EQ(names("ChartGenerator", "CHART_TYPE=HISTOGRAM | SERIES=One;a;b;Two;a;c"), "b c");
  EXPECT_EQ(names("HTMLReportGenerator", "PARTS=TABLE;@Value(b);`c,d;TEXT;@Value(e);f;LINE;@Value(g);h"),
            "b c d e");
}

TEST(ValueMapper, WhatTheEditorMayOffer) {
  const auto forward = makeShippedWith("AttributeValueMapper", "MAPPING=a;b");
  const auto backward = makeShippedWith("AttributeValueMapper", "DIRECTION=BACKWARD | MAPPING=a;b");
  EXPECT_EQ(forward->getSupportedValueTypes("MAPPING").join(' '), "CONSTANT ATTRIBUTE");
  EXPECT_EQ(backward->getSupportedValueTypes("MAPPING").join(' '), "CONSTANT");
  EXPECT_EQ(forward->getSupportedValueTypes("DIRECTION").join(' '), "CONSTANT");
  EXPECT_TRUE(backward->getSupportedValueTypes("DEFAULT_VALUE").contains("CONDITIONAL"));
  EXPECT_FALSE(makeShipped("Tester")->parameterSupportsAttributeReference("EXPRESSION"));
}

TEST(Statements, RowsBecomeOptions) {
  struct Case {
    const char* transformer;
    const char* settings;
    QStringList options;
  };
  const QString evaluated = "@EvaluateExpression(FDIV,STRING_ENCODED,MAPPING.RIGHT,@Value(a))";
  for (const Case& c : std::vector<Case>{
           {"AttributeValueMapper", "MAPPING=x y;b;c;", {"MAP x<space>y b", "MAP c \"\""}},
           {"AttributeValueMapper", "DIRECTION=BACKWARD | MAPPING=a;b;c;d", {"MAP b a", "MAP d c"}},
           {"AttributeValueMapper", "MAPPING=`a b;`(c", {"MAP \"a b\" \"(c\""}},
           {"AttributeValueMapper", "MAPPING=a;@Value(a)", {"MAP a " + evaluated}},
           {"XMLTemplater",
            "SUB_TEMPLATES=P;@Value(a);Q;-",
            {"TEMPLATE P <commercialat>Value<leftparenthesis>a<rightparenthesis>", "TEMPLATE Q -"}},
           {"JSONTemplater", "ROOT_TEMPLATE=[]", {}},
       }) {
    const auto cfg = makeShippedWith(c.transformer, c.settings);
    QStringList options;
    for (const QString& statement : statementsOf(*cfg)) {
      if (statement.startsWith("FACTORY_OPTION ")) {
        options << statement.section(' ', 2);
      }
    }
    EXPECT_EQ(options, c.options) << c.settings;
  }
  EXPECT_FALSE(isWritten(*makeShippedWith("AttributeValueMapper", "MAPPING=a;`$[x")));
  EXPECT_FALSE(isWritten(*makeShippedWith("AttributeValueMapper", "MAPPING=a;`x\ry")));
  EXPECT_TRUE(isWritten(*makeShippedWith("AttributeValueMapper", "MAPPING=a;`$[x]")));
}

TEST(Templaters, SubTemplatesAreInputs) {
  const auto cfg = makeShippedWith("JSONTemplater", "SUB_TEMPLATES=P;1;a b;2;$(X);3;Q_2;4;P;5");
  const std::unique_ptr<TransformerCfg> copy(cfg->getCopy());
  for (const TransformerCfg* one : {cfg.get(), copy.get()}) {
    QStringList tags;
    one->getInputTags(tags);
    EXPECT_EQ(tags.join(' '), "ROOT P Q_2");
  }
  applySettings(*copy, "SUB_TEMPLATES=P;1;New;2");
  QStringList tags;
  copy->getInputTags(tags);
  EXPECT_EQ(tags.join(' '), "ROOT P New");
  cfg->addInputFeatureType("ROOT", "Parcels");
  cfg->addInputFeatureType("P", "Parts");
  EXPECT_TRUE(
      statementsOf(*cfg).value(0).contains("INPUT ROOT FEATURE_TYPE Parcels INPUT P FEATURE_TYPE Parts "));
  // A circle that hostile text makes long ends as well.
  QByteArray circle = "SUB_TEMPLATES=";
  for (int i = 0; i < 3000; ++i) {
    circle += QStringLiteral("T%1;@Template(T%2);").arg(i).arg((i + 1) % 3000).toUtf8();
  }
  circle.chop(1);
  EXPECT_TRUE(
      refusalOf(*makeShippedWith("XMLTemplater", circle.constData()), "SUB_TEMPLATES").contains("'T0'"));
}
