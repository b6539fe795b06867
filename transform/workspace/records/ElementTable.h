// Every element of a document in document order: its name, its attributes in their order, its depth, and the
// line of the file that it begins in. It is all that is kept of a document; who wants a tree gets one made of
// it (ElementTree).
#pragma once

#include <transform/workspace/reading/LineMap.h>
#include <transform/workspace/records/TextPool.h>
#include <transform/workspace/records/Vocabulary.h>

#include <cstddef>
#include <deque>
#include <vector>

class ElementTable {
 public:
  struct Attribute {
    QString name;
    QString value;
  };

  std::size_t size() const { return m_entries.size(); }
  const QString& name(std::size_t index) const { return m_entries[index].name; }
  bool isNamed(std::size_t index, const Word& word) const { return name(index) == word.view(); }
  int depth(std::size_t index) const { return m_entries[index].depth; }  // of the root: 0
  int line(std::size_t index) const { return m_entries[index].line; }

  template <class Visitor>
  void eachAttribute(std::size_t index, Visitor&& visit) const {
    const std::size_t end =
        index + 1 < m_entries.size() ? m_entries[index + 1].firstAttribute : m_attributes.size();
    for (std::size_t i = m_entries[index].firstAttribute; i < end; ++i)
      visit(m_attributes[i]);
  }
  // Empty without the attribute.
  QString attribute(std::size_t index, const Word& word) const {
    QString value;
    eachAttribute(index, [&](const Attribute& attribute) {
      if (attribute.name == word.view())
        value = attribute.value;
    });
    return value;
  }

  // Calls `visit` with the index of each element child.
  template <class Visitor>
  void eachChild(std::size_t parent, Visitor&& visit) const {
    const int depth = m_entries[parent].depth + 1;
    for (std::size_t i = parent + 1; i < m_entries.size() && m_entries[i].depth >= depth; ++i) {
      if (m_entries[i].depth == depth)
        visit(i);
    }
  }

  void append(QStringView name, int depth) {
    m_entries.push_back({m_texts.shared(name), m_attributes.size(), depth, 0});
  }
  // To the last element.
  void appendAttribute(QStringView name, QStringView value) {
    m_attributes.push_back({m_texts.shared(name), m_texts.shared(value)});
  }
  // `lines` are those of the text that was parsed, in document order.
  void setLines(const std::vector<int>& lines, const LineMap& map) {
    for (std::size_t i = 0; i < m_entries.size() && i < lines.size(); ++i)
      m_entries[i].line = map.fileLine(lines[i]);
  }

 private:
  struct Entry {
    QString name;
    std::size_t firstAttribute;
    int depth;
    int line;
  };

  // Grow without being copied: a document may hold millions.
  std::deque<Entry> m_entries;
  std::deque<Attribute> m_attributes;
  TextPool m_texts;
};
