// Substitution in the order of the contract: token by token over all lines, so that an inserted text may
// bring a token that is substituted later. Keeps an index of where plain tokens stand, so that lines without
// the token are not visited.
//
// A line that a substitution leaves blank goes away at once; lines that were blank before stay.
#pragma once

#include <transform/core/generation/Substitution.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class OrderedSubstitution : public Substitution {
 public:
  explicit OrderedSubstitution(const QStringList& lines);

  bool contains(const QString& token) const override;
  void substitute(const QString& token, const QString& value) override;
  void removeLinesWith(const QString& token) override;
  void removeOutput(const QString& tag) override { removeOutputClause(tag, false); }
  // The clause of one output, from each line that begins it to the line that ends it.
  void removeOutputClause(const QString& tag, bool wildcard);

  // A substitution would have grown beyond all measure and was left out.
  bool isTooLarge() const { return m_isTooLarge; }
  QStringList lines() const override;

 private:
  // Texts that insert each other grow without end. So all lines together may grow by what stands in them from
  // the start, each token as often as it does, by as many times each inserted text as the factor says, and by
  // the allowance.
  static constexpr qint64 kAllowance = 1024 * 1024;
  static constexpr qint64 kFactor = 64;

  void scan(int line, bool countsTokens);
  // The lines that may hold the token and did so when they were scanned, each once, in order.
  std::vector<int> candidates(const QString& token) const;
  bool holds(int line, const QString& reference) const;
  void remove(int line) { m_removed[static_cast<std::size_t>(line)] = true; }
  void removeClauseFrom(int line, const QString& end, const QString& start, bool wildcard);

  QStringList m_lines;
  std::vector<bool> m_removed;
  QHash<QString, std::vector<int>> m_where;
  QHash<QString, int> m_counts;  // of the plain tokens that stood there from the start
  qint64 m_size = 0;
  qint64 m_largestSize = kAllowance;
  bool m_hasOddTokens = false;  // some line holds what only a token that is not plain can match
  bool m_isTooLarge = false;
};
