// An attribute node that keeps its value as one string. The text node that a DOM has below it comes into
// being only when someone asks for children: of the attributes of a workspace hardly any is ever asked.
#pragma once

#include <xercesc/dom/impl/DOMAttrImpl.hpp>

// Lives in the heap of its document, like every node, and is freed with it.
class CompactAttribute : public XERCES_CPP_NAMESPACE::DOMAttrImpl {
 public:
  using Node = XERCES_CPP_NAMESPACE::DOMNode;
  using Document = XERCES_CPP_NAMESPACE::DOMDocumentImpl;

  static CompactAttribute* create(Document& document, const XMLCh* name) {
    using XERCES_CPP_NAMESPACE::DOMMemoryManager;
    void* const place = document.allocate(sizeof(CompactAttribute), DOMMemoryManager::ATTR_OBJECT);
    return ::new (place) CompactAttribute(document, name);
  }

  void setValueFast(const XMLCh* value) override {
    m_value = m_document.cloneString(value);
    fNode.isSpecified(true);
  }
  void setValue(const XMLCh* value) override {
    expand();
    DOMAttrImpl::setValue(value);
  }
  const XMLCh* getValue() const override { return m_value ? m_value : DOMAttrImpl::getValue(); }
  const XMLCh* getNodeValue() const override { return getValue(); }
  const XMLCh* getTextContent() const override { return getValue(); }
  void setTextContent(const XMLCh* value) override { setValue(value); }

  Node* getFirstChild() const override { return expanded().DOMAttrImpl::getFirstChild(); }
  Node* getLastChild() const override { return expanded().DOMAttrImpl::getLastChild(); }
  XERCES_CPP_NAMESPACE::DOMNodeList* getChildNodes() const override {
    return expanded().DOMAttrImpl::getChildNodes();
  }
  bool hasChildNodes() const override { return expanded().DOMAttrImpl::hasChildNodes(); }
  Node* cloneNode(bool deep) const override { return expanded().DOMAttrImpl::cloneNode(deep); }
  bool isEqualNode(const Node* other) const override { return expanded().DOMAttrImpl::isEqualNode(other); }
  void normalize() override { expanded().DOMAttrImpl::normalize(); }
  Node* appendChild(Node* child) override { return expanded().DOMAttrImpl::appendChild(child); }
  Node* insertBefore(Node* child, Node* next) override {
    return expanded().DOMAttrImpl::insertBefore(child, next);
  }

  // Without a document type no attribute is an identifier.
  void addAttrToIDNodeMap() override {}
  void removeAttrFromIDNodeMap() override {}

 private:
  CompactAttribute(Document& document, const XMLCh* name)
      : DOMAttrImpl(&document, name), m_document(document) {}

  void expand() {
    if (const XMLCh* const value = m_value) {
      m_value = nullptr;
      DOMAttrImpl::setValueFast(value);
    }
  }
  CompactAttribute& expanded() const {
    auto& self = const_cast<CompactAttribute&>(*this);
    self.expand();
    return self;
  }

  Document& m_document;
  const XMLCh* m_value = nullptr;  // null once it stands in a text node
};
