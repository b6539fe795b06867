#include <apps/orxt/facts/DocumentFacts.h>
#include <platform/orxparameter/orxparameter.h>
#include <platform/qorxcore/qorxcore.h>
#include <transform/workspace/TransformerRecords.h>

#include <map>

namespace {

const QLatin1String kPasswordType("PASSWORD");
const QLatin1String kHiddenValue("********");

}  // namespace

QStringList subDocuments(const IXMLComponentReader& reader) {
  QStringList names = reader.GetSubDocList();
  names.removeAll(QString());
  names.removeDuplicates();
  return names;
}

std::vector<TransformerCount> countTransformers(const IXMLComponentReader& reader, const QString& document) {
  std::map<std::pair<QString, QString>, TransformerCount> counts;
  for (const TransformerStruct& record : reader.GetTransformerList(document)) {
    const QString subDocument = subDocumentName(record);
    TransformerCount& entry = counts[{record.type, subDocument}];
    entry.type = record.type;
    entry.subDocument = subDocument;
    ++entry.count;
    entry.disabled += record.enabled ? 0 : 1;
    entry.versions.insert(record.version);
  }
  std::vector<TransformerCount> list;
  list.reserve(counts.size());
  for (auto& entry : counts)
    list.push_back(std::move(entry.second));
  return list;
}

ParameterFacts describe(const GlobalParameterStruct& record) {
  const GUIType type = GUIType::fromGuiLine(record.guiLine);
  ParameterFacts facts;
  facts.line = record.line;
  facts.name = type.getName();
  facts.type = type.getType();
  facts.prompt = type.getDescription();
  facts.isOptional = type.getFlag(kGUITypeOptional);
  facts.isPassword = type.getType().startsWith(kPasswordType);
  if (facts.isPassword) {
    facts.shown = record.defaultValue.isEmpty() ? QString() : QString(kHiddenValue);
    return facts;
  }
  facts.value = record.defaultValue;
  if (ORX_isChoiceType(type))
    facts.shown = ChoiceList(type).toShown(record.defaultValue);
  else
    facts.shown = type.valueIsEncoded() ? QORXWwjdDecode(record.defaultValue) : record.defaultValue;
  return facts;
}
