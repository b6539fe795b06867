#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/TextTable.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/NearestSpelling.h>

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
  return nearest.isEmpty() ? otherwise : QStringLiteral("did you mean '%1'?").arg(nearest);
}

std::unique_ptr<TransformerCfg> findTransformer(TransformerMgr& registry, const QString& name, int version,
                                                QString& error) {
  std::unique_ptr<TransformerCfg> found(registry.getTransformer(name, version));
  if (found)
    return found;
  error = registry.refusalReason();
  if (!error.isEmpty())
    return nullptr;
  const std::unique_ptr<TransformerCfg> newest(
      registry.getTransformer(name, ITransformerMgr::NEWEST_VERSION));
  if (newest) {
    QStringList versions;
    for (const int known : registry.transformerVersions(newest->getName()))
      versions << QString::number(known);
    error = QStringLiteral("'%1' has no version %2; the newest is %3, and there are: %4")
                .arg(name)
                .arg(version)
                .arg(newest->getVersion())
                .arg(versions.join(QLatin1String(", ")));
    return nullptr;
  }
  QStringList names = registry.transformerNames() + registry.getVisibleTransformerAliases();
  for (const auto& transformer : offeredTransformers(registry, true)) {
    if (transformer->getLocalizedName() == name && transformer->getName() != name)
      return findTransformer(registry, transformer->getName(), version, error);
    names << transformer->getLocalizedName();
  }
  error = QStringLiteral("there is no transformer '%1'; %2")
              .arg(name, orNearest(name, names, QStringLiteral("`orxt transformers list` names them all")));
  return nullptr;
}
