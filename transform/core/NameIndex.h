// An immutable index of names that shares its parts with the indexes that it was made of: a trie over the
// bits of hash values, whose nodes are copied when a changed index does not own them alone. Each name has a
// place.
#pragma once

#include <platform/Export.h>

#include <QSharedData>
#include <QSharedDataPointer>
#include <QString>

#include <cstddef>
#include <vector>

class ORX_EXPORT NameIndex {
 public:
  struct Entry {
    QString name;
    uint hash;
    qint64 place;
  };
  using Entries = std::vector<const Entry*>;  // valid while an index that holds them is not changed

  NameIndex();
  ~NameIndex();
  NameIndex(const NameIndex& other);
  NameIndex& operator=(const NameIndex& other);

  int size() const { return m_size; }
  // Null when the name is not there.
  const Entry* find(const QString& name) const;
  // Adds the name, or gives it another place.
  void insert(const QString& name, qint64 place);
  void remove(const QString& name);
  // Of all names, whatever their places.
  uint hash() const { return m_hash; }
  qint64 characters() const { return m_characters; }
  bool isSharedWith(const NameIndex& other) const { return m_root.constData() == other.m_root.constData(); }
  void collect(Entries& entries) const;
  // What stands here and not in `other`. Parts that both share cost nothing. Gives up, with false, when it
  // finds more than `most`.
  bool collectMissing(const NameIndex& other, std::size_t most, Entries& missing) const;

 private:
  struct Node;
  using NodePointer = QSharedDataPointer<Node>;

  // Hash values are used up after this many levels; names of one hash value stand in one row there.
  static constexpr int kBitsOfLevel = 4;
  static constexpr int kBits = 32;

  static const Entry* find(const Node* node, int shift, uint hash, const QString& name);
  static bool collectMissing(const Node& node, const Node* other, int shift, std::size_t most,
                             Entries& missing);
  static void collect(const Node& node, Entries& entries);

  NodePointer m_root;  // null when empty
  int m_size = 0;
  uint m_hash = 0;
  qint64 m_characters = 0;
};
