#include <platform/qorxcore/qorxcore.h>
#include <transform/custom/AttributeCopies.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>
#include <translation/generation/RouteStatement.h>

#include <QSet>

void writeRoute(MFBuffer& buffer, const QString& factoryName, const QStringList& from, const QString& to,
                const QStringList& functions) {
  buffer.add(QString(kTeeFactoryStatement));
  buffer.add(QLatin1String("  FACTORY_NAME ") + quotifyStringForMF(factoryName));
  QSet<QString> named;
  for (const QString& flow : from) {
    if (named.contains(flow))
      continue;
    named.insert(flow);
    buffer.add(QLatin1String("  INPUT FEATURE_TYPE ") + quotifyStringForMF(flow));
  }
  buffer.add(QLatin1String("  OUTPUT FEATURE_TYPE ") + quotifyStringForMF(to));
  for (const QString& function : functions)
    buffer.add(QLatin1String("    ") + function);
  buffer.flush();
}

QString copyAttributesFunction(const AttributeCopies& copies) {
  QStringList arguments;
  for (const auto& [to, from] : copies.sources())
    arguments << QORXWwjdEncode(to) << QORXWwjdEncode(from);
  return arguments.isEmpty()
             ? QString()
             : QLatin1String("@CopyAttribute(") + arguments.join(QLatin1Char(',')) + QLatin1Char(')');
}

void writeCopies(MFBuffer& buffer, const QString& from, const QString& to, const QString& function) {
  writeRoute(buffer, to + QLatin1String(" Attribute Copier"), {from}, to, {function});
}
