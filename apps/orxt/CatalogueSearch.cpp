#include <apps/orxt/CatalogueSearch.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>

#include <algorithm>

namespace {

bool holds(const QStringList& texts, const QString& word) {
  return std::any_of(texts.begin(), texts.end(),
                     [&](const QString& text) { return text.contains(word, Qt::CaseInsensitive); });
}

}  // namespace

CatalogueSearch::CatalogueSearch(const QStringList& words)
    : m_words(words.join(QLatin1Char(' ')).simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts)),
      m_phrase(m_words.join(QString())) {}

bool CatalogueSearch::judge(const TransformerCfg& transformer, const TransformerMgr& registry,
                            Place& place) const {
  const QStringList names{transformer.getName(), transformer.getLocalizedName()};
  for (const QString& name : names) {
    if (QString(name).remove(QLatin1Char(' ')).compare(m_phrase, Qt::CaseInsensitive) == 0) {
      place = Place::ExactName;
      return true;
    }
  }
  const QStringList aliases = transformer.aliases();
  QStringList categories = transformer.tags();
  for (const QString& tag : transformer.tags())
    categories << registry.getLocalizedCategoryName(tag);
  const QString description = transformer.getDescriptionLines().join(QLatin1Char(' '));
  place = Place::Name;
  for (const QString& word : m_words) {
    if (holds(names, word))
      continue;
    if (holds(aliases, word))
      place = std::max(place, Place::Alias);
    else if (holds(categories, word))
      place = std::max(place, Place::Category);
    else if (description.contains(word, Qt::CaseInsensitive))
      place = Place::Description;
    else
      return false;
  }
  return true;
}

std::vector<CatalogueSearch::Hit> CatalogueSearch::find(TransformerMgr& registry, bool all) const {
  std::vector<Hit> hits;
  if (m_words.isEmpty())
    return hits;
  registry.resetIteration();
  while (TransformerCfg* next = registry.getNextTransformer()) {
    std::unique_ptr<TransformerCfg> transformer(next);
    Place place = Place::Description;
    if ((all || transformer->isVisible()) && judge(*transformer, registry, place))
      hits.push_back({place, std::move(transformer)});
  }
  std::sort(hits.begin(), hits.end(), [](const Hit& left, const Hit& right) {
    return left.place != right.place ? left.place < right.place
                                     : left.transformer->getName() < right.transformer->getName();
  });
  return hits;
}
