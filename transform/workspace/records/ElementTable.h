// Every element of a document in document order, with its depth and the line of the file that it begins in.
// Walks over it are quicker than over the tree itself.
#pragma once

#include <transform/workspace/reading/LineMap.h>

#include <xercesc/dom/DOMElement.hpp>

#include <cstddef>
#include <vector>

class ElementTable {
 public:
  using Element = XERCES_CPP_NAMESPACE::DOMElement;
  struct Entry {
    const Element* element;  // owned by its document
    int depth;               // of the root: 0
    int line;
  };

  std::size_t size() const { return m_entries.size(); }
  const Element& element(std::size_t index) const { return *m_entries[index].element; }
  int line(std::size_t index) const { return m_entries[index].line; }

  // Calls `visit` with the index of each element child.
  template <class Visitor>
  void eachChild(std::size_t parent, Visitor&& visit) const {
    const int depth = m_entries[parent].depth + 1;
    for (std::size_t i = parent + 1; i < m_entries.size() && m_entries[i].depth >= depth; ++i) {
      if (m_entries[i].depth == depth)
        visit(i);
    }
  }

  void append(const Element* element, int depth) { m_entries.push_back({element, depth, 0}); }
  // `lines` are those of the text that was parsed, in document order.
  void setLines(const std::vector<int>& lines, const LineMap& map) {
    for (std::size_t i = 0; i < m_entries.size() && i < lines.size(); ++i)
      m_entries[i].line = map.fileLine(lines[i]);
  }

 private:
  std::vector<Entry> m_entries;
};
