#include "SpecialisedSetup.h"
#include <platform/qorxcore/WordEncoding.h>
#include <transform/specialised/XMLUpdaterTransformerCfg.h>
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

QString inRow(int row, long number, const QString& argument) {
  return TransformResString(370714, {QString::number(row), TransformResString(number, argument)});
}

const char kReference[] = "@Value<leftparenthesis>a<rightparenthesis>";

}  // namespace

TEST(Updaters, DocumentsHaveToBeWellFormed) {
  struct Case {
    const char* text;
    bool isXml;
    bool isJson;
  };
  const Case cases[] = {{"<a/>", true, false},     {"{\"a\":1}", false, true}, {"<a>", false, false},
                        {"@Value(a)", true, true}, {"$(P)", true, true},       {"{", false, false}};
  for (const Case& c : cases) {
    for (const char* name : {"XMLUpdater", "JSONUpdater"}) {
      const auto cfg = makeShipped(name);
      const bool isJson = *name == 'J';
      EXPECT_EQ(dynamic_cast<XMLUpdaterTransformerCfg&>(*cfg).isJson(), isJson);
      cfg->setInputAttributes("INPUT", {"a"});
      EXPECT_TRUE(cfg->setParameterValue(
          "DOCUMENT",
          QORXWwjdEncode(c.text).replace("<dollarsign><leftparenthesis>P<rightparenthesis>", "$(P)"), false));
      EXPECT_EQ(refusalOf(*cfg, "DOCUMENT"),
                (isJson ? c.isJson : c.isXml) ? QString() : TransformResString(370708, "1"))
          << name << " " << c.text;
    }
  }
  EXPECT_EQ(refusalOf(*makeShipped("XMLUpdater"), "DOCUMENT"), TransformResString(370608, "Document"));
  EXPECT_EQ(refusalOf(*makeShipped("XMLUpdater"), "UPDATES"), TransformResString(370608, "Updates"));
}

TEST(Updaters, UpdatesAreCheckedAndWritten) {
  struct Case {
    const char* name;
    QStringList cells;  // path, action, value, kind, ...; the first and third decoded
    QString refusal;
    QString written;  // empty: like the cells
  };
  const QString reference = kReference;
  const Case cases[] = {
      {"XMLUpdater", {"/a/b", "REPLACE", "x < y", "TEXT"}, "", ""},
      {"XMLUpdater", {"//a[@id='/ ]']//b", "INSERT_INTO", "<c/>text", "XML"}, "", ""},
      {"XMLUpdater", {" a ", "REMOVE", "gone", "XML"}, "", "a;REMOVE;\"\";XML"},
      {"XMLUpdater", {"/a", "REPLACE", "<c>", "XML"}, inRow(1, 370708, "1"), ""},
      {"XMLUpdater", {"/a", "REPLACE", "<c>@Value(a)</c>", "XML"}, "", ""},
      {"XMLUpdater",
       {"/a", "REMOVE", "", "TEXT", "/b", "REPLACE", "", "TEXT"},
       inRow(2, 370608, "Value"),
       ""},
      {"XMLUpdater", {"/a/", "REMOVE", "", "TEXT"}, inRow(1, 370713, "/a/"), ""},
      {"XMLUpdater", {"a///b", "REMOVE", "", "TEXT"}, inRow(1, 370713, "a///b"), ""},
      {"XMLUpdater", {"/a[1", "REMOVE", "", "TEXT"}, inRow(1, 370713, "/a[1"), ""},
      {"XMLUpdater", {"/a]", "REMOVE", "", "TEXT"}, inRow(1, 370713, "/a]"), ""},
      {"XMLUpdater", {"/[1]", "REMOVE", "", "TEXT"}, inRow(1, 370713, "/[1]"), ""},
      {"XMLUpdater", {"a b", "REMOVE", "", "TEXT"}, inRow(1, 370713, "a b"), ""},
      {"XMLUpdater", {"$a", "REMOVE", "", "TEXT"}, "", ""},
      {"JSONUpdater",
       {"$.a[0].b", "REPLACE", "{\"c\": 1}", "JSON"},
       "",
       "a<leftsquarebracket>0<rightsquarebracket>.b"},
      {"JSONUpdater", {"$[0]", "REMOVE", "", "TEXT"}, "", "<leftsquarebracket>0<rightsquarebracket>;REMOVE"},
      {"JSONUpdater", {"['a b'].c", "REPLACE", "1", "JSON"}, "", ""},
      {"JSONUpdater", {"$money", "REPLACE", "1", "JSON"}, "", ""},
      {"JSONUpdater", {"a..b", "REMOVE", "", "TEXT"}, inRow(1, 370713, "a..b"), ""},
      {"JSONUpdater", {".a", "REMOVE", "", "TEXT"}, inRow(1, 370713, ".a"), ""},
      {"JSONUpdater", {"a", "REPLACE", "1, 2", "JSON"}, inRow(1, 370708, "1"), ""},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.cells.join(' ').toStdString());
    const auto cfg = makeShipped(c.name);
    cfg->setInputAttributes("INPUT", {"a"});
    QStringList cells;
    for (const QString& cell : c.cells) {
      cells << (cell.isEmpty() ? QString("\"\"") : QORXWwjdEncode(cell));
    }
    const QString stored = cells.join(';');
    EXPECT_TRUE(cfg->setParameterValue("UPDATES", stored, false));
    EXPECT_EQ(refusalOf(*cfg, "UPDATES"), c.refusal);
    const QString written = writtenValue(*cfg, "UPDATES");
    if (!stored.contains("Value")) {
      EXPECT_TRUE(written.startsWith(c.written.isEmpty() ? stored : c.written)) << written.toStdString();
    }
  }
  // What a feature gives is not judged.
  const auto cfg = makeShipped("JSONUpdater");
  cfg->setInputAttributes("INPUT", {"a"});
  EXPECT_TRUE(cfg->setParameterValue("UPDATES", reference + ";REPLACE;" + reference + ";JSON", false));
  EXPECT_EQ(refusalOf(*cfg, "UPDATES"), "");
  EXPECT_EQ(writtenValue(*cfg, "UPDATES"),
            "@EvaluateExpression(FDIV,STRING_ENCODED,UPDATES.PATH,@Value(a));REPLACE;"
            "@EvaluateExpression(FDIV,STRING_ENCODED,UPDATES.VALUE,@Value(a));JSON");
  cfg->setInputAttributes("INPUT", {});
  EXPECT_EQ(refusalOf(*cfg, "UPDATES"), TransformResString(370607, "'a'"));
}
