#include <transform/core/Keywords.h>
#include <transform/core/LookupChecks.h>
#include <transform/core/MacroText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/specialised/values/FactoryOption.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>

bool writeFactoryOption(const TransformerCfg& cfg, const QString& key, const QString& value,
                        MFBuffer& buffer) {
  const QString name =
      encodeAroundReferences(stripBasicStringInfo(cfg.getParameterValue(kIdentifierParameter)));
  const QString statement =
      kFactoryOptionStatement + QLatin1Char(' ') + name + QLatin1Char(' ') + key + QLatin1Char(' ') + value;
  if (!MFBuffer::closesDeferredMacros(statement) || !lookup_checks::isOneLine(statement) ||
      statement.endsWith(QLatin1Char('\\'))) {
    return false;
  }
  buffer.add(statement);
  buffer.flush();
  return true;
}
