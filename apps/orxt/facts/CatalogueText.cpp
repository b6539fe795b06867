#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/TextTable.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/NearestSpelling.h>

#include <QJsonArray>

#include <algorithm>

namespace messages = orx::messages;

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
  return TransformResString(messages::kCustomMark,
                            {QString::number(transformer.getVersion()), transformer.getFileName()}) +
         summary;
}

void printSummaries(const std::vector<const TransformerCfg*>& transformers, Console& console) {
  TextTable table(0);
  for (const TransformerCfg* transformer : transformers)
    table.addRow({transformer->getLocalizedName(), summaryAsText(*transformer)});
  console.print(table.text());
}

std::vector<std::unique_ptr<TransformerCfg>> offeredTransformers(TransformerMgr& registry, bool all) {
  std::vector<std::unique_ptr<TransformerCfg>> result;
  registry.resetIteration();
  while (TransformerCfg* next = registry.getNextTransformer()) {
    std::unique_ptr<TransformerCfg> transformer(next);
    if (all || transformer->isVisible())
      result.push_back(std::move(transformer));
  }
  std::sort(result.begin(), result.end(),
            [](const auto& left, const auto& right) { return left->getName() < right->getName(); });
  return result;
}

QString orNearest(const QString& name, const QStringList& candidates, const QString& otherwise) {
  const QString nearest = NearestSpelling().find(name, candidates);
  return nearest.isEmpty() ? otherwise : TransformResString(messages::kDidYouMean, nearest);
}

std::unique_ptr<TransformerCfg> findTransformer(TransformerMgr& registry, const QString& name, int version,
                                                QString& error) {
  error.clear();
  std::unique_ptr<TransformerCfg> found = registry.makeTransformer(name, version, &error);
  if (found || !error.isEmpty())
    return found;
  const std::unique_ptr<TransformerCfg> newest(
      registry.getTransformer(name, ITransformerMgr::NEWEST_VERSION));
  if (newest) {
    QStringList versions;
    for (const int known : registry.transformerVersions(newest->getName()))
      versions << QString::number(known);
    error = TransformResString(messages::kNoVersionAmong,
                               {name, QString::number(version), QString::number(newest->getVersion()),
                                versions.join(QLatin1String(", "))});
    return nullptr;
  }
  QStringList names = registry.transformerNames() + registry.getVisibleTransformerAliases();
  for (const auto& transformer : offeredTransformers(registry, true)) {
    if (transformer->getLocalizedName() == name && transformer->getName() != name)
      return findTransformer(registry, transformer->getName(), version, error);
    names << transformer->getLocalizedName();
  }
  error = TransformResString(messages::kNoTransformerNamed,
                             {name, orNearest(name, names, TransformResString(messages::kListNamesAll))});
  return nullptr;
}
