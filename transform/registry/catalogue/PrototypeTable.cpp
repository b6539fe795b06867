#include <transform/core/TransformerSource.h>
#include <transform/registry/catalogue/PrototypeTable.h>
#include <transform/registry/loading/CompanionFileParser.h>

#include <utility>

CatalogueEntry& PrototypeTable::add(const Place& place, CatalogueEntry entry, bool* isNewest) {
  Versions& versions = m_versions[place.name];
  if (versions.empty()) {
    m_names.append(place.name);
    if (place.isVisible) {
      m_visibleNames.append(place.name);
      m_visibleNameSet.insert(place.name);
    }
  }
  const bool becomesNewest = versions.empty() || place.version >= versions.rbegin()->first;
  if (becomesNewest) {
    list(place.name, place.tags);
  }
  if (isNewest) {
    *isNewest = becomesNewest;
  }
  for (const QString& alias : place.aliases) {
    if (!m_aliases.contains(alias)) {
      m_aliases.insert(alias, place.name);
    }
  }
  return versions.insert_or_assign(place.version, std::move(entry)).first->second;
}

void PrototypeTable::list(const QString& name, const QStringList& tags) {
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

void PrototypeTable::localize(const std::shared_ptr<const CompanionEntry>& companion) {
  const auto versions = m_versions.find(companion->name);
  if (versions == m_versions.end()) {
    return;
  }
  for (auto& [version, entry] : versions->second) {
    if (!companion->hasVersion || companion->version == version) {
      entry.localize(companion);
    }
  }
}

const CatalogueEntry* PrototypeTable::find(const QString& name, int version) const {
  const Versions* all = versions(name);
  if (!all) {
    return nullptr;
  }
  const auto found = version == TransformerSource::kNewestVersion   ? std::prev(all->end())
                     : version == TransformerSource::kOldestVersion ? all->lower_bound(0)
                                                                    : all->find(version);
  return found == all->end() ? nullptr : &found->second;
}

bool PrototypeTable::followAliases(const QString& name,
                                   const std::function<bool(const QString&)>& isFound) const {
  QSet<QString> followed;
  for (QString asked = name; !followed.contains(asked); asked = nameOfAlias(asked)) {
    if (isFound(asked)) {
      return true;
    }
    if (!isAlias(asked)) {
      return false;
    }
    followed.insert(asked);
  }
  return false;
}

const PrototypeTable::Versions* PrototypeTable::versions(const QString& name) const {
  const auto found = m_versions.find(name);
  return found == m_versions.end() ? nullptr : &found->second;
}

bool PrototypeTable::isVisibleAlias(const QString& alias) const {
  return !isVisible(alias) && isAlias(alias) && isVisible(nameOfAlias(alias));
}

QStringList PrototypeTable::aliasesOfVisible() const {
  QStringList result;
  for (auto alias = m_aliases.cbegin(); alias != m_aliases.cend(); ++alias) {
    if (isVisible(alias.value())) {
      result.append(alias.key());
    }
  }
  result.sort();
  return result;
}
