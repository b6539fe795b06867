// The prototypes of the registry: one per name and version, the names in the order in which they came, the
// newest of each, and the categories that they are listed under.
#pragma once

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <map>
#include <memory>

class TransformerCfg;

class PrototypeTable {
 public:
  using Versions = std::map<int, std::unique_ptr<TransformerCfg>>;

  PrototypeTable();
  ~PrototypeTable();
  PrototypeTable(PrototypeTable&&) noexcept;
  PrototypeTable& operator=(PrototypeTable&&) noexcept;

  // Takes the prototype over; one that is there under its name and version is destroyed. True when it is the
  // newest of its name.
  bool add(std::unique_ptr<TransformerCfg> prototype);

  // Null when there is none. Owned by the table.
  TransformerCfg* newest(const QString& name) const;
  // The lowest version from 0 up.
  TransformerCfg* oldest(const QString& name) const;
  TransformerCfg* find(const QString& name, int version) const;
  // From the lowest version up; null for an unknown name.
  const Versions* versions(const QString& name) const;
  bool contains(const QString& name) const { return m_versions.contains(name); }

  const QStringList& names() const { return m_names; }
  // Those whose first prototype is visible.
  const QStringList& visibleNames() const { return m_visibleNames; }
  bool isVisible(const QString& name) const { return m_visibleNameSet.contains(name); }

  // In the order in which they came.
  const QStringList& categories() const { return m_categories; }
  // The names listed under the category; each once.
  QStringList namesOf(const QString& category) const { return m_categoryIndex.value(category).names; }

 private:
  struct Category {
    QStringList names;
    QSet<QString> nameSet;
  };

  // A hash copies its values, which these cannot be: they are shared, never copied.
  QHash<QString, std::shared_ptr<Versions>> m_versions;
  QStringList m_names;
  QStringList m_visibleNames;
  QSet<QString> m_visibleNameSet;
  QStringList m_categories;
  QHash<QString, Category> m_categoryIndex;
};
