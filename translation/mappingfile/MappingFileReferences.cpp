#include <translation/mappingfile/MappingFileReferences.h>

#include <algorithm>

namespace {

// Engines expand no deeper than this.
constexpr std::size_t kDeepest = 64;
constexpr int kLongestName = 4096;

}  // namespace

std::vector<MappingFileReference> mappingFileReferences(const QString& text) {
  std::vector<MappingFileReference> found;
  std::vector<int> open;
  const auto cutOff = [&](int at) {
    if (!open.empty())
      found.push_back({open.front(), at, false});
    open.clear();
  };
  int searched = 0;  // up to here no "]" stands behind the current place
  int i = text.indexOf(QLatin1Char('$'));
  while (i >= 0 && i < text.size()) {
    const QChar c = text.at(i);
    const QChar next = i + 1 < text.size() ? text.at(i + 1) : QChar();
    if (c == QLatin1Char('$') && next == QLatin1Char('(')) {
      if (open.size() == kDeepest)
        cutOff(i);
      open.push_back(i);
      i += 2;
    } else if (c == QLatin1Char(')') && !open.empty()) {
      const int begin = open.back();
      open.pop_back();
      // "$()" is no reference.
      if (i > begin + 2)
        found.push_back({begin, i + 1, true, false, !open.empty()});
      ++i;
    } else if (c == QLatin1Char('$') && next == QLatin1Char('[')) {
      cutOff(i);
      const int limit = std::min(text.size(), i + kLongestName);
      int close = std::max(i, searched);
      while (close < limit && text.at(close) != QLatin1Char(']'))
        ++close;
      searched = close;
      if (close < limit)
        found.push_back({i, close + 1, true, true});
      i = close < limit ? close + 1 : i + 2;
    } else {
      if (!open.empty() &&
          (c.isSpace() || c == QLatin1Char('(') || c == QLatin1Char('$') || i - open.front() > kLongestName))
        cutOff(i);
      ++i;
    }
    if (open.empty())
      i = text.indexOf(QLatin1Char('$'), i);
  }
  cutOff(text.size());
  return found;
}

QString blankReferences(const QString& text, const std::vector<MappingFileReference>& references,
                        QChar filler) {
  QString result = text;
  for (const MappingFileReference& reference : references) {
    if (reference.isClosed && !reference.isDeferred && !reference.isInside)
      std::fill(result.begin() + reference.begin, result.begin() + reference.end, filler);
  }
  return result;
}
