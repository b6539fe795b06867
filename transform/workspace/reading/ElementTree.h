// The tree of a document for who asks for it: made of the table of its elements when it is first asked for.
#pragma once

#include <transform/workspace/records/ElementTable.h>

#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMElement.hpp>

#include <memory>
#include <mutex>

class ElementTree {
 public:
  // The table outlives the tree and does not change.
  explicit ElementTree(const ElementTable& elements) : m_elements(elements) {}
  ElementTree(const ElementTree&) = delete;
  ElementTree& operator=(const ElementTree&) = delete;

  // Owned by the tree; null for a table without elements. Several threads may ask.
  XERCES_CPP_NAMESPACE::DOMElement* root() const;

 private:
  struct Release {
    void operator()(XERCES_CPP_NAMESPACE::DOMDocument* document) const { document->release(); }
  };

  void build() const;

  const ElementTable& m_elements;
  mutable std::once_flag m_isBuilt;
  mutable std::unique_ptr<XERCES_CPP_NAMESPACE::DOMDocument, Release> m_document;
};
