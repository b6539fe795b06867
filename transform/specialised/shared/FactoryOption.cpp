#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/specialised/shared/FactoryOption.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

bool writeFactoryOption(const TransformerCfg& cfg, const QString& key, const QString& value,
                        MFBuffer& buffer) {
  const QString name =
      encodeAroundReferences(stripBasicStringInfo(cfg.getParameterValue(kIdentifierParameter)));
  const QString statement =
      kFactoryOptionStatement + QLatin1Char(' ') + name + QLatin1Char(' ') + key + QLatin1Char(' ') + value;
  if (TextPlaces::refuse(TextPlace::MacroValue, statement) != 0) {
    return false;
  }
  buffer.add(statement);
  buffer.flush();
  return true;
}
