// The file line of every element of a document. Elements are asked for in document order, each search going
// on from where the last one ended, so that a walk over a document is linear.
#pragma once

#include <transform/workspace/LineMap.h>

#include <xercesc/dom/DOMElement.hpp>

#include <vector>

class ElementLines {
 public:
  using Element = XERCES_CPP_NAMESPACE::DOMElement;

  ElementLines() = default;
  // Both in document order. `elements` belongs to the parser and outlives this object.
  ElementLines(const std::vector<const Element*>& elements, std::vector<int> lines, const LineMap& map)
      : m_elements(&elements), m_lines(std::move(lines)) {
    for (int& line : m_lines)
      line = map.fileLine(line);
  }

  // The element's place in document order, at or behind `cursor`, which moves there; `cursor` stays and the
  // line is 0 when it is not found.
  int lineOf(const Element* element, std::size_t& cursor) const {
    const std::size_t count = m_elements ? m_elements->size() : 0;
    for (std::size_t i = cursor; i < count; ++i) {
      if ((*m_elements)[i] == element) {
        cursor = i;
        return i < m_lines.size() ? m_lines[i] : 0;
      }
    }
    return 0;
  }

 private:
  const std::vector<const Element*>* m_elements = nullptr;
  std::vector<int> m_lines;
};
