#include <apps/orxt/facts/SearchText.h>

#include <algorithm>

namespace {

constexpr int kShortestStem = 4;
constexpr int kLongestEnding = 3;

// Split where a capital begins a new word.
QStringList partsOf(const QString& name) {
  QStringList result;
  int begin = 0;
  for (int i = 1; i <= name.size(); ++i) {
    if (i == name.size() || (name.at(i).isUpper() && name.at(i - 1).isLower())) {
      result << name.mid(begin, i - begin);
      begin = i;
    }
  }
  return result;
}

// What has the same stem and short endings: "points" and "point", "clipping" and "clipper"; also the stem
// within a compound: "verbinden" and "schlusselverbinder".
bool isOtherForm(const QString& word, const QString& own) {
  const auto [end, ignored] = std::mismatch(word.begin(), word.end(), own.begin(), own.end());
  const int common = static_cast<int>(end - word.begin());
  if (common >= kShortestStem)
    return std::max(word.size(), own.size()) - common <= kLongestEnding;
  if (common == own.size() && common == kShortestStem - 1)
    return word.size() == common + 1 && word.endsWith(QLatin1Char('s'));
  const int stem = std::max(word.size() - 2, kShortestStem + 1);
  return stem < word.size() && own.contains(word.left(stem));
}

}  // namespace

QStringList SearchText::pieces(const QString& text) {
  QStringList result;
  QString piece;
  for (const QChar c : text) {
    if (c.isLetterOrNumber() || c.isMark() || c.isSurrogate()) {
      piece += c;
    } else if (!piece.isEmpty()) {
      result << piece;
      piece.clear();
    }
  }
  if (!piece.isEmpty())
    result << piece;
  return result;
}

QString SearchText::folded(const QString& text) {
  QString result;
  for (const QChar c : text.toCaseFolded().normalized(QString::NormalizationForm_D)) {
    if (!c.isMark())
      result += c;
  }
  return result;
}

SearchText::SearchText(const QStringList& texts) {
  for (const QString& text : texts) {
    for (const QString& piece : pieces(text)) {
      m_words << folded(piece);
      for (const QString& part : partsOf(piece))
        m_words << folded(part);
    }
  }
  m_words.removeDuplicates();
}

SearchText::Closeness SearchText::closenessOf(const QString& word) const {
  Closeness best = kAbsent;
  if (word.isEmpty())
    return best;
  for (const QString& own : m_words) {
    if (own == word)
      return kWord;
    const int place = own.indexOf(word);
    best = std::max(best, place == 0               ? kBeginning
                          : place > 0              ? kInside
                          : isOtherForm(word, own) ? kInflected
                                                   : kAbsent);
  }
  return best;
}
