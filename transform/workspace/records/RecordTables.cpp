#include <platform/qorxcore/Lists.h>
#include <transform/workspace/records/RecordTables.h>

namespace tables {

bool readAttributesToRemove(FeatureTypeStruct& record, const QString& text) {
  record.dynamicSchemaInfo.setAttributesToRemove(QORXSdfStringToList(text, QLatin1Char(',')));
  return true;
}

QString writeAttributesToRemove(const FeatureTypeStruct& record) {
  return QORXListToSdfString(record.dynamicSchemaInfo.getAttributesToRemove(), QLatin1Char(','));
}

bool readStandAlone(GlobalParameterStruct& record, const QString& text) {
  record.isStandAlone = text == words::kTrue.view();
  record.isServer = text == words::kServer.view();
  return record.isStandAlone || record.isServer || text == words::kFalse.view();
}

QString writeStandAlone(const GlobalParameterStruct& record) {
  const Word& word = record.isServer ? words::kServer : record.isStandAlone ? words::kTrue : words::kFalse;
  return word.toQString();
}

bool readPortKind(SubDocumentIOStruct& record, const QString& text) {
  if (text == words::kLoop.view())
    record.isSource = SubDocumentIOKind::Loop;
  else if (text == words::kTrue.view())
    record.isSource = SubDocumentIOKind::Input;
  else
    record.isSource = SubDocumentIOKind::Output;
  return record.isSource != SubDocumentIOKind::Output || text == words::kFalse.view();
}

QString writePortKind(const SubDocumentIOStruct& record) {
  switch (record.isSource) {
    case SubDocumentIOKind::Loop:
      return words::kLoop.toQString();
    case SubDocumentIOKind::Input:
      return words::kTrue.toQString();
    case SubDocumentIOKind::Output:
      break;
  }
  return words::kFalse.toQString();
}

}  // namespace tables
