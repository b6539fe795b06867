#include <apps/orxt/Console.h>
#include <apps/orxt/TransformersListCommand.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/TextHelpers.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>

namespace {

constexpr CommandFacts kFacts = {"list", "List the transformers by name",
                                 "orxt transformers list --category Geometry --lang de"};

QString firstSentence(const QStringList& lines) {
  const QString text = lines.join(QLatin1Char(' ')).simplified();
  const int end = text.indexOf(QLatin1String(". "));
  return end < 0 ? text : text.left(end + 1);
}

}  // namespace

TransformersListCommand::TransformersListCommand() : Command(kFacts) {}

void TransformersListCommand::declare(CLI::App& app) {
  app.add_option("--category", m_category, "Only those of this category")->type_name("NAME");
  app.add_flag("--all", m_all, "Also those that are no longer offered");
  app.add_flag("--json", m_json, "As JSON");
  m_definitions.declare(app);
}

ExitStatus TransformersListCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.load(console);
  const QString category = QString::fromStdString(m_category);
  QStringList wanted;
  if (!category.isEmpty()) {
    if (!registry.getCategories().contains(registry.getCategoryNameFromLocalizedCategoryName(category))) {
      console.fail(QStringLiteral("there is no category '%1'; there are: %2")
                       .arg(category, registry.getCategories().join(QLatin1String(", "))));
      return kExitRefused;
    }
    wanted = registry.getCategoryTransformers(category);
  }

  std::vector<std::unique_ptr<TransformerCfg>> found;
  registry.resetIteration();
  while (TransformerCfg* next = registry.getNextTransformer()) {
    std::unique_ptr<TransformerCfg> cfg(next);
    if ((m_all || cfg->isVisible()) && (category.isEmpty() || wanted.contains(cfg->getName())))
      found.push_back(std::move(cfg));
  }
  std::sort(found.begin(), found.end(),
            [](const auto& left, const auto& right) { return left->getName() < right->getName(); });

  if (m_json) {
    QJsonArray list;
    for (const auto& cfg : found) {
      list.append(QJsonObject{{QStringLiteral("name"), cfg->getName()},
                              {QStringLiteral("version"), cfg->getVersion()},
                              {QStringLiteral("localizedName"), cfg->getLocalizedName()},
                              {QStringLiteral("categories"), QJsonArray::fromStringList(cfg->tags())},
                              {QStringLiteral("visible"), cfg->isVisible()},
                              {QStringLiteral("file"), cfg->getFileName()},
                              {QStringLiteral("summary"), firstSentence(cfg->getDescriptionLines())}});
    }
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
    return kExitDone;
  }
  int width = 0;
  for (const auto& cfg : found)
    width = std::max(width, cfg->getLocalizedName().size());
  for (const auto& cfg : found)
    console.print(
        makeColumnString(cfg->getLocalizedName(), firstSentence(cfg->getDescriptionLines()), width + 1) +
        QLatin1Char('\n'));
  return kExitDone;
}
