#include <platform/qorxcore/qorxcore.h>
#include <tests/core/ConfigHelpers.h>

#include <gtest/gtest.h>

#include <memory>

namespace {

QHash<QString, QString> fieldsOf(const QString& serialised) {
  const QStringList elements = QORXSdfStringToList(serialised, QLatin1Char(','));
  QHash<QString, QString> fields;
  for (int i = 0; i + 1 < elements.size(); i += 2) {
    fields.insert(elements[i], elements[i + 1]);
  }
  return fields;
}

const std::vector<ConfigParameter> kParameters = {{"A", "TEXT"}, {"B", "ATTR"}};

TEST(ConfigSerial, ListsAreAppended) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition(kParameters));
  QHash<QString, QString> fields{{"INPUT_FILTERS", "IN,\"f,g\""},
                                 {"INPUT_ATTRS", "IN,\"a,b\""},
                                 {"OUTPUT_FEATURE_TYPES", "OUT,t"},
                                 {"OUTPUT_FUNCTIONS", "OUT,\"x,y\",REST"}};
  cfg.deserialize(fields);
  cfg.deserialize(fields);
  const QHash<QString, QString> twice = fieldsOf(cfg.serialize());
  EXPECT_EQ(twice.value("INPUT_FILTERS"), "IN,\"f,g,f,g\"");
  EXPECT_EQ(twice.value("INPUT_ATTRS"), "IN,\"a,b\"");
  EXPECT_EQ(twice.value("OUTPUT_FEATURE_TYPES"), "OUT,t");
  EXPECT_EQ(twice.value("OUTPUT_FUNCTIONS"), "OUT,\"x,y,x,y\"");
}

TEST(ConfigSerial, KeysStandInTheirOrder) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition(kParameters));
  cfg.addInputFeatureType("OTHER", "o");
  cfg.addInputFeatureType("ZZZ", "z");
  cfg.addInputFeatureType("IN", "i");
  EXPECT_EQ(cfg.serialize(),
            "NAME,Sorter,VERSION,3,PARAMETER_VALUES,\"A,\"\"\"\",B,\"\"\"\",XFORMER_NAME,\"\"\"\"\","
            "INPUT_FEATURE_TYPES,\"IN,i,OTHER,o,ZZZ,z\",INPUT_FILTERS,\"\",INPUT_ATTRS,\"\","
            "OUTPUT_FEATURE_TYPES,\"\",OUTPUT_FUNCTIONS,\"\"");
}

TEST(ConfigSerial, PartialFields) {
  const struct {
    const char* key;
    const char* value;
    const char* a;             // value of A afterwards
    const char* featureTypes;  // of IN, twice restored
  } cases[] = {
      {"PARAMETER_VALUES", "NOBODY,1,A,2", "2", ""},
      {"PARAMETER_VALUES", "A,2,B", "2", ""},
      {"PARAMETER_VALUES", "", "old", ""},
      {"INPUT_FEATURE_TYPES", "IN,\"x,y\",OTHER", "old", "x y x y"},
      {"INPUT_FEATURE_TYPES", "IN,x,IN,y", "old", "x y x y"},
      {"UNKNOWN", "A,2", "old", ""},
  };
  for (const auto& c : cases) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition(kParameters));
    cfg.setParameterValue("A", "old", true);
    QHash<QString, QString> fields{{c.key, c.value}};
    cfg.deserialize(fields);
    cfg.deserialize(fields);
    EXPECT_EQ(cfg.getParameterValue("A"), c.a) << c.value;
    EXPECT_EQ(cfg.getInputFeatureTypes("IN"), words(c.featureTypes)) << c.value;
  }
}

}  // namespace
