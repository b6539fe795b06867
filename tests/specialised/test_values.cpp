// What the classes say about values and make of them, as tables. The tables hold values decoded; what is said
// of the last setting of a row is judged.
#include "SpecialisedSetup.h"
#include <platform/qorxcore/Language.h>
#include <transform/text/MessageStrings.h>

#include <QRegularExpression>
#include <gtest/gtest.h>

namespace {

struct ValueCase {
  const char* transformer;
  const char* settings;
  const char* refusal;  // see messageOf()
  const char* written =
      nullptr;  // null: not looked at; "" as it is stored; "{COLUMN:NAME}" a wrapped attribute
};

// "NUMBER|ARGUMENT...": the message; "370714|ROW|NUMBER|ARGUMENT": the same about a row; text in front stays.
QString messageOf(const QString& text) {
  static const QRegularExpression form("^(\\D*)(\\d+)(.*)$", QRegularExpression::DotMatchesEverythingOption);
  const auto match = form.match(text);
  if (!match.hasMatch()) {
    return text;
  }
  const QStringList arguments = match.captured(3).split('|').mid(1);
  const long number = match.captured(2).toLong();
  return match.captured(1) +
         (number == 370714 ? TransformResString(number, {arguments[0], messageOf(arguments.mid(1).join('|'))})
                           : TransformResString(number, arguments));
}

void check(const ValueCase& c) {
  SCOPED_TRACE(std::string(c.transformer) + " " + c.settings);
  QString parameter;
  const auto cfg = makeShippedWith(c.transformer, c.settings, &parameter);
  const QString stored = cfg->getParameterValue(parameter);
  for (const char* language : {"de", "fr", "en"}) {
    QORXSetLanguage(language);
    EXPECT_EQ(refusalOf(*cfg, parameter), messageOf(c.refusal)) << language;
  }
  EXPECT_EQ(cfg->getParameterValue(parameter), stored) << "validation changes nothing";
  if (c.written) {
    static const QRegularExpression wrapped("\\{(\\w+):(\\w+)\\}");
    const QString expected = QString(c.written).replace(
        wrapped, "@EvaluateExpression(FDIV,STRING_ENCODED," + parameter + ".\\1,@Value(\\2))");
    EXPECT_EQ(writtenValue(*cfg, parameter), *c.written ? expected : stored);
  }
}

}  // namespace

TEST(Values, Tests) {
  const char* const name = "Tester";
  for (const ValueCase& c : std::vector<ValueCase>{
           {name, "TESTS=", "370608|Tests", ""},
           {name, "TESTS=a;=;5;b;<=;6", "", "a;EQUALS;5;b;AT_MOST;6"},
           {name, "TESTS=@Value(a);EQUALS;@Value(b)", "", "{LEFT:a};EQUALS;{RIGHT:b}"},
           {name, "TESTS=@Value(nope);EQUALS;5", "370607|'nope'"},
           {name, "TESTS=a;EQUALS;", "370608|Right Value", "a;EQUALS;"},
           {name, "TESTS=;EQUALS;5", "370608|Tests"},
           {name, "TESTS=a;EQUALS;<Unused>", "370608|Right Value"},
           {name, "TESTS=a;EQUALS;5;b;equals;5", "370703|2|equals"},
           {name, "TESTS=a;FILLED;@Value(nope)", "", "a;FILLED;\"\""},
           {name, "TESTS=@Value(nope);FILLED;", "370607|'nope'"},
           {name, "TESTS=@Value(nope);MISSING;x", "", "nope;MISSING;\"\""},
           {name, "TESTS=nope;EXISTS;", "", "nope;EXISTS;"},
           {name, "TESTS=@Value(nope);EXISTS;;@Value(nope);EQUALS;1", "370607|'nope'"},
           {name, "TESTS=a;MATCHES;(b", "370611|(b"},
           {name, "TESTS=a;MATCHES;($(P)", ""},
           {name, "TESTS=a;$(P);", "", ""},
           {name, "COMBINATION=ALL | EXPRESSION=nonsense", ""},
           {name, "COMBINATION=The tests as combined below | EXPRESSION=", "370608|Combination of the Tests"},
           {name, "TESTS=a;FILLED;;b;FILLED; | COMBINATION=EXPRESSION | EXPRESSION=1 and (2 or not 1)", "",
            ""},
           {name, "TESTS=a;FILLED;;b;FILLED; | COMBINATION=EXPRESSION | EXPRESSION=1 AND NOT(2)", ""},
           {name, "COMBINATION=EXPRESSION | EXPRESSION=1 and $(P)", ""},
           {name, "TESTS=a;FILLED; | COMBINATION=EXPRESSION | EXPRESSION=1 or 2", "370705|2|1"},
           {name, "TESTS=a;FILLED; | COMBINATION=EXPRESSION | EXPRESSION=1+1", "370704|+"},
           {name, "COMBINATION=EXPRESSION | EXPRESSION=1.0", "370704|1.0"},
           {name, "COMBINATION=EXPRESSION | EXPRESSION=@Value(a)", "370704|@Value(a)"},
       }) {
    check(c);
  }
}

TEST(Values, Expressions) {
  struct Case {
    const char* expression;
    const char* refusal = "";
  };
  for (const Case& c : std::vector<Case>{
           {" .5e3 * 2.0e-3 + 1E9 "},
           {"1. + 2", "370701|1. + 2"},
           {"-@Value(a) / (@Value(b) + 2) % 3"},
           {"not @Value(a) = \"x \"\"y\"\" (\" or @Value(b) != 2"},
           {"max(1, min(@Value(a), 2)) >= pi()"},
           {"sin (1) AND NOT - - +1"},
           {"1 $(P) 2"},
           {"ORX_CONDITIONAL:1=1;2;3"},
           {"ORX_CONDITIONAL:1=1;2;3+", "370702"},
           {"", "370608|Expression"},
           {"@Value(c)", "370607|'c'"},
           {"@Value(a", "370701|@Value(a"},
           {"1 +", "370702"},
           {"max(1,)", "370701|)"},
           {"()", "370701|)"},
           {"1)", "370701|)"},
           {"1 2", "370701|2"},
           {"(1,2)", "370701|,2)"},
           {"1 == 2", "370701|= 2"},
           {"2x", "370701|2x"},
           {"a + 1", "370701|a + 1"},
           {"and (1)", "370701|and (1)"},
           {"\"open", "370701|\"open"},
           {"1 + @Other(2)", "370701|@Other(2)"},
           {"1 xxxxxxxxxxyyyyyyyyyyxxxxxxxxxxyyyyyyyyyyxx",
            "370701|xxxxxxxxxxyyyyyyyyyyxxxxxxxxxxyyyyyyyyyy\u2026"},
       }) {
    check({"ExpressionEvaluator", QByteArray("EXPRESSION=").append(c.expression).constData(), c.refusal});
  }
  const QByteArray deep = QByteArray(100000, '(') + "1" + QByteArray(100000, ')');
  check({"ExpressionEvaluator", ("EXPRESSION=" + deep).constData(), ""});
  const auto cfg = makeShippedWith("ExpressionEvaluator", "EXPRESSION=@Value(a)/2");
  EXPECT_EQ(writtenValue(*cfg, "EXPRESSION"),
            "@EvaluateExpression(FDIV,FLOAT,EXPRESSION,@Value(a)<solidus>2)");
  cfg->setLastParmEditBuild(15179);
  EXPECT_EQ(writtenValue(*cfg, "EXPRESSION"), "@EvaluateExpression(FLOAT,EXPRESSION,@Value(a)<solidus>2)");
}

TEST(Values, ChartsAndReports) {
  const char* const chart = "ChartGenerator";
  const char* const report = "HTMLReportGenerator";
  for (const ValueCase& c : std::vector<ValueCase>{
           {chart, "SERIES=", "370608|Series", ""},
           {chart, "CHART_TYPE=BAR | SERIES=One;a;b;Two;a;id", "", ""},
           {chart, "CHART_TYPE=Bars | SERIES=\"\";a;b", "", "b;a;b"},
           {chart, "CHART_TYPE=LINE | SERIES=One;\"\";b", "370714|1|370608|Position", ""},
           {chart, "CHART_TYPE=LINE | SERIES=One;a;b;Two;a;\"\"", "370608|Series"},
           {chart, "CHART_TYPE=LINE | SERIES=One;a;b;Two;a", "370714|2|370608|Value"},
           {chart, "CHART_TYPE=HISTOGRAM | SERIES=One;nope;b;\"\";\"\";id", "", "One;\"\";b;id;\"\";id"},
           {chart, "CHART_TYPE=PIE | SERIES=One;a;b;Two;a;id", "370716"},
           {chart, "CHART_TYPE=BAR | SERIES=One;a;b;One;a;id", "370714|2|370717"},
           {chart, "CHART_TYPE=$(KIND) | SERIES=One;a;b;Two;a;id", "", ""},
           {chart, "WIDTH=16", ""},
           {chart, "WIDTH=15", "370715|15|16|16384"},
           {chart, "WIDTH=ORX_CONDITIONAL:1=1;15;20", "370715|15|16|16384"},
           {chart, "WIDTH=ORX_CONDITIONAL:1=1;16;@Value(a)", ""},
           {chart, "HEIGHT=800.5", "370715|800.5|16|16384"},
           {chart, "HEIGHT=$(PAGE)", ""},
           {report, "PARTS=", "370608|Parts of the Page", ""},
           {report, "PARTS=HEADING;News;\"\";TABLE;\"\";`a,b;LINE;\"\";\"\"", "", ""},
           {report, "PARTS=TEXT;@Value(b);nope", "", "TEXT;{CONTENT:b};\"\""},
           {report, "PARTS=LINE;@Value(b);nope", "", "LINE;\"\";\"\""},
           {report, "PARTS=TABLE;Caption;nope", "370607|'nope'", ""},
           {report, "PARTS=HEADING;\"\";a", "370714|1|370608|Content", "HEADING;\"\";\"\""},
           {report, "PARTS=LINE;\"\";\"\";TABLE;x", "370714|2|370608|Attributes", ""},
           {report, "PARTS=PICTURE;http://[x;\"\"", "370714|1|370719|http://[x", ""},
           {report, "PARTS=PICTURE;pictures/a.png;\"\";LINK;https://example.org/?q=1;\"\"", "", ""},
           {report, "PARTS=LINK;$(HOST)/%zz;\"\";LINK;@Value(b);\"\"", ""},
           {report, "PARTS=CHAPTER;x;\"\"", "370714|1|370718|CHAPTER", ""},
           {report, "PARTS=$(KIND);x;a", "", ""},
       }) {
    check(c);
  }
}

TEST(Values, TextsInXmlAndJson) {
  struct Case {
    const char* settings;
    const char* xml;  // refusals
    const char* json;
  };
  const char* const bad = "370708|1";
  for (const Case& c : std::vector<Case>{
           {"DOCUMENT=<a/>", "", bad},
           {"DOCUMENT=@Value(a)", "", ""},
           {"DOCUMENT=$(P)", "", ""},
           {"DOCUMENT=", "370608|Document", "370608|Document"},
           {"DOCUMENT=ORX_CONDITIONAL:1=1;\"a\";<a>", bad, bad},
           {"UPDATES=/a/b;REPLACE;@Value(a);TEXT", "", ""},
           {"UPDATES=//a[@id='/ ]']//b;REPLACE;<c>@Value(a)</c>x;XML", "", "370714|1|370708|1"},
           {"UPDATES=a;REPLACE;<c>;XML", "370714|1|370708|1", "370714|1|370708|1"},
           {"UPDATES=a;REPLACE;{\"c\": @Value(a)};JSON", "", ""},
           {"UPDATES=a;REPLACE;1, 2;JSON", "", "370714|1|370708|1"},
           {"UPDATES=a;REMOVE;;TEXT;b;REPLACE;;TEXT", "370714|2|370608|Value", "370714|2|370608|Value"},
           {"UPDATES=@Value(nope);REMOVE;;TEXT", "370607|'nope'", "370607|'nope'"},
           {"UPDATES=a b;REMOVE;;TEXT", "370714|1|370713|a b", "370714|1|370713|a b"},
           {"UPDATES=a[1;REMOVE;;TEXT", "370714|1|370713|a[1", "370714|1|370713|a[1"},
           {"UPDATES=['a b'].c;REMOVE;;TEXT", "370714|1|370713|['a b'].c", ""},
           {"UPDATES=a///b;REMOVE;;TEXT", "370714|1|370713|a///b", ""},
           {"UPDATES=a..b;REMOVE;;TEXT", "", "370714|1|370713|a..b"},
           {"UPDATES=a/;REMOVE;;TEXT;b.;REMOVE;;TEXT", "370714|1|370713|a/", "370714|2|370713|b."},
       }) {
    check({"XMLUpdater", c.settings, c.xml});
    check({"JSONUpdater", c.settings, c.json});
  }
  for (const Case& c : std::vector<Case>{
           {"<a b=\"@Value(a)\">@Template(PART)<p:c/></a>", "", bad},
           {"<?xml version=\"1.0\"?>\n<a>$(P)</a>\n", "", bad},
           {"<a>\n<b>\n</a>", "370708|3", bad},
           {"<!DOCTYPE a><a/>", bad, bad},
           {"<a>@Template(NONE)</a>", "370711|NONE", bad},
           {"{\"n\": @Value(a), \"s\": \"x@Value(a)\",\n\"l\": [@Template(PART)]}", bad, ""},
           {"[1,\n2,\n]", bad, "370708|3"},
           {"@Template(NONE)", bad, "370711|NONE"},
           {"ORX_CONDITIONAL:1=1;<a/>;<a>@Template(NONE)</a>", "370711|NONE", bad},
           {"ORX_CONDITIONAL:1=1;1;<a>", bad, bad},
           {"\"@Value(a\"", bad, ""},
           {"@Value(c)", "370607|'c'", "370607|'c'"},
           {"", "370608|Template", "370608|Template"},
       }) {
    const QByteArray settings = QByteArray("SUB_TEMPLATES=PART;0 | ROOT_TEMPLATE=").append(c.settings);
    check({"XMLTemplater", settings.constData(), c.xml});
    check({"JSONTemplater", settings.constData(), c.json});
  }
  const char* const xml = "XMLTemplater";
  for (const ValueCase& c : std::vector<ValueCase>{
           {"XMLUpdater", "UPDATES=a;REMOVE;gone;XML", "", "a;REMOVE;\"\";XML"},
           {"XMLUpdater", "UPDATES= a ;REMOVE;gone;XML", "370714|1|370713| a "},
           {"XMLUpdater", "UPDATES=$a;REPLACE;x;TEXT", "", ""},
           {"JSONUpdater", "UPDATES=$.a.b;REPLACE;1;JSON", "", "<dollarsign>.a.b;REPLACE;1;JSON"},
           {"JSONUpdater", "UPDATES=`<dollarsign><leftsquarebracket>0<rightsquarebracket>;REPLACE;1;JSON", "",
            "<dollarsign><leftsquarebracket>0<rightsquarebracket>;REPLACE;1;JSON"},
           {"JSONUpdater", "UPDATES=@Value(a);REPLACE;@Value(b);JSON", "", "{PATH:a};REPLACE;{VALUE:b};JSON"},
           {xml, "SUB_TEMPLATES=P;<x/>text<y/>;Q_2;@Template(P)", ""},
           {xml, "SUB_TEMPLATES=P;</x><x>", "P: 370708|1"},
           {xml, "SUB_TEMPLATES=P;\n<x>", "P: 370708|2"},
           {"JSONTemplater", "SUB_TEMPLATES=P;1],[2", "P: 370708|1"},
           {xml, "SUB_TEMPLATES=a b;<x/>", "370709|a b"},
           {xml, "SUB_TEMPLATES=P;<x/>;P;<y/>", "370710|P"},
           {xml, "SUB_TEMPLATES=ROOT;<x/>", "370710|ROOT"},
           {xml, "SUB_TEMPLATES=P", "370608|Template"},
           {xml, "SUB_TEMPLATES=P;<Unused>", "370608|Template"},
           {xml, "SUB_TEMPLATES=P;ORX_CONDITIONAL:1=1", "370714|1|371345"},
           {xml, "SUB_TEMPLATES=P;@Template(R)", "370711|R"},
           {xml, "SUB_TEMPLATES=P;@Template(P)", "370712|P"},
           {xml, "SUB_TEMPLATES=A;@Template(B)@Template(D);B;@Template(C);C;@Template(B);D;x", "370712|B"},
       }) {
    check(c);
  }
}

TEST(Values, ExpressionsForNamesAndMaps) {
  const char* const mapper = "AttributeValueMapper";
  for (const ValueCase& c : std::vector<ValueCase>{
           {"BulkAttributeRemover", "EXPRESSION=^tmp_", "", ""},
           {"BulkAttributeRemover", "EXPRESSION=(a", "370611|(a"},
           {"BulkAttributeRemover", "EXPRESSION=($(P)", ""},
           {"BulkAttributeRemover", "EXPRESSION=ORX_CONDITIONAL:@Value(a)=1;a;(a", "370611|(a"},
           {"BulkAttributeRemover", "EXPRESSION=", "370608|Regular Expression"},
           {mapper, "MAPPING=", "370608|Values"},
           {mapper, "MAPPING=a;b;c;b", ""},
           {mapper, "MAPPING=a;<Unused>", "", "a;\"\""},
           {mapper, "DIRECTION=BACKWARD | MAPPING=a;b;c;b", "370706|b"},
           {mapper, "MAPPING=x y;1;x y;2", "370706|x y"},
           {mapper, "MAPPING=a;@Value(a)", ""},
           {mapper, "DIRECTION=From right to left | MAPPING=a;@Value(a)", "370707|Mapped Value"},
           {mapper, "MAPPING=@Value(a);a", "370707|Source Value"},
           {mapper, "MAPPING=$(A);1;$(B);2", ""},
       }) {
    check(c);
  }
}

TEST(Values, EarlierFormsAreUpgraded) {
  struct Case {
    const char* transformer;
    const char* settings;
    const char* upgraded = nullptr;  // null: stays as it is
  };
  for (const Case& c : std::vector<Case>{
           {"Tester", "TESTS=&a;>=;5;b;FILLED;\"\"", "@Value(a);AT_LEAST;5;b;FILLED;\"\""},
           {"Tester", "TESTS=a;!=;&b", "a;DIFFERS;@Value(b)"},
           {"Tester", "TESTS=a;like;5;R&D;EQUALS;5"},
           {"Tester", "TESTS=ORX_CONDITIONAL:a;&b"},
           {"ExpressionEvaluator", "EXPRESSION=@Value(a==b) == 1 && !(2 <> 3)",
            "@Value(a==b) = 1  and   not (2 != 3)"},
           {"ExpressionEvaluator", "EXPRESSION=\"!\" == \"a||b\" || 1 != 2", "\"!\" = \"a||b\"  or  1 != 2"},
           {"ExpressionEvaluator", "EXPRESSION=1 == "},
           {"ExpressionEvaluator", "EXPRESSION=\"!"},
           {"AttributeValueMapper", "MAPPING=a;&b;b&c;d", "a;@Value(b);b&c;d"},
           {"ChartGenerator", "SERIES=R&D;&a;&b", "R&D;a;b"},
           {"ChartGenerator", "CHART_TYPE=COLUMN", "BAR"},
           {"HTMLReportGenerator", "PARTS=HEADER;&b;\"\";SEPARATOR;\"\";\"\";IMAGE;x;\"\"",
            "HEADING;@Value(b);\"\";LINE;\"\";\"\";PICTURE;x;\"\""},
           {"HTMLReportGenerator", "PARTS=TEXT;R&D;\"\""},
       }) {
    SCOPED_TRACE(c.settings);
    QString parameter;
    const auto cfg = makeShippedWith(c.transformer, c.settings, &parameter);
    const QString before = cfg->getParameterValue(parameter);
    cfg->autoUpgradeTransformer();
    EXPECT_EQ(cfg->getParameterValue(parameter),
              c.upgraded ? storedForm(*cfg, parameter, c.upgraded) : before);
    EXPECT_EQ(cfg->isAutoUpgraded(), c.upgraded != nullptr);
  }
}
