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

// What a type makes of a value when it is set has been done when the value is written.
TEST(ConfigSerial, StoredValuesOfEveryTypeComeBack) {
  const std::vector<ConfigParameter> parameters = {
      {"PLAIN", "TEXT"},
      {"ENCODED", "TEXT_ENCODED"},
      {"ATTRIBUTE", "ATTR"},
      {"ATTRIBUTES", "ATTR_LIST_ENCODED"},
      {"MIXED", "TEXT_OR_ATTR_ENCODED"},
      {"NUMBER", "OPTIONAL FLOAT_OR_ATTR"},
      {"CHOSEN", "LOOKUP_CHOICE Shown,STORED%Other,OTHER"},
      {"PACK",
       "MULTIPARAMETER <semicolon>,GUI<space>TEXT<space>FIRST<space>F,GUI<space>TEXT<space>SECOND<space>S"},
      {"ROWS", "GUI_LINE_TABLE <comma>,GUI<space>TEXT<space>KEY<space>K,GUI<space>TEXT<space>WORTH<space>W"}};
  QStringList values =
      QString::fromUtf8(
          "| |,|\"|\"\"|\"\"\"|a,\"b\"|\n\r\t|\\|{a}|<Unused>|A,1,B,2|\"open, it|Grüße 𝄞|$(A),%,;|&id|&&id"
          "|& id|@Value(id)|ORX_CONDITIONAL:DEFAULT_VALUE,\"a,b\"|$(A) $[B|FIRST;1;SECOND;\"a;\"\"b\"\"\""
          "|k,\"v,\"\"w\"\"\",,|Shown|\"a\"\n,b|PARAMETER_VALUES,\"PLAIN,x\"| \"x\" , ")
          .split(QLatin1Char('|'));
  values << QString(QChar(0)) + QChar(0xdc00) + QChar(0xfeff) << QString(5000, QLatin1Char('"'));
  for (const QString& value : values) {
    TransformerCfg cfg;
    cfg.configure(makeDefinition(parameters));
    for (const QString& name : cfg.getParameters()) {
      cfg.setParameterValue(name, value, true);
    }
    cfg.addInputFeatureType(qs("IN"), value);
    cfg.addInputFeatureType(qs("IN"), qs("second"));
    cfg.addInputFilter(qs("OTHER"), value);
    cfg.setInputAttributes(qs("IN"), {value, qs("x")});
    cfg.setOutputFeatureType(qs("OUT"), value);
    cfg.setOutputTagFuncs(qs("REST"), {value, value});
    TransformerCfg restored;
    restored.configure(makeDefinition(parameters));
    QHash<QString, QString> fields = fieldsOf(cfg.serialize());
    restored.deserialize(fields);
    for (const QString& name : cfg.getParameters()) {
      EXPECT_EQ(restored.getParameterValue(name), cfg.getParameterValue(name))
          << name.toStdString() << ": " << value.left(40).toStdString();
    }
    EXPECT_EQ(restored.serialize(), cfg.serialize()) << value.left(40).toStdString();
    EXPECT_EQ(restored.getInputAttributeUnion(), cfg.getInputAttributeUnion());
  }
}

// A class adds keys behind the others, and finds them again; parameters that a value brings come behind it.
TEST(ConfigSerial, ClassesAddKeysAndParameters) {
  struct Noted : TransformerCfg {
    QString serialize() const override {
      return TransformerCfg::serialize() + QLatin1Char(',') +
             QORXListToSdfString({qs("NOTE"), note}, QLatin1Char(','));
    }
    void deserialize(QHash<QString, QString>& fields) override {
      TransformerCfg::deserialize(fields);
      note = fields.value(qs("NOTE"));
    }
    QString note;
  };
  Noted cfg;
  Noted restored;
  for (Noted* each : {&cfg, &restored}) {
    each->configure(makeDefinition(kParameters));
    each->setDynparamsParameters({qs("A")});
  }
  cfg.note = qs("\"a\",\nNOTE,");
  cfg.setParameterValue(qs("A"), qs("ROAD,RIVER"), true);
  QHash<QString, QString> fields = fieldsOf(cfg.serialize());
  restored.deserialize(fields);
  EXPECT_EQ(restored.note, cfg.note);
  EXPECT_EQ(restored.getParameters(), words("A B XFORMER_NAME DYNGROUP_A_1 DYNGROUP_A_2"));
  EXPECT_EQ(restored.serialize(), cfg.serialize());
}

TEST(ConfigSerial, ListsAreAppended) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition(kParameters));
  QHash<QString, QString> fields{{qs("INPUT_FILTERS"), qs("IN,\"f,g\"")},
                                 {qs("INPUT_ATTRS"), qs("IN,\"a,b\"")},
                                 {qs("OUTPUT_FEATURE_TYPES"), qs("OUT,t")},
                                 {qs("OUTPUT_FUNCTIONS"), qs("OUT,\"x,y\",REST")}};
  cfg.deserialize(fields);
  cfg.deserialize(fields);
  const QHash<QString, QString> twice = fieldsOf(cfg.serialize());
  EXPECT_EQ(twice.value(qs("INPUT_FILTERS")), qs("IN,\"f,g,f,g\""));
  EXPECT_EQ(twice.value(qs("INPUT_ATTRS")), qs("IN,\"a,b\""));
  EXPECT_EQ(twice.value(qs("OUTPUT_FEATURE_TYPES")), qs("OUT,t"));
  EXPECT_EQ(twice.value(qs("OUTPUT_FUNCTIONS")), qs("OUT,\"x,y,x,y\""));
}

TEST(ConfigSerial, KeysStandInTheirOrder) {
  TransformerCfg cfg;
  cfg.configure(makeDefinition(kParameters));
  cfg.addInputFeatureType(qs("OTHER"), qs("o"));
  cfg.addInputFeatureType(qs("ZZZ"), qs("z"));
  cfg.addInputFeatureType(qs("IN"), qs("i"));
  EXPECT_EQ(cfg.serialize(),
            qs("NAME,Sorter,VERSION,3,PARAMETER_VALUES,\"A,\"\"\"\",B,\"\"\"\",XFORMER_NAME,\"\"\"\"\","
               "INPUT_FEATURE_TYPES,\"IN,i,OTHER,o,ZZZ,z\",INPUT_FILTERS,\"\",INPUT_ATTRS,\"\","
               "OUTPUT_FEATURE_TYPES,\"\",OUTPUT_FUNCTIONS,\"\""));
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
    cfg.setParameterValue(qs("A"), qs("old"), true);
    QHash<QString, QString> fields{{qs(c.key), qs(c.value)}};
    cfg.deserialize(fields);
    cfg.deserialize(fields);
    EXPECT_EQ(cfg.getParameterValue(qs("A")), qs(c.a)) << c.value;
    EXPECT_EQ(cfg.getInputFeatureTypes(qs("IN")), words(c.featureTypes)) << c.value;
  }
}

TEST(ConfigSerial, AttributesArePropagated) {
  struct Counting : TransformerCfg {
    using TransformerCfg::setInputAttributes;
    void setInputAttributes(const QHash<QString, QStringList>& attributes) override {
      ++calls;
      TransformerCfg::setInputAttributes(attributes);
    }
    int calls = 0;
  };
  Counting cfg;
  cfg.configure(makeDefinition(kParameters));
  QHash<QString, QString> fields{{qs("INPUT_ATTRS"), qs("IN,\"a,b\"")}};
  cfg.deserialize(fields);
  EXPECT_EQ(cfg.calls, 1);
  EXPECT_EQ(cfg.getInputAttributeUnion(), words("a b"));
}

}  // namespace
