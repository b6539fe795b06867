#include "RandomRecords.h"

#include <cmath>

double RandomRecords::real() {
  const double choices[] = {
      0, below(2000) - 1000.0, 0.1 * below(100), std::uniform_real_distribution<double>(-1e6, 1e6)(m_engine),
      std::ldexp(std::uniform_real_distribution<double>(-1, 1)(m_engine), below(2000) - 1000)};
  return choices[below(5)];
}

QString RandomRecords::text() {
  static const QString special =
      QString::fromUtf8("\t\n\r <>&'\"/=%{}$()\\;,!#-]") + QChar(0x85) + QChar(0x2028);
  const int length = below(12) == 0 ? 0 : below(200) == 0 ? 20000 : below(20);
  QString text(QLatin1String(""));
  while (text.size() < length) {
    const uint beyond = 0x10000u + static_cast<uint>(below(0x100000));
    const QString choices[] = {special.at(below(special.size())),    QChar(0xa0 + below(0x60)),
                               QChar(0x100 + below(0xd800 - 0x100)), QChar(0xe000 + below(0xfffe - 0xe000)),
                               QString::fromUcs4(&beyond, 1),        QChar(' ' + below(95))};
    text += choices[below(6)];
  }
  return text;
}

QString RandomRecords::name() {
  QString name(QLatin1Char('A' + static_cast<char>(below(26))));
  for (int count = below(8); count > 0; --count)
    name += below(4) == 0 ? QChar(0xe9) : QChar('a' + below(26));
  return name;
}

void RandomRecords::fillSpecial(FeatureTypeStruct& record) {
  DynamicSchemaInfo& info = record.dynamicSchemaInfo;
  info.setFeatureTypeMode(below(4));
  info.setFeatureTypeName(text());
  info.setDefinitionMode(below(4));
  info.setDefinitionName(text());
  info.setGeometryMode(below(4));
  info.setGeometryName(text());
  QStringList names;
  for (int count = below(3); count > 0; --count)
    names.append(text());
  info.setAttributesToRemove(names);
}

void RandomRecords::fillSpecial(GlobalParameterStruct& record) {
  record.isStandAlone = flag();
  record.isServer = flag();
}

void RandomRecords::fillSpecial(SubDocumentIOStruct& record) {
  record.isSource = static_cast<SubDocumentIOKind>(below(3));
  if (!record.attributes.isEmpty())
    record.attributes.first().attrValue = QString();
}
