#include <apps/orxt/CatalogueText.h>
#include <apps/orxt/Console.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/TextHelpers.h>

#include <QJsonArray>

#include <algorithm>

QString firstSentence(const QStringList& lines) {
  const QString text = lines.join(QLatin1Char(' ')).simplified();
  const int end = text.indexOf(QLatin1String(". "));
  return end < 0 ? text : text.left(end + 1);
}

QJsonObject summaryAsJson(const TransformerCfg& transformer) {
  return {{QStringLiteral("name"), transformer.getName()},
          {QStringLiteral("version"), transformer.getVersion()},
          {QStringLiteral("localizedName"), transformer.getLocalizedName()},
          {QStringLiteral("categories"), QJsonArray::fromStringList(transformer.tags())},
          {QStringLiteral("visible"), transformer.isVisible()},
          {QStringLiteral("file"), transformer.getFileName()},
          {QStringLiteral("custom"), isCustomTransformer(&transformer)},
          {QStringLiteral("summary"), firstSentence(transformer.getDescriptionLines())}};
}

QString summaryAsText(const TransformerCfg& transformer) {
  const QString summary = firstSentence(transformer.getDescriptionLines());
  if (!isCustomTransformer(&transformer))
    return summary;
  return QStringLiteral("[custom, version %1, %2] ")
             .arg(transformer.getVersion())
             .arg(transformer.getFileName()) +
         summary;
}

void printSummaries(const std::vector<const TransformerCfg*>& transformers, Console& console) {
  int width = 0;
  for (const TransformerCfg* transformer : transformers)
    width = std::max(width, transformer->getLocalizedName().size());
  for (const TransformerCfg* transformer : transformers) {
    console.print(makeColumnString(transformer->getLocalizedName(), summaryAsText(*transformer), width + 1) +
                  QLatin1Char('\n'));
  }
}
