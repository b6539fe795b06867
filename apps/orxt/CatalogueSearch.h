// Finds transformers by words in their names and texts.
#pragma once

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
    Place place;
    std::unique_ptr<TransformerCfg> transformer;
  };

  // Upper and lower case are the same; a text with blanks counts as several words.
  explicit CatalogueSearch(const QStringList& words);

  bool isEmpty() const { return m_words.isEmpty(); }
  // The newest version of each transformer in which every word is found, best first, then by name. Those that
  // are no longer offered count when `all` is set.
  std::vector<Hit> find(TransformerMgr& registry, bool all) const;

 private:
  // False when a word is found nowhere.
  bool judge(const TransformerCfg& transformer, const TransformerMgr& registry, Place& place) const;

  QStringList m_words;
  QString m_phrase;  // the words without blanks between them, as a name would have them
};
