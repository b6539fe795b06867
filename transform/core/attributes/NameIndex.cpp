#include <transform/core/NameIndex.h>

#include <QHash>
#include <QtAlgorithms>

#include <algorithm>

// Each slot holds one name or one node of the next level.
struct NameIndex::Node : QSharedData {
  quint16 entryBits = 0;
  quint16 branchBits = 0;
  std::vector<Entry> entries;  // in the order of their bits; in any order on the last level
  std::vector<NodePointer> branches;

  static quint16 bitOf(uint hash, int shift) { return quint16(1U << ((hash >> shift) & 15U)); }
  static std::size_t indexIn(quint16 bits, quint16 bit) {
    return qPopulationCount(quint16(bits & (bit - 1)));
  }
  static auto positionIn(quint16 bits, quint16 bit) { return std::ptrdiff_t(indexIn(bits, bit)); }

  const Node* branch(quint16 bit) const {
    return branchBits & bit ? branches[indexIn(branchBits, bit)].constData() : nullptr;
  }
  void addEntry(Entry&& entry, int shift) {
    if (shift >= kBits) {
      entries.push_back(std::move(entry));
      return;
    }
    const quint16 bit = bitOf(entry.hash, shift);
    if (branchBits & bit) {
      branches[indexIn(branchBits, bit)]->addEntry(std::move(entry), shift + kBitsOfLevel);
    } else if (entryBits & bit) {
      const auto at = entries.begin() + positionIn(entryBits, bit);
      NodePointer below(new Node);
      below->addEntry(std::move(*at), shift + kBitsOfLevel);
      below->addEntry(std::move(entry), shift + kBitsOfLevel);
      entries.erase(at);
      entryBits = quint16(entryBits & ~bit);
      branches.insert(branches.begin() + positionIn(branchBits, bit), std::move(below));
      branchBits = quint16(branchBits | bit);
    } else {
      entries.insert(entries.begin() + positionIn(entryBits, bit), std::move(entry));
      entryBits = quint16(entryBits | bit);
    }
  }
  void removeEntry(uint hash, const QString& name, int shift) {
    const quint16 bit = shift < kBits ? bitOf(hash, shift) : quint16(0);
    if (branchBits & bit) {
      branches[indexIn(branchBits, bit)]->removeEntry(hash, name, shift + kBitsOfLevel);
      return;
    }
    entries.erase(std::find_if(entries.begin(), entries.end(),
                               [&name](const Entry& entry) { return entry.name == name; }));
    entryBits = quint16(entryBits & ~bit);
  }
  void setPlace(uint hash, const QString& name, qint64 place, int shift) {
    const quint16 bit = shift < kBits ? bitOf(hash, shift) : quint16(0);
    if (branchBits & bit) {
      branches[indexIn(branchBits, bit)]->setPlace(hash, name, place, shift + kBitsOfLevel);
      return;
    }
    for (Entry& entry : entries) {
      if (entry.name == name)
        entry.place = place;
    }
  }
};

NameIndex::NameIndex() = default;
NameIndex::~NameIndex() = default;
NameIndex::NameIndex(const NameIndex& other) = default;
NameIndex& NameIndex::operator=(const NameIndex& other) = default;

namespace {

uint hashOf(const QString& name) {
  return qHash(name, uint(qGlobalQHashSeed()));
}

}  // namespace

const NameIndex::Entry* NameIndex::find(const Node* node, int shift, uint hash, const QString& name) {
  for (; node && shift < kBits; shift += kBitsOfLevel) {
    const quint16 bit = Node::bitOf(hash, shift);
    if (node->entryBits & bit) {
      const Entry& entry = node->entries[Node::indexIn(node->entryBits, bit)];
      return entry.hash == hash && entry.name == name ? &entry : nullptr;
    }
    node = node->branch(bit);
  }
  if (!node)
    return nullptr;
  const auto at = std::find_if(node->entries.begin(), node->entries.end(),
                               [&name](const Entry& entry) { return entry.name == name; });
  return at == node->entries.end() ? nullptr : &*at;
}

const NameIndex::Entry* NameIndex::find(const QString& name) const {
  return m_size == 0 ? nullptr : find(m_root.constData(), 0, hashOf(name), name);
}

void NameIndex::insert(const QString& name, qint64 place) {
  const uint hash = hashOf(name);
  if (m_size == 0)
    m_root = new Node;
  if (find(m_root.constData(), 0, hash, name)) {
    m_root->setPlace(hash, name, place, 0);
    return;
  }
  m_root->addEntry({name, hash, place}, 0);
  ++m_size;
  m_hash ^= hash;
  m_characters += name.size();
}

void NameIndex::remove(const QString& name) {
  const uint hash = hashOf(name);
  if (m_size == 0 || !find(m_root.constData(), 0, hash, name))
    return;
  m_hash ^= hash;
  m_characters -= name.size();
  if (--m_size == 0)
    m_root = nullptr;
  else
    m_root->removeEntry(hash, name, 0);
}

void NameIndex::collect(const Node& node, Entries& entries) {
  for (const Entry& entry : node.entries)
    entries.push_back(&entry);
  for (const NodePointer& branch : node.branches)
    collect(*branch, entries);
}

void NameIndex::collect(Entries& entries) const {
  if (m_size > 0)
    collect(*m_root, entries);
}

bool NameIndex::collectMissing(const Node& node, const Node* other, int shift, std::size_t most,
                               Entries& missing) {
  if (&node == other)
    return true;
  for (const Entry& entry : node.entries) {
    if (!find(other, shift, entry.hash, entry.name))
      missing.push_back(&entry);
  }
  std::size_t at = 0;
  for (quint16 bits = node.branchBits; bits && missing.size() <= most; bits = quint16(bits & (bits - 1))) {
    const quint16 bit = quint16(bits & -bits);
    const Node& branch = *node.branches[at++];
    const Entry* single =
        other && other->entryBits & bit ? &other->entries[Node::indexIn(other->entryBits, bit)] : nullptr;
    if (!single) {
      collectMissing(branch, other ? other->branch(bit) : nullptr, shift + kBitsOfLevel, most, missing);
      continue;
    }
    const std::size_t before = missing.size();
    collect(branch, missing);
    missing.erase(std::remove_if(missing.begin() + std::ptrdiff_t(before), missing.end(),
                                 [&](const Entry* entry) { return entry->name == single->name; }),
                  missing.end());
  }
  return missing.size() <= most;
}

bool NameIndex::collectMissing(const NameIndex& other, std::size_t most, Entries& missing) const {
  return m_size == 0 ||
         collectMissing(*m_root, other.m_size == 0 ? nullptr : other.m_root.constData(), 0, most, missing);
}
