#include <apps/orxt/commands/TransformersCategoriesCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/TextTable.h>
#include <apps/orxt/facts/SearchText.h>
#include <transform/registry/TransformerMgr.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>

namespace {

constexpr CommandFacts kFacts = {"categories", "List the categories of the catalogue with their descriptions",
                                 "orxt transformers categories --lang de"};

}  // namespace

TransformersCategoriesCommand::TransformersCategoriesCommand() : Command(kFacts) {}

void TransformersCategoriesCommand::declare(CLI::App& app) {
  app.add_flag("--json", m_json, "As JSON");
  m_definitions.declare(app);
}

ExitStatus TransformersCategoriesCommand::run(Console& console) {
  const TransformerMgr& registry = m_definitions.loadCatalogue(console);
  QStringList categories = registry.getCategories();
  std::sort(categories.begin(), categories.end(), [&](const QString& left, const QString& right) {
    return SearchText::folded(registry.getLocalizedCategoryName(left)) <
           SearchText::folded(registry.getLocalizedCategoryName(right));
  });
  const auto descriptionOf = [&](const QString& category) {
    QStringList lines;
    registry.getCategoryDesc(category, lines);
    return lines.join(QLatin1Char(' ')).simplified();
  };
  if (m_json) {
    QJsonArray list;
    for (const QString& category : std::as_const(categories)) {
      QStringList names = registry.getCategoryTransformers(category);
      names.sort();
      list.append(QJsonObject{{QStringLiteral("name"), category},
                              {QStringLiteral("localizedName"), registry.getLocalizedCategoryName(category)},
                              {QStringLiteral("description"), descriptionOf(category)},
                              {QStringLiteral("transformers"), QJsonArray::fromStringList(names)}});
    }
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
    return kExitDone;
  }
  TextTable table(0);
  for (const QString& category : std::as_const(categories))
    table.addRow({registry.getLocalizedCategoryName(category), descriptionOf(category)});
  console.print(table.text());
  return kExitDone;
}
