#include <transform/workspace/reading/CompactAttribute.h>
#include <transform/workspace/reading/XORXDOMParser.h>

#include <xercesc/dom/DOMElement.hpp>
#include <xercesc/internal/XMLScanner.hpp>
#include <xercesc/util/XMLString.hpp>
#include <xercesc/util/XMLUni.hpp>

using namespace XERCES_CPP_NAMESPACE;

namespace {
constexpr std::size_t kLeftOutEntries = 10000;
}

XORXDOMParser::XORXDOMParser() {
  // The scanner that knows nothing of document types, schemas and entities: the quickest, and nothing that a
  // document says can make it open anything.
  useScanner(XMLUni::fgWFXMLScanner);
  setValidationScheme(Val_Never);
  setDoNamespaces(false);
  setDoSchema(false);
  setLoadExternalDTD(false);
  setDisableDefaultEntityResolution(true);
  setCreateEntityReferenceNodes(false);
  setCreateCommentNodes(false);
  setCalculateSrcOfs(false);
}

XORXDOMParser::~XORXDOMParser() {
  XMLString::release(&m_encodingName);
}

void XORXDOMParser::forget() {
  XMLString::release(&m_encodingName);
  m_encodingName = nullptr;
  m_elements = ElementTable();
  m_depth = 0;
  m_leftOut.clear();
}

void XORXDOMParser::XMLDecl(const XMLCh* const version, const XMLCh* const encoding,
                            const XMLCh* const standalone, const XMLCh* const actualEncoding) {
  XMLString::release(&m_encodingName);
  const bool isDeclared = encoding && *encoding;
  m_encodingName = XMLString::replicate(isDeclared ? encoding : actualEncoding);
  if (!XMLString::equals(version, XMLUni::fgVersion1_0) || (standalone && *standalone))
    noteLeftOut(LeftOutContent::Kind::Declaration);
  XercesDOMParser::XMLDecl(version, encoding, standalone, actualEncoding);
}

void XORXDOMParser::startElement(const XMLElementDecl& declaration, const unsigned int uriId,
                                 const XMLCh* const prefix, const RefVectorOf<XMLAttr>& attributes,
                                 const XMLSize_t attributeCount, const bool isEmpty, const bool isRoot) {
  const int depth = m_depth++;
  // Of an empty element the base also reports the end.
  XercesDOMParser::startElement(declaration, uriId, prefix, attributes, attributeCount, isEmpty, isRoot);
  m_elements.append(static_cast<const DOMElement*>(fCurrentNode), depth);
}

void XORXDOMParser::endElement(const XMLElementDecl& declaration, const unsigned int uriId, const bool isRoot,
                               const XMLCh* const prefix) {
  --m_depth;
  XercesDOMParser::endElement(declaration, uriId, isRoot, prefix);
}

void XORXDOMParser::docCharacters(const XMLCh* const text, const XMLSize_t length, const bool) {
  for (XMLSize_t i = 0; i < length; ++i) {
    const XMLCh unit = text[i];
    if (unit != u' ' && unit != u'\n' && unit != u'\r' && unit != u'\t') {
      noteLeftOut(LeftOutContent::Kind::Text);
      return;
    }
  }
}

DOMAttr* XORXDOMParser::createAttr(const XMLCh* name) {
  return CompactAttribute::create(*fDocument, name);
}

void XORXDOMParser::ignorableWhitespace(const XMLCh* const, const XMLSize_t, const bool) {}

void XORXDOMParser::docComment(const XMLCh* const) {
  noteLeftOut(LeftOutContent::Kind::Comment);
}

void XORXDOMParser::docPI(const XMLCh* const, const XMLCh* const) {
  noteLeftOut(LeftOutContent::Kind::Instruction);
}

void XORXDOMParser::noteLeftOut(LeftOutContent::Kind kind) {
  if (m_leftOut.size() < kLeftOutEntries)
    m_leftOut.push_back({kind, static_cast<int>(getScanner()->getLocator()->getLineNumber())});
}
