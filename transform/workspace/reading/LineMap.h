// From the lines of a stripped document to the lines of the file that it was taken from.
#pragma once

#include <algorithm>
#include <utility>
#include <vector>

class LineMap {
 public:
  // The stripped lines from `strippedLine` on stand in the file from `fileLine` on. Called with rising lines.
  void add(int strippedLine, int fileLine) {
    if (m_runs.empty() || fileLine - strippedLine != m_runs.back().second - m_runs.back().first)
      m_runs.emplace_back(strippedLine, fileLine);
  }

  // A line that no run covers is its own.
  int fileLine(int strippedLine) const {
    const auto next =
        std::upper_bound(m_runs.begin(), m_runs.end(), strippedLine,
                         [](int line, const std::pair<int, int>& run) { return line < run.first; });
    if (next == m_runs.begin())
      return strippedLine;
    const auto& run = *std::prev(next);
    return strippedLine - run.first + run.second;
  }

 private:
  std::vector<std::pair<int, int>> m_runs;  // first lines of runs without a gap
};
