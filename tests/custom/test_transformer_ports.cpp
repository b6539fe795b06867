// Which tags the ports that records and links name are.
#include "CustomFixtures.h"
#include <tests/support/QtPrinters.h>
#include <transform/custom/TransformerPorts.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <gtest/gtest.h>

namespace {

struct PortCase {
  const char* promise;
  int version;              // of the record
  const char* inputOrder;   // of the record
  const char* outputFeats;  // likewise
  bool isOutput;
  unsigned number;
  const char* name;
  const char* tag;  // empty: there is no such port
};

const PortCase kPortCases[] = {
    {"the name goes before the number", 4, "", "", false, 0, "B", "B"},
    {"of an output too", 4, "", "", true, 0, "Y", "Y"},
    {"an unknown name is not counted instead", 4, "", "", false, 0, "C", ""},
    {"names are told apart by case", 4, "", "", true, 0, "y", ""},
    {"a number counts through the tags", 4, "", "", false, 1, "", "B"},
    {"and through the outputs", 4, "", "", true, 1, "", "Y"},
    {"up to the last, dynamic ones behind", 4, "", "", false, 2, "", "D"},
    {"but not further", 4, "", "", false, 3, "", ""},
    {"nor into negative numbers", 4, "", "", true, 0xffffffffU, "", ""},
    {"the record's own order counts", 4, "\"B f g\",\"A h\"", "", false, 0, "", "B"},
    {"and that of its outputs", 4, "", "Y,X", true, 0, "", "Y"},
    {"only the record's order counts then", 4, "", "Y", true, 1, "", ""},
    {"a port that the record lists may be none", 4, "", "Z,X", true, 0, "", ""},
    {"a number may lead to an alias", 4, "Alpha,B", "", false, 0, "", "A"},
    {"aliases are names", 4, "", "", false, 1, "Alpha", "A"},
    {"an older name", 3, "", "", false, 0, "Old", "B"},
    {"of an output", 3, "", "", true, 0, "First", "X"},
    {"by way of two versions", 1, "", "", false, 0, "Oldest", "B"},
    {"is none for a newer record", 4, "", "", false, 0, "Old", ""},
    {"an older name in the record's order", 3, "Old,A", "", false, 0, "", "B"},
    {"a tag goes before an older name", 1, "", "", false, 0, "D", "D"},
    {"an older name of what is no tag", 1, "", "", true, 0, "Gone", ""},
};

TEST(TransformerPorts, AreFoundByNameElseByNumber) {
  TransformerDefinition definition = passing("Ports", "X,Y");
  definition.version = 4;
  definition.inputTags = names("A:Alpha,B");
  definition.dynamicInputTags = names("D");
  definition.tagMapping = names("2:I:Oldest=Old,4:I:Old=B,2:I:D=A,4:O:First=X,2:O:Gone=Nothing");
  const std::unique_ptr<TransformerCfg> cfg = configured(definition);
  for (const PortCase& test : kPortCases) {
    TransformerStruct record;
    record.version = test.version;
    record.inputFtOrder = test.inputOrder;
    for (const QString& output : names(test.outputFeats)) {
      record.outputFeats.push_back({});
      record.outputFeats.back().name = output;
    }
    const TransformerPorts ports(record, *cfg);
    const QString name = test.name;
    const QString tag = test.isOutput ? ports.output(test.number, name) : ports.input(test.number, name);
    EXPECT_EQ(tag, QString(test.tag)) << test.promise;
    EXPECT_EQ(tag.isNull(), *test.tag == '\0') << test.promise;
  }
}

TEST(TransformerPorts, ExposedAttributesStandAtTheirOutput) {
  TransformerDefinition definition = passing("Ports", "X,Y");
  definition.tagMapping = names("O:First=X");
  TransformerStruct record;
  for (const char* output : {"Y", "First"}) {
    record.outputFeats.push_back({});
    record.outputFeats.back().name = QLatin1String(output);
  }
  for (const int index : {0, 1, 2, -1, 1}) {
    XformAttrStruct attribute;
    attribute.attrName = QStringLiteral("a%1").arg(record.attributes.size());
    attribute.featIndex = index;
    attribute.isUserCreated = record.attributes.size() < 4;
    record.attributes.push_back(attribute);
  }
  const auto exposed = TransformerPorts(record, *configured(definition)).exposedAttributes(record);
  EXPECT_EQ(exposed.value("X"), names("a1,a2,a3"));
  EXPECT_EQ(exposed.value("Y"), names("a0,a2,a3"));
}

}  // namespace
