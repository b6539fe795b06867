#include <transform/core/TransformerCfg.h>
#include <transform/registry/PrototypeTable.h>

PrototypeTable::PrototypeTable() = default;
PrototypeTable::~PrototypeTable() = default;
PrototypeTable::PrototypeTable(PrototypeTable&&) noexcept = default;
PrototypeTable& PrototypeTable::operator=(PrototypeTable&&) noexcept = default;

bool PrototypeTable::add(std::unique_ptr<TransformerCfg> prototype) {
  const QString name = prototype->getName();
  const int version = prototype->getVersion();
  std::shared_ptr<Versions>& versions = m_versions[name];
  if (!versions) {
    versions = std::make_shared<Versions>();
    m_names.append(name);
    if (prototype->isVisible()) {
      m_visibleNames.append(name);
      m_visibleNameSet.insert(name);
    }
  }
  const bool isNewest = versions->empty() || version >= versions->rbegin()->first;
  if (isNewest) {
    const QStringList tags = prototype->tags();
    for (const QString& tag : tags) {
      const auto known = m_categoryIndex.find(tag);
      if (known == m_categoryIndex.end()) {
        m_categories.append(tag);
      }
      Category& category = known == m_categoryIndex.end() ? m_categoryIndex[tag] : *known;
      if (!category.nameSet.contains(name)) {
        category.nameSet.insert(name);
        category.names.append(name);
      }
    }
  }
  (*versions)[version] = std::move(prototype);
  return isNewest;
}

TransformerCfg* PrototypeTable::newest(const QString& name) const {
  const Versions* all = versions(name);
  return all ? all->rbegin()->second.get() : nullptr;
}

TransformerCfg* PrototypeTable::oldest(const QString& name) const {
  const Versions* all = versions(name);
  if (!all) {
    return nullptr;
  }
  const auto lowest = all->lower_bound(0);
  return lowest == all->end() ? nullptr : lowest->second.get();
}

TransformerCfg* PrototypeTable::find(const QString& name, int version) const {
  const Versions* all = versions(name);
  if (!all) {
    return nullptr;
  }
  const auto found = all->find(version);
  return found == all->end() ? nullptr : found->second.get();
}

const PrototypeTable::Versions* PrototypeTable::versions(const QString& name) const {
  const auto found = m_versions.constFind(name);
  return found == m_versions.constEnd() ? nullptr : found->get();
}
