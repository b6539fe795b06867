#include <transform/core/AttributeSet.h>
#include <transform/core/Keywords.h>

#include <algorithm>

namespace {

// Lists of lists go no deeper; every level of a name costs a copy of it.
constexpr int kDeepestList = 16;

// "LIST{12}.NAME" with its indexes taken out.
QString withoutIndexes(const QString& name) {
  QString result;
  result.reserve(name.size());
  for (int i = 0; i < name.size(); ++i) {
    result.append(name.at(i));
    if (name.at(i) != QLatin1Char('{')) {
      continue;
    }
    int end = i + 1;
    while (end < name.size() && name.at(end).isDigit()) {
      ++end;
    }
    if (end < name.size() && name.at(end) == QLatin1Char('}')) {
      i = end - 1;
    }
  }
  return result;
}

NameIndex::Entries inOrder(NameIndex::Entries entries) {
  std::sort(entries.begin(), entries.end(), [](const NameIndex::Entry* left, const NameIndex::Entry* right) {
    return left->place < right->place;
  });
  return entries;
}

QStringList namesOf(NameIndex::Entries entries) {
  QStringList names;
  names.reserve(int(entries.size()));
  for (const NameIndex::Entry* entry : inOrder(std::move(entries)))
    names.append(entry->name);
  return names;
}

}  // namespace

const NameIndex::Entry* AttributeSet::find(const QString& name) const {
  return (name.contains(kListMark) ? m_members : m_plain).find(name);
}

QStringList AttributeSet::names() const {
  NameIndex::Entries entries;
  entries.reserve(std::size_t(size()));
  m_plain.collect(entries);
  m_members.collect(entries);
  return namesOf(std::move(entries));
}

bool AttributeSet::holds(const QString& reference) const {
  if (contains(reference) || m_lists.find(reference))
    return true;
  if (!reference.contains(QLatin1Char('{')))
    return false;
  const QString name = withoutIndexes(reference);
  return contains(name) || m_lists.find(name);
}

bool operator==(const AttributeSet& left, const AttributeSet& right) {
  if (left.m_plain.isSharedWith(right.m_plain) && left.m_members.isSharedWith(right.m_members))
    return true;
  return left.size() == right.size() && left.hash() == right.hash() && left.names() == right.names();
}

void AttributeSet::insert(const QString& name, qint64 place) {
  if (name.contains(kMacroOpen))
    m_open.insert(name, place);
  if (!name.contains(kListMark)) {
    m_plain.insert(name, place);
    return;
  }
  m_members.insert(name, place);
  int mark = name.indexOf(kListMemberMark);
  for (int depth = 0; mark >= 0 && depth < kDeepestList; ++depth) {
    const QString list = name.left(mark + kListMark.size());
    if (!m_lists.find(list))
      m_lists.insert(list, 0);
    mark = name.indexOf(kListMemberMark, mark + 1);
  }
}

void AttributeSet::add(const QString& name) {
  if (!contains(name))
    insert(name, m_last++);
}

void AttributeSet::add(const QStringList& names) {
  for (const QString& name : names)
    add(name);
}

void AttributeSet::add(const AttributeSet& other) {
  if (isEmpty()) {
    *this = other;
    return;
  }
  const auto most = std::size_t(size());
  NameIndex::Entries missing;
  if (!other.m_plain.collectMissing(m_plain, most, missing) ||
      !other.m_members.collectMissing(m_members, most, missing)) {
    setInFrontOf(other);
    return;
  }
  for (const NameIndex::Entry* entry : inOrder(std::move(missing)))
    insert(entry->name, m_last++);
}

void AttributeSet::setInFrontOf(AttributeSet other) {
  const QStringList own = names();
  for (auto name = own.crbegin(); name != own.crend(); ++name)
    other.insert(*name, --other.m_first);
  *this = std::move(other);
}

QStringList AttributeSet::missingIn(const AttributeSet& other) const {
  NameIndex::Entries entries;
  m_plain.collectMissing(other.m_plain, std::size_t(size()), entries);
  m_members.collectMissing(other.m_members, std::size_t(size()), entries);
  return namesOf(std::move(entries));
}

QStringList AttributeSet::withReferences() const {
  NameIndex::Entries entries;
  m_open.collect(entries);
  return namesOf(std::move(entries));
}

void AttributeSet::rename(const QString& name, const QString& other) {
  const NameIndex::Entry* entry = find(name);
  if (!entry || name == other)
    return;
  const qint64 place = entry->place;
  (name.contains(kListMark) ? m_members : m_plain).remove(name);
  m_open.remove(name);
  const NameIndex::Entry* present = find(other);
  if (!other.isEmpty() && (!present || present->place > place))
    insert(other, place);
}

AttributeSet AttributeSet::withoutLists() const {
  AttributeSet result = *this;
  result.m_members = result.m_lists = NameIndex();
  const QStringList open = m_open.size() == 0 ? QStringList() : withReferences();
  for (const QString& name : open) {
    if (name.contains(kListMark))
      result.m_open.remove(name);
  }
  return result;
}

AttributeSet AttributeSet::only(const QSet<QString>& wanted) const {
  NameIndex::Entries entries;
  for (const QString& name : wanted) {
    if (const NameIndex::Entry* entry = find(name))
      entries.push_back(entry);
  }
  AttributeSet result;
  for (const NameIndex::Entry* entry : inOrder(std::move(entries)))
    result.add(entry->name);
  return result;
}
