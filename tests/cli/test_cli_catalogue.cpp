// The catalogue from the command line: searches, categories, change logs and the schemas of parameters.
#include <tests/cli/OrxtProcess.h>
#include <tests/support/QtPrinters.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <gtest/gtest.h>

#include <cmath>

namespace {

QByteArray definition(const char* name, int version, const QByteArray& header, const QByteArray& description,
                      const QByteArray& changes = "First version.") {
  return QByteArray("TRANSFORMER_NAME: ") + name + "\nVERSION: " + QByteArray::number(version) +
         "\nINPUT_TAGS: INPUT\nOUTPUT_TAGS: OUTPUT\n" + header + "\nDESCRIPTION_START\n" + description +
         "\nDESCRIPTION_END\nCHANGE_LOG_START\n" + changes +
         "\nCHANGE_LOG_END\nTEMPLATE_START\nFACTORY_DEF * F FACTORY_NAME $(XFORMER_NAME)\nTEMPLATE_END\n";
}

// A folder with definitions whose words stand nowhere else in the catalogue.
class Catalogue : public testing::Test {
 protected:
  void SetUp() override {
    put(m_folder.filePath("animals.ort"),
        definition("Xerus", 1, "CATEGORY: Rodents", "Sleeps beside the quokka.") +
            definition("Yak", 1, "CATEGORY: Quokka Matters", "Grazes on stony ground.") +
            definition("Zebra", 1, "ALIASES: QuokkaFriend\nCATEGORY: Rodents", "Runs.") +
            definition("QuokkaFeeder", 1, "CATEGORY: Rodents", "Gives leaves. Takes nothing.") +
            definition("Quokka", 1, "CATEGORY: Rodents", "Old.", "Born & <raised>") +
            definition("Quokka", 3, "CATEGORY: Rodents", "Smiles on stony ground.", "Eats \"leaves\"") +
            definition("QuokkaGone", 2, "CATEGORY: Rodents\nVISIBLE: NO\nREPLACED_BY: Quokka", "Gone."));
  }

  Outcome transformers(const QStringList& arguments) const {
    return orxt(QStringList{"transformers"} + arguments + QStringList{"--resources", m_folder.path()},
                m_folder.path());
  }

  QTemporaryDir m_folder;
};

QStringList namesIn(const Outcome& run) {
  QStringList names;
  for (const QJsonValue& entry : QJsonDocument::fromJson(run.out.toUtf8()).array())
    names << entry.toObject().value("name").toString();
  return names;
}

TEST_F(Catalogue, SearchPutsTheBestHitsFirst) {
  const struct {
    QStringList arguments;
    QStringList names;  // those found first
    int count;          // of all; -1: any number
    const char* foundIn;
  } cases[] = {
      {{"quokka"}, {"Quokka", "QuokkaFeeder", "Zebra", "Yak", "Xerus"}, 5, "exactName"},
      {{"QUOKKA", "--all"},
       {"Quokka", "QuokkaFeeder", "QuokkaGone", "Zebra", "Yak", "Xerus"},
       6,
       "exactName"},
      {{"quokka", "feeder"}, {"QuokkaFeeder"}, 1, "exactName"},
      {{"feeder quokka"}, {"QuokkaFeeder"}, 1, "name"},
      {{"quokkafriend"}, {"Zebra"}, 1, "alias"},
      {{"matters", "yak"}, {"Yak"}, 1, "category"},
      {{"stony", "quokka"}, {"Quokka", "Yak"}, 2, "description"},
      {{"the", "quokkas", "feeding"}, {"QuokkaFeeder"}, 1, "name"},
      {{"qoukka"}, {"Quokka", "QuokkaFeeder"}, 5, "exactName"},
      {{"stony", "smiles", "leaves"}, {"Quokka"}, 1, "description"},
      {{"clip"}, {"AreaClipper"}, -1, "name"},
      {{"points"}, {"PointPlacer", "CentrePointPlacer", "NearestPointFinder"}, -1, "name"},
      {{"remove duplicates"}, {"DuplicateSieve"}, 1, "description"},
      {{"bufer"}, {"GeometryBufferer"}, 1, "name"},
      {{"DistanceZoneMaker"}, {"GeometryBufferer"}, 1, "alias"},
      {{"Geometriepuffer", "--lang", "de"}, {"GeometryBufferer"}, 1, "exactName"},
      {{"Flaechen", "messen", "--lang", "de"}, {"AreaMeasurer"}, -1, "name"},
      {{"verbinden", "--lang", "de"}, {"KeyJoiner"}, -1, "name"},
      {{"räumliche", "Analyse", "--lang", "de"},
       {"AreaClipper", "CrossingSplitter", "NearestPointFinder", "SpatialMatcher"},
       4,
       "category"},
  };
  for (const auto& test : cases) {
    const std::string line = test.arguments.join(' ').toStdString();
    const Outcome run = transformers(QStringList{"search", "--json"} + test.arguments);
    EXPECT_EQ(run.status, 0) << line << run.err.toStdString();
    const QStringList names = namesIn(run);
    EXPECT_EQ(QStringList(names.mid(0, test.names.size())), test.names) << line;
    if (test.count >= 0) {
      EXPECT_EQ(names.size(), test.count) << line;
    }
    const QJsonObject first = QJsonDocument::fromJson(run.out.toUtf8()).array().first().toObject();
    EXPECT_EQ(first.value("foundIn").toString(), QString(test.foundIn)) << line;
  }
  const Outcome text = transformers({"search", "quokka", "feeder"});
  EXPECT_EQ(text.out, QString("QuokkaFeeder  Gives leaves.\n"));
}

TEST_F(Catalogue, SaysWhereItDoesNotAnswerAsAsked) {
  ASSERT_TRUE(QFile::copy(sample("custom/site_placer.ort"), m_folder.filePath("placer.ort")));
  const struct {
    QStringList arguments;
    int status;
    const char* err;
  } cases[] = {
      {{"search", "quokka", "nowhere"}, 1, "nowhere"},
      {{"search", "qoukka"}, 0, "searching for 'quokka'"},
      {{"search", "smiles", "leaves"}, 0, "have the most of them"},
      {{"search", "smiles", "quokka"}, 0, ""},
      {{"search", " "}, 2, "word"},
      {{"list", "--category", "Rodent"}, 1, "did you mean 'Rodents'?"},
      {{"show", "a\x1b[31mb"}, 1, "a\xef\xbf\xbd[31mb"},
      {{"show", QString(50000, 'y')}, 1, "yyy\xe2\x80\xa6"},
      {{"show", "QuokaFeder"}, 1, "did you mean 'QuokkaFeeder'?"},
      {{"show", "Geometriepufer", "--lang", "de"}, 1, "meinten Sie 'Geometriepuffer'?"},
      {{"show", "Geometriepuffer", "--lang", "de"}, 0, ""},
      {{"show", "QuokkaFriend", "--version", "2"}, 1, "no version 2; the newest is 1"},
      {{"show", "Quokka", "--version", "2"}, 1, "there are: 1, 3"},
      {{"changelog", "Quoka"}, 1, "did you mean 'Quokka'?"},
      {{"changelog", "Quokka", "--version", "4"}, 1, "the newest is 3"},
      {{"search"}, 2, "word"},
      {{"changelog", "NoSuchThing"}, 1, "NoSuchThing"},
      {{"changelog", "Quokka", "--from", "4"}, 1, "the newest is 3"},
      {{"changelog", "Quokka", "--from", "-1"}, 2, "--from"},
      {{"changelog", "Quokka", "-o", "no/such/page.html"}, 3, "no/such/page.html"},
      {{"show", "Quokka", "--schema", "--json"}, 2, "excludes"},
      {{"show", "Quokka", "--version", "1.5"}, 2, "'1.5' is neither"},
      {{"show", "Quokka", "--version", "4294967297"}, 2, "'4294967297' is neither"},
      {{"list", "--resources", "no/such/folder"}, 2, "no/such/folder"},
      {{"list", "--resources", sample("custom")}, 0, "placer.ort is passed over"},
  };
  for (const auto& test : cases) {
    const Outcome run = transformers(test.arguments);
    const std::string line = test.arguments.join(' ').toStdString();
    EXPECT_EQ(run.status, test.status) << line;
    EXPECT_LT(run.err.size(), 20000) << line;
    EXPECT_TRUE(*test.err ? run.err.contains(test.err) : run.err.isEmpty()) << line << "\n"
                                                                            << run.err.toStdString();
  }
  const QByteArray home = qgetenv("ORX_HOME");
  qputenv("ORX_HOME", m_folder.filePath("none").toUtf8());
  qputenv("XDG_DATA_HOME", m_folder.path().toUtf8());
  EXPECT_TRUE(orxt({"transformers", "list"}).err.contains("none/transformers"));
  home.isNull() ? qunsetenv("ORX_HOME") : qputenv("ORX_HOME", home);
  qunsetenv("XDG_DATA_HOME");
}

TEST_F(Catalogue, CategoriesInTheLanguageAskedFor) {
  const QJsonArray list =
      QJsonDocument::fromJson(transformers({"categories", "--json", "--lang", "de"}).out.toUtf8()).array();
  QJsonObject byName;
  for (const QJsonValue& entry : list)
    byName.insert(entry.toObject().value("name").toString(), entry);
  const QJsonObject geometry = byName.value("Geometry").toObject();
  EXPECT_EQ(geometry.value("localizedName").toString(), QString("Geometrie"));
  EXPECT_TRUE(geometry.value("description").toString().startsWith("Transformer, die")) << list.size();
  EXPECT_TRUE(geometry.value("transformers").toArray().contains("GeometryBufferer"));
  EXPECT_EQ(byName.value("Quokka Matters").toObject().value("transformers").toArray(), QJsonArray{"Yak"});
  const QString text = transformers({"categories", "--lang", "de"}).out;
  EXPECT_EQ(text.count('\n'), list.size());
  EXPECT_TRUE(text.contains(QRegularExpression("^Geometrie  ", QRegularExpression::MultilineOption)));
}

TEST_F(Catalogue, ChangeLogs) {
  const QString all = transformers({"changelog", "Quokka"}).out;
  EXPECT_TRUE(all.contains("<li>Eats &quot;leaves&quot;</li>") && all.contains("Born &amp; &lt;raised&gt;"))
      << all.toStdString();
  EXPECT_FALSE(transformers({"changelog", "Quokka", "--from", "1"}).out.contains("raised"));
  EXPECT_FALSE(transformers({"changelog", "Quokka", "--version", "1"}).out.contains("leaves"));
  EXPECT_EQ(transformers({"changelog", "Quokka", "-o", "page.html"}).out, QString());
  EXPECT_EQ(readAll(m_folder.filePath("page.html")), all.toUtf8());
  const QJsonArray json =
      QJsonDocument::fromJson(transformers({"changelog", "QuokkaGone", "--json"}).out.toUtf8()).array();
  EXPECT_EQ(json.size(), 3);
  EXPECT_EQ(json.at(1).toObject(), (QJsonObject{{"name", "Quokka"},
                                                {"localizedName", "Quokka"},
                                                {"version", 1},
                                                {"changes", QJsonArray{"Born & <raised>"}}}));
}

// As much of a validator as these schemas need; a keyword that it does not know is a fault. The answer is
// empty when the value fits.
QString misfit(const QJsonObject& schema, const QJsonValue& value, const QJsonObject& root) {
  static const QStringList annotations{"$schema", "$defs", "$comment", "title", "description", "default"};
  for (auto rule = schema.begin(); rule != schema.end(); ++rule) {
    const QString keyword = rule.key();
    const QJsonValue wanted = rule.value();
    bool fits = true;
    if (annotations.contains(keyword))
      continue;
    if (keyword == "type") {
      const QString type = wanted.toString();
      fits = type == "string"    ? value.isString()
             : type == "number"  ? value.isDouble()
             : type == "integer" ? value.isDouble() && std::floor(value.toDouble()) == value.toDouble()
             : type == "array"   ? value.isArray()
             : type == "object"  ? value.isObject()
                                 : false;
    } else if (keyword == "enum") {
      fits = wanted.toArray().contains(value);
    } else if (keyword == "const") {
      fits = wanted == value;
    } else if (keyword == "pattern") {
      fits = value.toString().contains(QRegularExpression(wanted.toString()));
    } else if (keyword == "minimum") {
      fits = value.toDouble() >= wanted.toDouble();
    } else if (keyword == "maximum") {
      fits = value.toDouble() <= wanted.toDouble();
    } else if (keyword == "minLength") {
      fits = value.toString().size() >= wanted.toInt();
    } else if (keyword == "minItems") {
      fits = value.toArray().size() >= wanted.toInt();
    } else if (keyword == "uniqueItems") {
      for (int i = 0; i < value.toArray().size(); ++i)
        fits =
            fits && !value.toArray().toVariantList().mid(i + 1).contains(value.toArray().at(i).toVariant());
    } else if (keyword == "items") {
      for (const QJsonValue& item : value.toArray())
        fits = fits && misfit(wanted.toObject(), item, root).isEmpty();
    } else if (keyword == "anyOf") {
      fits = false;
      for (const QJsonValue& other : wanted.toArray())
        fits = fits || misfit(other.toObject(), value, root).isEmpty();
    } else if (keyword == "$ref") {
      fits = wanted.toString() == "#/$defs/computed" &&
             misfit(root.value("$defs").toObject().value("computed").toObject(), value, root).isEmpty();
    } else if (keyword == "required") {
      for (const QJsonValue& name : wanted.toArray())
        fits = fits && value.toObject().contains(name.toString());
    } else if (keyword == "properties") {
      for (const QString& name : value.toObject().keys()) {
        const QString inner =
            misfit(wanted.toObject().value(name).toObject(), value.toObject().value(name), root);
        if (!inner.isEmpty())
          return name + ": " + inner;
      }
    } else if (keyword == "additionalProperties") {
      for (const QString& name : value.toObject().keys())
        fits = fits && schema.value("properties").toObject().contains(name);
    } else {
      return "unknown keyword " + keyword;
    }
    if (!fits)
      return keyword;
  }
  return QString();
}

QJsonObject defaultsOf(const QJsonObject& schema) {
  QJsonObject result;
  const QJsonObject properties = schema.value("properties").toObject();
  for (auto property = properties.begin(); property != properties.end(); ++property) {
    if (property.value().toObject().contains("default"))
      result.insert(property.key(), property.value().toObject().value("default"));
  }
  return result;
}

TEST(CatalogueSchema, EveryShippedDefaultFits) {
  std::vector<QStringList> asked;
  for (const QString& name : namesIn(orxt({"transformers", "list", "--all", "--json"}))) {
    const Outcome shown = orxt({"transformers", "show", name, "--json"});
    for (const QJsonValue& version :
         QJsonDocument::fromJson(shown.out.toUtf8()).object().value("versions").toArray())
      asked.push_back(
          {"transformers", "show", name, "--schema", "--version", QString::number(version.toInt())});
  }
  EXPECT_GE(asked.size(), 50u);
  int defaults = 0;
  for (const QStringList& arguments : asked) {
    SCOPED_TRACE(arguments.join(' ').toStdString());
    const QJsonObject schema = QJsonDocument::fromJson(orxt(arguments).out.toUtf8()).object();
    EXPECT_EQ(schema.value("$schema").toString(), QString("https://json-schema.org/draft/2020-12/schema"));
    QJsonObject values = defaultsOf(schema);
    defaults += values.size();
    const QJsonArray required = schema.value("required").toArray();
    EXPECT_EQ(misfit(schema, values, schema), required.isEmpty() ? QString() : QString("required"));
    // With something for those that must be given, the rest fits.
    for (const QJsonValue& must : required) {
      EXPECT_FALSE(values.contains(must.toString()));
      const QJsonObject property = schema.value("properties").toObject().value(must.toString()).toObject();
      const bool isRows = property.value("items").toObject().value("type") == "object";
      values.insert(must.toString(), property.value("type") != "array" ? QJsonValue("$(GIVEN)")
                                     : isRows                          ? QJsonValue(QJsonArray{QJsonObject()})
                                                                       : QJsonValue(QJsonArray{"given"}));
    }
    EXPECT_EQ(misfit(schema, values, schema), QString());
    values.insert("NO_SUCH_PARAMETER", 1);
    EXPECT_EQ(misfit(schema, values, schema), QString("additionalProperties"));
  }
  EXPECT_GE(defaults, 50);
}

TEST(CatalogueSchema, SaysWhatEachTypeTakes) {
  QTemporaryDir folder;
  QByteArray header;
  const auto parameter = [&header](const char* name, const char* type, const char* value) {
    header += QByteArray("PARAMETER_NAME: ") + name + "\nPARAMETER_TYPE: " + type +
              "\nPARAMETER_PROMPT: " + name + "\nPARAMETER_DEFAULT: " + value + "\n";
  };
  parameter("WHOLE", "INT", "7");
  parameter("SLIDER", "RANGE_SLIDER 0%10%1", "2.5");
  parameter("NUMBER", "FLOAT_OR_ATTR", "");
  parameter("CHOSEN", "CHOICE A%B", "A");
  parameter("LOOKED_UP", "LOOKUP_CHOICE \"An x\",X<space>1%Y,Y", "X 1");
  parameter("BOX", "CHECKBOX ON%OFF", "OFF");
  parameter("SOME", "OPTIONAL LISTBOX A%B%C", "A C");
  parameter("NAMES", "ATTR_LIST_ENCODED", "");
  parameter("TEXT", "TEXT_ENCODED", "a<space>b");
  parameter("FRAME", "GROUP WHOLE%CHOSEN", "");
  parameter("PACK", "MULTIPARAMETER <semicolon>,GUI<space>INT<space>N<space>N,GUI<space>TEXT<space>T<space>T",
            "N;4;T;x");
  parameter("ROWS", "GUI_LINE_TABLE <semicolon>,GUI<space>TEXT<space>K<space>K,GUI<space>INT<space>V<space>V",
            "a;1;b;2");
  put(folder.filePath("types.ort"), definition("SchemaTypes", 2, header, "All types."));
  const Outcome run = orxt(
      {"transformers", "show", "SchemaTypes", "--schema", "--version", "2", "--resources", folder.path()});
  const QJsonObject schema = QJsonDocument::fromJson(run.out.toUtf8()).object();
  EXPECT_EQ(schema.value("required").toArray(), (QJsonArray{"NUMBER", "NAMES"}));
  EXPECT_FALSE(schema.value("properties").toObject().contains("FRAME"));
  const QJsonObject defaults{
      {"WHOLE", 7},
      {"SLIDER", 2.5},
      {"CHOSEN", "A"},
      {"LOOKED_UP", "X 1"},
      {"BOX", "OFF"},
      {"SOME", QJsonArray{"A", "C"}},
      {"TEXT", "a b"},
      {"PACK", QJsonObject{{"N", 4}, {"T", "x"}}},
      {"ROWS", QJsonArray{QJsonObject{{"K", "a"}, {"V", 1}}, QJsonObject{{"K", "b"}, {"V", 2}}}}};
  EXPECT_EQ(defaultsOf(schema), defaults) << run.out.toStdString();
  const struct {
    const char* name;
    QJsonValue value;
    bool fits;
  } cases[] = {
      {"WHOLE", 1.5, false},
      {"WHOLE", "7", false},
      {"WHOLE", "$(COUNT)", true},
      {"SLIDER", 11, false},
      {"NUMBER", 0.25, true},
      {"NUMBER", "much", false},
      {"NUMBER", "@Value(height)", true},
      {"CHOSEN", "C", false},
      {"LOOKED_UP", "Y", true},
      {"LOOKED_UP", "An x", false},
      {"BOX", "YES", false},
      {"SOME", QJsonArray{}, true},
      {"SOME", QJsonArray{"A", "D"}, false},
      {"SOME", QJsonArray{"A", "A"}, false},
      {"NAMES", QJsonArray{}, false},
      {"NAMES", QJsonArray{"id"}, true},
      {"PACK", QJsonObject{{"N", "x"}}, false},
      {"PACK", QJsonObject{{"M", 1}}, false},
      {"ROWS", QJsonArray{QJsonObject{{"V", 1.5}}}, false},
  };
  for (const auto& test : cases) {
    const QJsonObject property = schema.value("properties").toObject().value(test.name).toObject();
    EXPECT_EQ(misfit(property, test.value, schema).isEmpty(), test.fits)
        << test.name << QJsonDocument(property).toJson().toStdString();
  }
}

}  // namespace
