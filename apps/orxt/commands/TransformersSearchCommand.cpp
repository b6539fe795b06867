#include <apps/orxt/commands/TransformersSearchCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/CatalogueSearch.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>

namespace messages = orx::messages;

namespace {

constexpr CommandFacts kFacts = {
    "search", "Find transformers by words in names, aliases, categories and descriptions, best first",
    "orxt transformers search clip area\n"
    "orxt transformers search --lang de Geometrie"};

const char* placeName(CatalogueSearch::Place place) {
  switch (place) {
    case CatalogueSearch::Place::ExactName:
      return "exactName";
    case CatalogueSearch::Place::Name:
      return "name";
    case CatalogueSearch::Place::Alias:
      return "alias";
    case CatalogueSearch::Place::Category:
      return "category";
    case CatalogueSearch::Place::Description:
      break;
  }
  return "description";
}

}  // namespace

TransformersSearchCommand::TransformersSearchCommand() : Command(kFacts) {}

void TransformersSearchCommand::declare(CLI::App& app) {
  app.add_option("word", m_words, "Words to be found; case, accents and endings do not count")
      ->type_name("WORD")
      ->required();
  app.add_flag("--all", m_all, "Also those that are no longer offered");
  app.add_flag("--json", m_json, "As JSON");
  m_definitions.declare(app);
}

ExitStatus TransformersSearchCommand::run(Console& console) {
  QStringList words;
  for (const std::string& word : m_words)
    words << QString::fromStdString(word);
  CatalogueSearch search(words);
  if (search.isEmpty()) {
    console.fail(messages::kNeedsWord);
    return kExitUsage;
  }
  const std::vector<CatalogueSearch::Hit> hits = search.find(m_definitions.loadCatalogue(console), m_all);
  if (!search.unknownWords().isEmpty()) {
    console.fail(messages::kWordUnknown, {search.unknownWords().join(TransformResString(messages::kWordOr))});
  }
  for (int i = 0; !hits.empty() && i + 1 < search.misspeltWords().size(); i += 2) {
    console.fail(messages::kWordMisspelt, {search.misspeltWords().at(i), search.misspeltWords().at(i + 1)});
  }
  if (search.isPartial())
    console.fail(messages::kSomeWordsOnly);
  if (m_json) {
    QJsonArray list;
    for (const CatalogueSearch::Hit& hit : hits) {
      QJsonObject entry = summaryAsJson(*hit.transformer);
      entry.insert(QStringLiteral("foundIn"), QLatin1String(placeName(hit.place)));
      list.append(entry);
    }
    console.print(QString::fromUtf8(QJsonDocument(list).toJson()));
  } else {
    std::vector<const TransformerCfg*> transformers;
    for (const CatalogueSearch::Hit& hit : hits)
      transformers.push_back(hit.transformer.get());
    printSummaries(transformers, console);
  }
  return hits.empty() ? kExitRefused : kExitDone;
}
