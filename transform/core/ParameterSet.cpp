#include <transform/core/ParameterSet.h>

#include <QHash>

#include <algorithm>
#include <utility>

struct ParameterSet::Index {
  QStringList names;
  QHash<QString, int> positions;
  std::vector<int> inNameOrder;
};

ParameterSet::ParameterSet() {
  static const std::shared_ptr<Index> empty = std::make_shared<Index>();
  m_index = empty;
}

const QStringList& ParameterSet::names() const {
  return m_index->names;
}

int ParameterSet::indexOf(const QString& name) const {
  return m_index->positions.value(name, -1);
}

int ParameterSet::indexOfMacro(const QString& name) const {
  const int exact = indexOf(name);
  if (exact >= 0) {
    return exact;
  }
  // The members are asked for, not indexed: a record's type may change behind our back.
  for (const int position : m_index->inNameOrder) {
    const TransformParamCfg& record = m_records[static_cast<std::size_t>(position)];
    if (record.isMultiParameter() && record.getMacroNames().contains(name)) {
      return position;
    }
  }
  return -1;
}

void ParameterSet::append(const TransformParamCfg& record) {
  m_records.push_back(record);
  if (m_index.use_count() > 1) {
    reindex();
    return;
  }
  Index& index = *m_index;
  const int position = static_cast<int>(m_records.size()) - 1;
  const QString& name = record.getName();
  index.names.append(name);
  index.positions.insert(name, position);
  const auto at = std::upper_bound(
      index.inNameOrder.begin(), index.inNameOrder.end(), name,
      [this](const QString& n, int p) { return n < m_records[static_cast<std::size_t>(p)].getName(); });
  index.inNameOrder.insert(at, position);
}

bool ParameterSet::remove(const QString& name) {
  const int position = indexOf(name);
  if (position < 0) {
    return false;
  }
  m_records.erase(m_records.begin() + position);
  reindex();
  return true;
}

void ParameterSet::remove(const QSet<QString>& names) {
  const auto end =
      std::remove_if(m_records.begin(), m_records.end(),
                     [&names](const TransformParamCfg& record) { return names.contains(record.getName()); });
  if (end != m_records.end()) {
    m_records.erase(end, m_records.end());
    reindex();
  }
}

void ParameterSet::clear() {
  m_records.clear();
  m_index = ParameterSet().m_index;
}

void ParameterSet::reindex() {
  auto index = std::make_shared<Index>();
  const int count = static_cast<int>(m_records.size());
  index->names.reserve(count);
  index->positions.reserve(count);
  index->inNameOrder.reserve(m_records.size());
  for (int position = 0; position < count; ++position) {
    const QString& name = m_records[static_cast<std::size_t>(position)].getName();
    index->names.append(name);
    index->positions.insert(name, position);
    index->inNameOrder.push_back(position);
  }
  std::sort(index->inNameOrder.begin(), index->inNameOrder.end(), [this](int left, int right) {
    return m_records[static_cast<std::size_t>(left)].getName() <
           m_records[static_cast<std::size_t>(right)].getName();
  });
  m_index = std::move(index);
}
