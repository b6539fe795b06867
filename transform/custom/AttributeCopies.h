// Attributes that go on along one link under other names, all at once: what arrives as `to` is what left as
// `from`. Names that no copy gives stay as they are.
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeSet.h>

#include <QString>

#include <map>

class ORX_EXPORT AttributeCopies {
 public:
  bool isEmpty() const { return m_sources.empty(); }
  void add(const QString& from, const QString& to) { m_sources[to] = from; }
  // For each name that is given, in order, the one it is taken from.
  const std::map<QString, QString>& sources() const { return m_sources; }
  // What arrives when `leaving` leaves.
  AttributeSet applied(const AttributeSet& leaving) const;

 private:
  std::map<QString, QString> m_sources;
};
