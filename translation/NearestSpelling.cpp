#include <translation/NearestSpelling.h>

#include <algorithm>
#include <array>

namespace {

constexpr int kMostCandidates = 1000;
constexpr int kLongestName = 64;

// The edits that lead from one text to the other; `limit` + 1 stands for any larger number.
int editDistance(const QString& from, const QString& to, int limit) {
  using Row = std::array<int, kLongestName + 1>;
  Row rows[3];
  Row* beforeLast = &rows[0];
  Row* last = &rows[1];
  Row* row = &rows[2];
  // Only cells within `limit` of the diagonal can be reached by so few edits.
  for (Row& cells : rows)
    cells.fill(limit + 1);
  for (int column = 0; column <= std::min(to.size(), limit); ++column)
    (*last)[static_cast<std::size_t>(column)] = column;
  for (int i = 1; i <= from.size(); ++i) {
    const int first = std::max(1, i - limit);
    const int end = std::min(to.size(), i + limit);
    (*row)[static_cast<std::size_t>(first - 1)] = first == 1 ? std::min(i, limit + 1) : limit + 1;
    int least = (*row)[static_cast<std::size_t>(first - 1)];
    for (int j = first; j <= end; ++j) {
      const auto column = static_cast<std::size_t>(j);
      const bool isSame = from.at(i - 1) == to.at(j - 1);
      int edits =
          std::min({(*last)[column] + 1, (*row)[column - 1] + 1, (*last)[column - 1] + (isSame ? 0 : 1)});
      if (i > 1 && j > 1 && from.at(i - 1) == to.at(j - 2) && from.at(i - 2) == to.at(j - 1))
        edits = std::min(edits, (*beforeLast)[column - 2] + 1);
      (*row)[column] = edits;
      least = std::min(least, edits);
    }
    if (least > limit)
      return limit + 1;
    if (end < to.size())
      (*row)[static_cast<std::size_t>(end) + 1] = limit + 1;
    Row* const free = beforeLast;
    beforeLast = last;
    last = row;
    row = free;
  }
  return std::min((*last)[static_cast<std::size_t>(to.size())], limit + 1);
}

}  // namespace

QString NearestSpelling::find(const QString& name, const QStringList& candidates, int mostEdits) {
  const QString wanted = name.toCaseFolded();
  if (wanted.isEmpty() || wanted.size() > kLongestName)
    return QString();
  int limit = std::min(mostEdits, wanted.size() < 4 ? 1 : wanted.size() < 9 ? 2 : 3);
  QString nearest;
  const int count = std::min({candidates.size(), kMostCandidates, m_budget});
  m_budget -= count;
  for (int i = 0; i < count; ++i) {
    const QString candidate = candidates.at(i).toCaseFolded();
    if (candidate.size() > kLongestName || std::abs(candidate.size() - wanted.size()) > limit)
      continue;
    const int distance = editDistance(wanted, candidate, limit);
    // A name of which nothing is left is not the one that was meant.
    if (distance > limit || distance >= wanted.size())
      continue;
    nearest = candidates.at(i);
    if (distance == 0)
      break;
    limit = distance - 1;
  }
  return nearest;
}
