#include <transform/workspace/reading/ElementTree.h>
#include <transform/workspace/writing/XmlText.h>

#include <xercesc/dom/DOMImplementation.hpp>

#include <vector>

using namespace XERCES_CPP_NAMESPACE;

DOMElement* ElementTree::root() const {
  std::call_once(m_isBuilt, [this] { build(); });
  return m_document ? m_document->getDocumentElement() : nullptr;
}

void ElementTree::build() const {
  if (m_elements.size() == 0)
    return;
  m_document.reset(DOMImplementation::getImplementation()->createDocument());
  std::vector<DOMNode*> open = {m_document.get()};
  for (std::size_t i = 0; i < m_elements.size(); ++i) {
    DOMElement* const element = m_document->createElement(toXml(m_elements.name(i)));
    m_elements.eachAttribute(i, [&](const ElementTable::Attribute& attribute) {
      element->setAttribute(toXml(attribute.name), toXml(attribute.value));
    });
    open.resize(static_cast<std::size_t>(m_elements.depth(i)) + 1);
    open.back()->appendChild(element);
    open.push_back(element);
  }
}
