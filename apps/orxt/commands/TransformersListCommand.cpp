#include <apps/orxt/commands/TransformersListCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <apps/orxt/facts/SearchText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>

#include <algorithm>

namespace messages = orx::messages;

namespace {

constexpr CommandFacts kFacts = {"list", "List the transformers by name",
                                 "orxt transformers list --category Geometry --lang de"};

}  // namespace

TransformersListCommand::TransformersListCommand() : Command(kFacts) {}

void TransformersListCommand::declare(CLI::App& app) {
  app.add_option("--category", m_category, "Only those of this category")->type_name("NAME");
  app.add_flag("--all", m_all, "Also those that are no longer offered");
  app.add_flag("--json", m_json, "As JSON");
  m_definitions.declare(app);
}

ExitStatus TransformersListCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.loadCatalogue(console);
  const QString category = QString::fromStdString(m_category);
  QStringList wanted;
  if (!category.isEmpty()) {
    if (!registry.getCategories().contains(registry.getCategoryNameFromLocalizedCategoryName(category))) {
      QStringList shown;
      for (const QString& known : registry.getCategories())
        shown << registry.getLocalizedCategoryName(known);
      const QString all = TransformResString(messages::kThereAre, shown.join(QLatin1String(", ")));
      console.fail(messages::kNoCategoryNamed,
                   {category, orNearest(category, shown + registry.getCategories(), all)});
      return kExitRefused;
    }
    wanted = registry.getCategoryTransformers(category);
  }

  std::vector<std::unique_ptr<TransformerCfg>> found = offeredTransformers(registry, m_all);
  if (!category.isEmpty()) {
    found.erase(std::remove_if(found.begin(), found.end(),
                               [&](const auto& cfg) { return !wanted.contains(cfg->getName()); }),
                found.end());
  }
  if (m_json) {
    QJsonArray list;
    for (const auto& cfg : found)
      list.append(summaryAsJson(*cfg));
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
    return kExitDone;
  }
  std::vector<const TransformerCfg*> transformers;
  transformers.reserve(found.size());
  for (const auto& cfg : found)
    transformers.push_back(cfg.get());
  // By the names that are shown, letters with and without accents alike.
  std::stable_sort(transformers.begin(), transformers.end(), [](const auto* left, const auto* right) {
    return SearchText::folded(left->getLocalizedName()) < SearchText::folded(right->getLocalizedName());
  });
  printSummaries(transformers, console);
  return kExitDone;
}
