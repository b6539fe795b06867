#include <platform/qorxcore/Lists.h>
#include <transform/text/TextHelpers.h>
#include <transform/workspace/TransformerRecords.h>

QString transformerTitle(const TransformerStruct& record) {
  return record.name.isEmpty() ? record.type + QLatin1Char('_') + QString::number(record.identifier)
                               : record.name;
}

QString subDocumentName(const TransformerStruct& record) {
  if (record.kind != TransformerKind::SubDocument)
    return QString();
  for (const XformParmStruct& parameter : record.parameters) {
    if (parameter.parmName == kSubDocumentNameParameter)
      return parameter.parmValue;
  }
  return QString();
}

bool readFeaturePort(const QString& description, bool wantsOutput, unsigned& number, QString& name) {
  bool isFeaturePort = false;
  bool isOutput = false;
  unsigned second = 0;
  return decodePortDescription(description, isFeaturePort, isOutput, number, second, name) && isFeaturePort &&
         isOutput == wantsOutput;
}

std::vector<QStringList> readPortOrder(const QString& text) {
  std::vector<QStringList> ports;
  for (const QString& port : QORXSdfStringToList(text, QLatin1Char(',')))
    ports.push_back(QORXSdfStringToList(port, QLatin1Char(' ')));
  return ports;
}
