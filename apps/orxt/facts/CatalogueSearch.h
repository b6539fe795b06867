// Finds transformers by words in their names and texts.
#pragma once

#include <apps/orxt/facts/SearchText.h>

#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class TransformerCfg;
class TransformerMgr;

class CatalogueSearch {
 public:
  // Where the words were found, best first. A hit is as good as the worst place that one of its words needs.
  enum class Place { ExactName, Name, Alias, Category, Description };

  struct Hit {
    Place place = Place::Name;
    int wordsHeld = 0;
    int closeness = 0;  // of all words together; more is better
    int nameLength = 0;
    std::unique_ptr<TransformerCfg> transformer;
  };

  // Every run of letters and digits is a word; those such as "the" do not count where there are others.
  explicit CatalogueSearch(const QStringList& words);

  bool isEmpty() const { return m_words.isEmpty(); }
  // The newest version of each transformer that holds the most of the words, best first, then by name. None
  // when a word stands nowhere. Those that are no longer offered count when `all` is set.
  std::vector<Hit> find(TransformerMgr& registry, bool all);

  // Of the last find(). Words that stand nowhere in the catalogue, as they were given.
  const QStringList& unknownWords() const { return m_unknown; }
  // Words that were taken for others because they stand nowhere: the word given, the word taken, by turns.
  const QStringList& misspeltWords() const { return m_misspelt; }
  // Whether no transformer holds all words.
  bool isPartial() const { return m_isPartial; }

 private:
  struct Candidate;

  std::vector<Candidate> candidates(TransformerMgr& registry, bool all) const;
  // The word itself when it stands somewhere, else one that is spelt nearly alike; empty when there is none.
  QString meantWord(const QString& word, const std::vector<Candidate>& candidates) const;
  // The words to look for, each as it was meant.
  QStringList knownWords(const std::vector<Candidate>& candidates);
  Hit judge(const Candidate& candidate, const QStringList& words) const;

  QStringList m_words;
  QStringList m_unknown;
  QStringList m_misspelt;
  bool m_isPartial = false;
};
