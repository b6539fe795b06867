// The transformers of the registry: one per name and version, the names in the order in which they came, the
// newest of each, the categories that they are listed under, and their other names.
#pragma once

#include <transform/registry/catalogue/CatalogueEntry.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <functional>
#include <map>
#include <memory>
#include <unordered_map>

class PrototypeTable {
 public:
  using Versions = std::map<int, CatalogueEntry>;

  // What decides where a transformer stands in the table.
  struct Place {
    QString name;
    int version = 0;
    QStringList tags;
    bool isVisible = true;
    QStringList aliases;
  };

  // One that is there under the name and version is destroyed; an alias keeps its first owner. `isNewest`,
  // when given, tells whether it is the newest of its name. The entry stays where it is.
  CatalogueEntry& add(const Place& place, CatalogueEntry entry, bool* isNewest = nullptr);

  // Puts a companion's texts in the place of those of the transformers that it speaks of.
  void localize(const std::shared_ptr<const CompanionEntry>& companion);

  // Null when there is none; owned by the table. The newest version is the highest, the oldest the lowest
  // from 0 up.
  const CatalogueEntry* find(const QString& name, int version) const;
  // From the lowest version up; null for an unknown name.
  const Versions* versions(const QString& name) const;

  const QStringList& names() const { return m_names; }
  // Those that were visible when they first came.
  const QStringList& visibleNames() const { return m_visibleNames; }
  bool isVisible(const QString& name) const { return m_visibleNameSet.contains(name); }

  // In the order in which they came.
  const QStringList& categories() const { return m_categories; }
  // The names listed under the category; each once.
  QStringList namesOf(const QString& category) const { return m_categoryIndex.value(category).names; }

  bool isAlias(const QString& alias) const { return m_aliases.contains(alias); }
  // Empty when it is none.
  QString nameOfAlias(const QString& alias) const { return m_aliases.value(alias); }
  // Whether `isFound` holds for the name, or for one that its alias leads to. A circle of them leads nowhere.
  bool followAliases(const QString& name, const std::function<bool(const QString&)>& isFound) const;
  // Of an alias that is no visible transformer's own name, whether its transformer is visible.
  bool isVisibleAlias(const QString& alias) const;
  // Those of visible transformers, sorted.
  QStringList aliasesOfVisible() const;

 private:
  struct Category {
    QStringList names;
    QSet<QString> nameSet;
  };

  void list(const QString& name, const QStringList& tags);

  std::unordered_map<QString, Versions> m_versions;
  QStringList m_names;
  QStringList m_visibleNames;
  QSet<QString> m_visibleNameSet;
  QStringList m_categories;
  QHash<QString, Category> m_categoryIndex;
  QHash<QString, QString> m_aliases;
};
