#include "RandomRecords.h"

#include <cmath>

double RandomRecords::real() {
  switch (below(5)) {
    case 0:
      return below(2000) - 1000;
    case 1:
      return std::uniform_real_distribution<double>(-1e6, 1e6)(m_engine);
    case 2:
      return std::ldexp(std::uniform_real_distribution<double>(-1, 1)(m_engine), below(2000) - 1000);
    case 3:
      return 0.1 * below(100);
    default:
      return 0;
  }
}

QString RandomRecords::text() {
  static const QString special =
      QString::fromUtf8("\t\n\r <>&'\"/=%{}$()\\;,!#-]") + QChar(0x85) + QChar(0x2028);
  const int length = below(12) == 0 ? 0 : below(200) == 0 ? 20000 : below(20);
  QString text(QLatin1String(""));
  while (text.size() < length) {
    switch (below(6)) {
      case 0:
        text += special[below(special.size())];
        break;
      case 1:
        text += QChar(0xa0 + below(0x60));
        break;
      case 2:
        text += QChar(0x100 + below(0xd800 - 0x100));
        break;
      case 3:
        text += QChar(0xe000 + below(0xfffe - 0xe000));
        break;
      case 4: {
        const uint code = 0x10000u + static_cast<uint>(below(0x100000));
        text += QChar(QChar::highSurrogate(code));
        text += QChar(QChar::lowSurrogate(code));
        break;
      }
      default:
        text += QChar(' ' + below(95));
    }
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
