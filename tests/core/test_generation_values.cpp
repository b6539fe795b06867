#include "GenerationSetup.h"
#include <platform/orxparameter/MemberList.h>
#include <platform/qorxcore/Lists.h>
#include <transform/text/MacroText.h>

#include <QRegularExpression>
#include <gtest/gtest.h>

namespace {

QString valueOf(const TransformerCfg& cfg, const QString& name) {
  TextBuffer buffer;
  const QString value = cfg.getParameterValueForMappingFile(name, cfg.getParameterByMacroName(name), buffer);
  EXPECT_EQ(buffer.text(), "");
  return value;
}

TEST(Values, WhatIsWritten) {
  struct Case {
    const char* type;
    QString value;
    QString written;
  };
  const Case cases[] = {
      {"TEXT", "a \"b\" c", "a \"b\" c"},
      {"TEXT", "orx_basicstring:x:y", "y"},
      {"TEXT", "@Value(a) and", "@EvaluateExpression(FDIV,STRING,P,@Value(a)<space>and)"},
      {"TEXT", "@Value(a)", "@EvaluateExpression(FDIV,STRING,P,@Value(a))"},
      {"TEXT_ENCODED", "a\\tb\\q", "a\tb\\q"},
      {"TEXT_ENCODED", "@Value<leftparenthesis>a<space>b<rightparenthesis>",
       "@EvaluateExpression(FDIV,STRING_ENCODED,P,@Value(a<space>b))"},
      {"TEXT_OR_ATTR", "plain, (text)", "plain, (text)"},
      {"TEXT_OR_ATTR", "a, @Value(b (c)) $(M)@x",
       "@EvaluateExpression(FDIV,STRING,P,a<comma><space>@Value(b<space>"
       "<leftparenthesis>c<rightparenthesis>)<space>$(M)<commercialat>x)"},
      {"TEXT_OR_ATTR", "@Value(\"q\")@Value(open",
       "@EvaluateExpression(FDIV,STRING,P,@Value(q)<commercialat>Value"
       "<leftparenthesis>open)"},
      {"TEXT_OR_ATTR", "@Value(@Value(x))",
       "@EvaluateExpression(FDIV,STRING,P,<commercialat>Value<leftparenthesis>"
       "@Value(x)<rightparenthesis>)"},
      {"TEXT_OR_ATTR_ENCODED", "a<space>@Value<leftparenthesis>b<rightparenthesis> (c",
       "@EvaluateExpression(FDIV,STRING_ENCODED,P,a<space>@Value(b)<space><leftparenthesis>c)"},
      {"INT_OR_ATTR", "@Value(a)/2", "@EvaluateExpression(FDIV,INT,P,@Value(a)<solidus>2)"},
      {"FLOAT_OR_ATTR", "2.5", "2.5"},
      {"RANGE_SLIDER_OR_ATTR 0%9%1", "@Value(a)", "@EvaluateExpression(FDIV,FLOAT,P,@Value(a))"},
      {"EXPRESSION_ENCODED", "@Value<leftparenthesis>a<rightparenthesis>",
       "@Value<leftparenthesis>a<rightparenthesis>"},
      {"FLOAT", "ORX_CONDITIONAL:@Value(a)<greaterthansign>5;1;2",
       "@EvaluateExpression(FDIV,FLOAT,P,@Choose(@Value(a)<greaterthansign>5,1,2))"},
      {"TEXT", "ORX_CONDITIONAL:a,b c;@Value<leftparenthesis>x<rightparenthesis><semicolon>",
       "@EvaluateExpression(FDIV,STRING,P,@Choose(a<comma>b<space>c,@Value(x)<semicolon>))"},
      {"OMITTABLE TEXT_OR_ATTR", "<Unused>", "<Unused>"},
      {"LOOKUP_CHOICE \"Deep Blue\",b%Red,R", "ORX_CONDITIONAL:x;Deep<space>Blue;Red",
       "@EvaluateExpression(FDIV,STRING,P,@Choose(x,b,R))"},
      {"LOOKUP_LISTBOX \"Deep Blue\",\"d<space>b\"%Red,R", "\"Deep Blue\"  Red other", "\"d b\"  R other"},
      {"LOOKUP_LISTBOX \"Deep Blue\",b%Red,R", "Deep Blue", "b"},
      {"LOOKUP_LISTBOX \"Deep Blue\",b%Red,R", "\"Deep Blue\" \"@Value(a b)\" Red$(M)",
       "@EvaluateExpression(FDIV,STRING,P,b<space><quotationmark>@Value(a<space>b)<quotationmark><space>Red$("
       "M))"},
      {"LOOKUP_LISTBOX \"Deep Blue\",b%Red,R",
       "ORX_CONDITIONAL:x;<quotationmark>Deep<space>Blue<quotationmark><space>Red;$(M)<space>Red",
       "@EvaluateExpression(FDIV,STRING,P,@Choose(x,b<space>R,$(M)<space>R))"},
      {"GUI_LINE_TABLE "
       "<semicolon>,GUI<space>LOOKUP_CHOICE<space>A<space>Red<comma>R<space>A,GUI<space>TEXT<space>B"
       "<space>B",
       "Red;Red;ORX_CONDITIONAL:x;Red", "R;Red;@EvaluateExpression(FDIV,STRING,P.A,@Choose(x));Red"},
      {"MULTIPARAMETER "
       "<semicolon>,GUI<space>LOOKUP_CHOICE<space>A<space>Red<comma>R<space>A,GUI<space>TEXT<space>B"
       "<space>B",
       "A;Red;B;Red", "A;R;B;Red"},
  };
  for (const Case& c : cases) {
    const auto cfg = makeCfg({{}, {}, {{"P", c.type, c.value}}, {}});
    const QString written = valueOf(*cfg, "P");
    EXPECT_EQ(written.toStdString(), c.written.toStdString()) << c.type << ' ' << c.value.toStdString();
    if (written.startsWith("@Eval")) {
      EXPECT_FALSE(written.contains(' '));
    }
  }
}

TEST(Values, DivisionByBuild) {
  const auto cfg = makeCfg({{}, {}, {{"P", "INT", "@Value(a)"}}, {}});
  for (const int build : {0, TransformerCfg::floatDivisionBuild, TransformerCfg::floatDivisionBuild + 1}) {
    cfg->setLastParmEditBuild(build);
    EXPECT_EQ(valueOf(*cfg, "P") == "@EvaluateExpression(FDIV,INT,P,@Value(a))", build == 15180) << build;
    EXPECT_EQ(valueOf(*cfg, "P") == "@EvaluateExpression(INT,P,@Value(a))", build != 15180) << build;
  }
}

TEST(Values, MembersAndCells) {
  const std::vector<GUIType> members{
      GUIType::fromTransformerTypeString("TEXT_OR_ATTR", "A"), GUIType::fromTransformerTypeString("INT", "B"),
      GUIType::fromTransformerTypeString("TEXT_OR_ATTR", "ORX_CONTROLLER_QUERY_FILE")};
  const QString config = MemberList::configToken(',', members);
  const QStringList parts{"A", "x@Value(y)", "B", "1", "ORX_CONTROLLER_QUERY_FILE", "@Value(z)"};
  const auto cfg = makeCfg({{},
                            {},
                            {{"M", "MULTIPARAMETER " + config, QORXListToSdfString(parts, ',')},
                             {"T", "GUI_LINE_TABLE " + config,
                              QORXListToSdfString({"@Value(y)", "2", "c, d", "", "@Value(z)"}, ',')}},
                            {"$(A) | $(B) | $(ORX_CONTROLLER_QUERY_FILE) | $(M)", "$(ORX_PARM_VAL_LIST)"}});
  const QStringList statements = statementsOf(*cfg);
  EXPECT_EQ(statements.value(0).toStdString(),
            "@EvaluateExpression(FDIV,STRING,A,x@Value(y)) | 1 | @Value(z) | $(M)");
  EXPECT_EQ(
      statements.value(1).simplified().section(" T ", 0, 0).toStdString(),
      "A \"@EvaluateExpression(FDIV,STRING,A,x@Value(y))\" B 1 ORX_CONTROLLER_QUERY_FILE \"@Value(z)\"");
  EXPECT_EQ(QORXSdfStringToList(valueOf(*cfg, "T"), ','),
            (QStringList{"@EvaluateExpression(FDIV,STRING,T.A,@Value(y))", "2", "c, d", "",
                         "@EvaluateExpression(FDIV,INT,T.B,@Value(z))"}));
}

TEST(Values, MembersWithoutValues) {
  struct Case {
    const char* flags;
    const char* flagsOfB;
    const char* value;
    const char* written;
  };
  const Case cases[] = {
      {"OPTIONAL ", "", "", "K A|K B"},
      {"OPTIONAL ", "", "<Unused>", "K A|K B"},
      {"OPTIONAL OMITTABLE ", "", "", ""},
      {"OPTIONAL OMITTABLE ", "", "<Unused>", ""},
      {"OPTIONAL OMITTABLE ", "OPTIONAL ", "A,1", "K A 1|K B"},
      {"", "OPTIONAL ", "A,1", "K A 1|K B"},
      {"", "OPTIONAL OMITTABLE ", "A,1", "K A 1"},
      {"", "OPTIONAL OMITTABLE ", "A,1,B", "K A 1"},
      {"", "OPTIONAL OMITTABLE ", "A,1,B,<Unused>", "K A 1"},
      {"", "OPTIONAL OMITTABLE ", "A,1,B,2", "K A 1|K B 2"},
  };
  for (const Case& c : cases) {
    const QString config =
        MemberList::configToken(',', {GUIType::fromGuiLine("GUI INT A a"),
                                      GUIType::fromGuiLine(QString("GUI %1INT B b").arg(c.flagsOfB))});
    const auto cfg = makeCfg(
        {{}, {}, {{"M", c.flags + QString("MULTIPARAMETER ") + config, c.value}}, {"K A $(A)", "K B $(B)"}});
    EXPECT_EQ(statementsOf(*cfg).join('|').toStdString(), c.written) << c.flags << c.flagsOfB << c.value;
  }
}

TEST(Values, EncodingAroundReferences) {
  const QVector<QPair<QString, QString>> cases{
      {"a b", "a<space>b"},
      {"$(A) $[B]", "$(A)<space>$[B]"},
      {"$($(P)_X)/", "$($(P)_X)<solidus>"},
      {"$(a b)", "<dollarsign><leftparenthesis>a<space>b<rightparenthesis>"},
      {"$($(P) x", "<dollarsign><leftparenthesis>$(P)<space>x"},
      {"$()$", "<dollarsign><leftparenthesis><rightparenthesis><dollarsign>"},
      {"$[x", "<dollarsign><leftsquarebracket>x"},
  };
  for (const auto& c : cases) {
    EXPECT_EQ(encodeAroundReferences(c.first).toStdString(), c.second.toStdString());
    EXPECT_EQ(reencodeAroundReferences(c.second), c.second);
  }
}

TEST(Values, ConversionsAreInverse) {
  const QString text = QStringLiteral("a \"b\" \\ \\\" \t\n\u20ac <x> \\\\");
  for (const ValueEncoding encoding :
       {ValueEncoding::Plain, ValueEncoding::Word, ValueEncoding::UserString, ValueEncoding::Quoted}) {
    const auto convert = [&](const QString& value, ValueEncoding from, ValueEncoding to) {
      return TransformerCfg::getParameterValueForMappingFile(value, from, to, false);
    };
    EXPECT_EQ(convert(convert(text, ValueEncoding::Plain, encoding), encoding, ValueEncoding::Plain), text)
        << int(encoding);
    EXPECT_EQ(convert("<Unused>", ValueEncoding::Plain, encoding), "<Unused>");
  }
  EXPECT_EQ(TransformerCfg::getParameterValueForMappingFile("a b", false, true), "\"a b\"");
  EXPECT_EQ(TransformerCfg::getParameterValueForMappingFile("a<space>b", true, true), "a<space>b");
}

TEST(Values, DefaultMacroLines) {
  const auto cfg = makeCfg({{}, {}, {{"P", "TEXT", "v w"}, {"U", "TEXT", "<Unused>"}}, {}});
  EXPECT_EQ(cfg->getDefaultMacroLine("P"), "DEFAULT_MACRO P v w");
  EXPECT_EQ(cfg->getDefaultMacroLine("U"), "DEFAULT_MACRO U ");
  EXPECT_EQ(cfg->getDefaultMacroLine("unknown"), "DEFAULT_MACRO unknown ");
  for (const char* defaultValue : {"d", "<Unused>"}) {
    cfg->getParameterByMacroName("U")->setDefaultValue(defaultValue);
    EXPECT_EQ(cfg->getDefaultMacroLine("U"),
              defaultValue == QString("d") ? "DEFAULT_MACRO U d" : "DEFAULT_MACRO U ");
  }
}

TEST(Values, SeveralProcesses) {
  struct Case {
    QString count;
    QString groupBy;
    bool isParallel;
  };
  const Case cases[] = {
      {"No Parallelism", "a", false},  {"NO_PARALLELISM", "a", false}, {"NO", "a", false},
      {"Moderate", "<UNUSED>", false}, {"MODERATE", "a b", true},      {"Extreme", "<Unused>", true},
  };
  // The group-by value stands in no line of the template, yet it is written.
  const auto faulty = makeCfg({{}, {}, {{"GROUP", "ATTR_LIST", "a\nb"}}, {"F"}, false, "GROUP"});
  EXPECT_EQ(faulty->findUnwritableValues().keys(), QStringList("GROUP"));
  // A factory without the statements that its workers run is not left behind.
  for (const TestDefinition& broken :
       {TestDefinition{{}, {}, {{"GROUP", "ATTR_LIST", "a"}}, {"F", "G $["}, false, "GROUP"},
        TestDefinition{{}, {}, {{"GROUP", "ATTR_LIST", "a$["}}, {"F"}, false, "GROUP"}}) {
    const auto cfg = makeCfg(broken);
    ASSERT_TRUE(cfg->setParameterValue("ORX_PROCESS_COUNT", "MODERATE", false));
    TextBuffer buffer;
    EXPECT_FALSE(cfg->instantiate(buffer, QString()));
    EXPECT_EQ(buffer.text(), "");
  }
  for (const Case& c : cases) {
    const auto cfg = makeCfg({{"IN"},
                              {"OUT", "FREE"},
                              {{"XFORMER_NAME", "TEXT", "My T"},
                               {"GROUP", "ATTR_LIST", c.groupBy},
                               {"E", "TEXT_ENCODED", "x<space>$(M)"}},
                              {"F $(XFORMER_NAME)"},
                              false,
                              "GROUP"});
    ASSERT_TRUE(cfg->setParameterValue("ORX_PROCESS_COUNT", c.count, false));
    cfg->addInputFeatureType("IN", "in 1");
    cfg->setOutputFeatureType("OUT", "out");
    TextBuffer buffer;
    buffer.setIsMangled(true);
    ASSERT_TRUE(cfg->instantiate(buffer, QString()));
    QStringList written = buffer.text().split('\n', Qt::SkipEmptyParts);
    written = written.filter(QRegularExpression("^F"));
    ASSERT_EQ(written.size(), c.isParallel ? 2 : 1) << c.count.toStdString();
    EXPECT_EQ(written.last(), "F \"My T\"");
  }
}

TEST(Values, HostileTextsTakeTimeInProportion) {
  const QStringList pieces = QString(
                                 "@Value(|)|@Value<leftparenthesis>|<rightparenthesis>|$(|$[|]|(|\"|ORX_"
                                 "CONDITIONAL:|;|<|orx_basicstring:|\\"
                                 "|a| |P|\n|,")
                                 .split('|');
  for (const QString& piece : pieces) {
    const QString value = "@Value(" + piece.repeated(40000);
    const auto cfg = makeCfg({{}, {}, {{"P", "TEXT_OR_ATTR", value}}, {"K $(P)"}});
    cfg->findUnwritableValues();
    TextBuffer buffer;
    cfg->instantiate(buffer, QString());
  }
}

}  // namespace
