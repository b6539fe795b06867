// The attributes that reach one place of a workspace, each once, in the order of their first appearance.
//
// A value: copies share their data, and so do sets that were made of each other. Along a chain in which every
// transformer adds a name, each set costs its own name alone.
#pragma once

#include <platform/Export.h>
#include <transform/core/NameIndex.h>

#include <QSet>
#include <QString>
#include <QStringList>

class ORX_EXPORT AttributeSet {
 public:
  AttributeSet() = default;
  explicit AttributeSet(const QStringList& names) { add(names); }

  bool isEmpty() const { return size() == 0; }
  int size() const { return m_plain.size() + m_members.size(); }
  // Of all names together.
  qint64 characters() const { return m_plain.characters() + m_members.characters(); }
  // The list, made anew for who asks: its cost is that of all names.
  QStringList names() const;
  // The same names in the same order; compared one by one only where the sets do not share their data.
  friend ORX_EXPORT bool operator==(const AttributeSet& left, const AttributeSet& right);
  bool contains(const QString& name) const { return find(name) != nullptr; }
  // As contains(); a list also counts as present when a member is, an element "LIST{3}.NAME" when the list's
  // member is.
  bool holds(const QString& reference) const;

  // What is there already keeps its place.
  void add(const QString& name);
  void add(const QStringList& names);
  // The names of `other` stand behind those of this set. The cost is that of the names in which the two
  // differ, and at most that of the smaller set.
  void add(const AttributeSet& other);

  QStringList missingIn(const AttributeSet& other) const;
  // The names that hold references to macros, in order.
  QStringList withReferences() const;
  // Puts another name in the place of one that is there; takes it out when the other is empty.
  void rename(const QString& name, const QString& other);

  AttributeSet withoutLists() const;
  // Those among the `wanted`, in the order of this set.
  AttributeSet only(const QSet<QString>& wanted) const;

 private:
  const NameIndex::Entry* find(const QString& name) const;
  NameIndex& indexOf(const QString& name);
  void insert(const QString& name, qint64 place);
  uint hash() const { return m_plain.hash() ^ m_members.hash(); }
  friend uint qHash(const AttributeSet& set, uint seed = 0) { return set.hash() ^ seed; }
  void setInFrontOf(AttributeSet other);

  NameIndex m_plain;
  NameIndex m_members;  // of lists
  NameIndex m_lists;    // the lists that have members
  NameIndex m_open;     // those of all that hold references to macros
  qint64 m_first = 0;   // places lie in [m_first, m_last)
  qint64 m_last = 0;
};
