#include "SpecialisedSetup.h"
#include <platform/qorxcore/WordEncoding.h>
#include <transform/specialised/XMLTemplaterTransformerCfg.h>
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

// `subTemplates` are name, text, name, text.
std::unique_ptr<TransformerCfg> templaterWith(const char* name, const QString& root,
                                              const QStringList& subTemplates) {
  auto cfg = makeShipped(name);
  EXPECT_TRUE(cfg->setParameterValue("ROOT_TEMPLATE", QORXWwjdEncode(root), false));
  QStringList cells;
  for (const QString& cell : subTemplates) {
    cells << (cell.isEmpty() ? QString("\"\"") : QORXWwjdEncode(cell));
  }
  EXPECT_TRUE(cfg->setParameterValue("SUB_TEMPLATES", cells.join(';'), false));
  cfg->setInputAttributes("ROOT", {"a"});
  return cfg;
}

QString notWellFormed(int line) {
  return TransformResString(370708, QString::number(line));
}

}  // namespace

TEST(Templaters, TheFlagTellsTheLanguages) {
  for (const char* name : {"XMLTemplater", "JSONTemplater"}) {
    const auto cfg = makeShipped(name);
    EXPECT_EQ(dynamic_cast<XMLTemplaterTransformerCfg&>(*cfg).isJson(), *name == 'J');
    EXPECT_EQ(refusalOf(*cfg, "ROOT_TEMPLATE"), "") << "the default";
  }
}

TEST(Templaters, RootsHaveToBeWellFormed) {
  struct Case {
    const char* text;
    QString xml;  // refusals
    QString json;
  };
  const QString unknown = TransformResString(370711, "NONE");
  const Case cases[] = {
      {"<a b=\"@Value(a)\">@Template(PART)<p:c/></a>", "", notWellFormed(1)},
      {"<?xml version=\"1.0\"?>\n<a>$(P)</a>\n", "", notWellFormed(1)},
      {"<a>\n<b>\n</a>", notWellFormed(3), notWellFormed(1)},
      {"<a/><b/>", notWellFormed(1), notWellFormed(1)},
      {"<!DOCTYPE a><a/>", notWellFormed(1), notWellFormed(1)},
      {"text", notWellFormed(1), notWellFormed(1)},
      {"<a>@Template(NONE)</a>", unknown, notWellFormed(1)},
      {"{\"n\": @Value(a), \"s\": \"x@Value(a)\",\n\"l\": [@Template(PART)]}", notWellFormed(1), ""},
      {"[1,\n2,\n]", notWellFormed(1), notWellFormed(3)},
      {"{} {}", notWellFormed(1), notWellFormed(1)},
      {"1, 2", notWellFormed(1), notWellFormed(1)},
      {"@Template(NONE)", notWellFormed(1), unknown},
      {"\"@Value(a\"", notWellFormed(1), ""},
  };
  for (const Case& c : cases) {
    EXPECT_EQ(refusalOf(*templaterWith("XMLTemplater", c.text, {"PART", "<x/>"}), "ROOT_TEMPLATE"), c.xml)
        << c.text;
    EXPECT_EQ(refusalOf(*templaterWith("JSONTemplater", c.text, {"PART", "0"}), "ROOT_TEMPLATE"), c.json)
        << c.text;
  }
  EXPECT_EQ(refusalOf(*templaterWith("XMLTemplater", "<a>@Value(b)</a>", {}), "ROOT_TEMPLATE"),
            TransformResString(370607, "'b'"));
  EXPECT_EQ(refusalOf(*templaterWith("XMLTemplater", "", {}), "ROOT_TEMPLATE"),
            TransformResString(370608, "Template"));
}

TEST(Templaters, SubTemplatesAreInputs) {
  struct Case {
    const char* name;
    QStringList subTemplates;
    QString refusal;
    QStringList inputs;
  };
  const Case cases[] = {
      {"XMLTemplater", {}, "", {"ROOT"}},
      {"XMLTemplater", {"P", "<x/>text<y/>", "Q_2", "@Template(P)"}, "", {"ROOT", "P", "Q_2"}},
      {"XMLTemplater", {"P", "</x><x>"}, "P: " + notWellFormed(1), {"ROOT", "P"}},
      {"XMLTemplater", {"P", "\n<x>"}, "P: " + notWellFormed(2), {"ROOT", "P"}},
      {"JSONTemplater", {"P", "{\"a\": @Value(a)}"}, "", {"ROOT", "P"}},
      {"JSONTemplater", {"P", "1],[2"}, "P: " + notWellFormed(1), {"ROOT", "P"}},
      {"XMLTemplater", {"a b", "<x/>"}, TransformResString(370709, "a b"), {"ROOT"}},
      {"XMLTemplater", {"P", "<x/>", "P", "<y/>"}, TransformResString(370710, "P"), {"ROOT", "P"}},
      {"XMLTemplater", {"ROOT", "<x/>"}, TransformResString(370710, "ROOT"), {"ROOT"}},
      {"XMLTemplater", {"P", ""}, TransformResString(370608, "Sub-templates"), {"ROOT", "P"}},
      {"XMLTemplater", {"P"}, TransformResString(370608, "Template"), {"ROOT", "P"}},
      {"XMLTemplater", {"P", "@Template(R)"}, TransformResString(370711, "R"), {"ROOT", "P"}},
      {"XMLTemplater", {"P", "@Template(P)"}, TransformResString(370712, "P"), {"ROOT", "P"}},
      {"JSONTemplater",
       {"A", "[@Template(B),@Template(D)]", "B", "[@Template(C)]", "C", "[@Template(B)]", "D", "1"},
       TransformResString(370712, "B"),
       {"ROOT", "A", "B", "C", "D"}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.subTemplates.join(' ').toStdString());
    const auto cfg = templaterWith(c.name, "<a/>", c.subTemplates);
    EXPECT_EQ(refusalOf(*cfg, "SUB_TEMPLATES"), c.refusal);
    QStringList tags;
    cfg->getInputTags(tags);
    EXPECT_EQ(tags, c.inputs);
    const std::unique_ptr<TransformerCfg> copy(cfg->getCopy());
    copy->getInputTags(tags);
    EXPECT_EQ(tags, c.inputs);
  }
}

TEST(Templaters, SubTemplatesAreWritten) {
  const auto cfg = templaterWith("JSONTemplater", "[@Template(P)]", {"P", "@Value(a)", "Q", "{\n}"});
  cfg->addInputFeatureType("ROOT", "Parcels");
  cfg->addInputFeatureType("P", "Parts");
  const QStringList statements = statementsOf(*cfg);
  ASSERT_EQ(statements.size(), 3);
  EXPECT_TRUE(
      statements[0].contains("INPUT ROOT FEATURE_TYPE Parcels INPUT P FEATURE_TYPE Parts ROOT_TEMPLATE "));
  EXPECT_EQ(
      statements[1],
      "FACTORY_OPTION JSONTemplater TEMPLATE P <commercialat>Value<leftparenthesis>a<rightparenthesis>");
  EXPECT_EQ(statements[2],
            "FACTORY_OPTION JSONTemplater TEMPLATE Q <leftcurlybracket><u000a><rightcurlybracket>");
  // A cycle that hostile text makes long ends as well.
  QStringList chain;
  for (int i = 0; i < 3000; ++i) {
    chain << QString("T%1").arg(i) << QString("@Template(T%1)").arg((i + 1) % 3000);
  }
  EXPECT_EQ(refusalOf(*templaterWith("XMLTemplater", "<a/>", chain), "SUB_TEMPLATES"),
            TransformResString(370712, "T0"));
}
