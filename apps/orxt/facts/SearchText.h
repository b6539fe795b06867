// A text taken apart into words, as a search sees it. Upper and lower case, and letters with and without
// accents, are alike.
#pragma once

#include <QString>
#include <QStringList>

class SearchText {
 public:
  // How well a word is found, best last.
  enum Closeness {
    kAbsent,
    kInflected,  // another form of a word: a plural, another ending
    kInside,     // within a word
    kBeginning,  // at the beginning of a word
    kWord,
  };

  SearchText() = default;
  // Names such as "AreaClipper" count as one word and as the words that they are made of.
  explicit SearchText(const QStringList& texts);

  // `word` is folded.
  Closeness closenessOf(const QString& word) const;
  // Folded; by their first appearance, each once.
  const QStringList& words() const { return m_words; }

  static QString folded(const QString& text);
  // The runs of letters and digits.
  static QStringList pieces(const QString& text);

 private:
  QStringList m_words;
};
