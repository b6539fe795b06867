// The parameter records of one configuration object: one contiguous vector, found by name, in definition
// order.
//
// Copying copies the vector once and shares everything else; the addresses of records stay put while no
// parameter is added or removed.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformParamCfg.h>

#include <QSet>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class ORX_EXPORT ParameterSet {
 public:
  ParameterSet();

  const QStringList& names() const;
  std::vector<TransformParamCfg>& records() { return m_records; }
  const std::vector<TransformParamCfg>& records() const { return m_records; }

  // By exact name; -1 when there is none.
  int indexOf(const QString& name) const;
  // By exact name, else the first multi-parameter, in name order, that lists it; -1 when there is none.
  int indexOfMacro(const QString& name) const;

  // The record's name must be new.
  void append(const TransformParamCfg& record);
  // False when there is no such parameter.
  bool remove(const QString& name);
  void remove(const QSet<QString>& names);
  void clear();

 private:
  struct Index;
  void reindex();

  std::vector<TransformParamCfg> m_records;
  std::shared_ptr<Index> m_index;  // never null; not changed while copies share it
};
