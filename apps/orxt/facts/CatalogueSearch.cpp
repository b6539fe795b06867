#include <apps/orxt/facts/CatalogueSearch.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/NearestSpelling.h>

#include <QSet>

#include <algorithm>
#include <array>
#include <tuple>

namespace {

// A word in a better place outweighs how closely it is found in a worse one.
constexpr int kPlaceWeight = SearchText::kWord + 1;
// Of a shorter word too little is left when a letter is wrong.
constexpr int kLongWord = 5;

// Words that say nothing about what is sought, in the languages of the catalogue; folded.
bool isFiller(const QString& word) {
  static const QSet<QString> fillers = [] {
    const QStringList words = QStringLiteral(
                                  "a an and at by for from in into of on or the to with "
                                  "als am an auf aus bei das dem den der die ein eine einen fur im in mit "
                                  "nach oder um und von zu zum zur "
                                  "au aux avec dans de des du en et la le les ou par pour sur un une")
                                  .split(QLatin1Char(' '));
    return QSet<QString>(words.begin(), words.end());
  }();
  return fillers.contains(SearchText::folded(word));
}

// Who has no umlauts writes two letters.
QString withoutDigraphs(QString word) {
  for (const char* umlaut : {"ae", "oe", "ue"})
    word.replace(QLatin1String(umlaut), QLatin1String(umlaut, 1));
  return word;
}

}  // namespace

struct CatalogueSearch::Candidate {
  // The texts of every place but the first, which is a whole name.
  static constexpr std::array<Place, 4> kPlaces = {Place::Name, Place::Alias, Place::Category,
                                                   Place::Description};

  bool hold(const QString& word) const {
    return std::any_of(texts.begin(), texts.end(),
                       [&](const SearchText& text) { return text.closenessOf(word) != SearchText::kAbsent; });
  }

  std::unique_ptr<TransformerCfg> transformer;
  std::array<SearchText, kPlaces.size()> texts;
};

CatalogueSearch::CatalogueSearch(const QStringList& words)
    : m_words(SearchText::pieces(words.join(QLatin1Char(' ')))) {
  const auto fillers = std::stable_partition(m_words.begin(), m_words.end(),
                                             [](const QString& word) { return !isFiller(word); });
  if (fillers != m_words.begin())
    m_words.erase(fillers, m_words.end());
}

std::vector<CatalogueSearch::Candidate> CatalogueSearch::candidates(TransformerMgr& registry,
                                                                    bool all) const {
  std::vector<Candidate> result;
  for (std::unique_ptr<TransformerCfg>& transformer : offeredTransformers(registry, all)) {
    QStringList categories = transformer->tags();
    for (const QString& tag : transformer->tags())
      categories << registry.getLocalizedCategoryName(tag);
    result.push_back({nullptr,
                      {SearchText({transformer->getName(), transformer->getLocalizedName()}),
                       SearchText(transformer->aliases()), SearchText(categories),
                       SearchText(transformer->getDescriptionLines())}});
    result.back().transformer = std::move(transformer);
  }
  return result;
}

QString CatalogueSearch::meantWord(const QString& word, const std::vector<Candidate>& candidates) const {
  const auto isHeld = [&](const QString& asked) {
    return std::any_of(candidates.begin(), candidates.end(),
                       [&](const Candidate& candidate) { return candidate.hold(asked); });
  };
  if (isHeld(word))
    return word;
  const QString plain = withoutDigraphs(word);
  if (isHeld(plain))
    return plain;
  NearestSpelling spelling;
  const bool isLong = word.size() >= kLongWord;
  for (std::size_t place = 0; place < Candidate::kPlaces.size(); ++place) {
    QStringList vocabulary;
    for (const Candidate& candidate : candidates)
      vocabulary << candidate.texts[place].words();
    // Descriptions hold so many words that one of them is near to anything.
    const int mostEdits = (Candidate::kPlaces[place] == Place::Description ? 0 : 1) + (isLong ? 1 : 0);
    QString meant = mostEdits == 0 ? QString() : spelling.find(word, vocabulary, mostEdits);
    if (meant.isEmpty() && isLong) {
      QStringList beginnings;
      for (const QString& known : vocabulary)
        beginnings << known.left(word.size()) << known.left(word.size() + 1);
      meant = spelling.find(word, beginnings, 1);
    }
    if (!meant.isEmpty())
      return meant;
  }
  return QString();
}

QStringList CatalogueSearch::knownWords(const std::vector<Candidate>& candidates) {
  m_unknown.clear();
  m_misspelt.clear();
  QStringList result;
  for (const QString& given : m_words) {
    const QString word = SearchText::folded(given);
    const QString meant = meantWord(word, candidates);
    if (meant.isEmpty())
      m_unknown << given;
    else if (meant != word && meant != withoutDigraphs(word))
      m_misspelt << given << meant;
    result << meant;
  }
  return result;
}

CatalogueSearch::Hit CatalogueSearch::judge(const Candidate& candidate, const QStringList& words) const {
  Hit hit;
  for (const QString& word : words) {
    for (std::size_t place = 0; place < Candidate::kPlaces.size(); ++place) {
      const SearchText::Closeness closeness = candidate.texts[place].closenessOf(word);
      if (closeness == SearchText::kAbsent)
        continue;
      ++hit.wordsHeld;
      hit.place = std::max(hit.place, Candidate::kPlaces[place]);
      hit.closeness += closeness + kPlaceWeight * static_cast<int>(Candidate::kPlaces.size() - place);
      break;
    }
  }
  const QString phrase = words.join(QString());
  const TransformerCfg& transformer = *candidate.transformer;
  for (const QString& name : {transformer.getName(), transformer.getLocalizedName()}) {
    if (SearchText::folded(name).remove(QLatin1Char(' ')) == phrase) {
      hit.place = Place::ExactName;
      hit.wordsHeld = words.size();
    }
  }
  // Of names that hold the words, the shorter one says less else.
  hit.nameLength = hit.place == Place::Name ? candidate.texts[0].words().size() : 0;
  return hit;
}

std::vector<CatalogueSearch::Hit> CatalogueSearch::find(TransformerMgr& registry, bool all) {
  std::vector<Hit> hits;
  m_isPartial = false;
  std::vector<Candidate> candidates = this->candidates(registry, all);
  const QStringList words = knownWords(candidates);
  if (words.isEmpty() || !m_unknown.isEmpty())
    return hits;
  int most = 1;
  for (Candidate& candidate : candidates) {
    Hit hit = judge(candidate, words);
    if (hit.wordsHeld < most)
      continue;
    if (hit.wordsHeld > most) {
      most = hit.wordsHeld;
      hits.clear();
    }
    hit.transformer = std::move(candidate.transformer);
    hits.push_back(std::move(hit));
  }
  m_isPartial = !hits.empty() && most < words.size();
  const auto rank = [](const Hit& hit) {
    return std::make_tuple(hit.place, -hit.closeness, hit.nameLength, hit.transformer->getName());
  };
  std::sort(hits.begin(), hits.end(),
            [&](const Hit& left, const Hit& right) { return rank(left) < rank(right); });
  return hits;
}
