#include <transform/workspace/reading/XORXDOMParser.h>

#include <xercesc/internal/XMLScanner.hpp>
#include <xercesc/util/XMLString.hpp>
#include <xercesc/util/XMLUni.hpp>

using namespace XERCES_CPP_NAMESPACE;

namespace {
constexpr std::size_t kLeftOutEntries = 10000;

QStringView viewOf(const XMLCh* text) {
  return {text, static_cast<qsizetype>(XMLString::stringLen(text))};
}
}  // namespace

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

void XORXDOMParser::startElement(const XMLElementDecl& declaration, const unsigned int, const XMLCh* const,
                                 const RefVectorOf<XMLAttr>& attributes, const XMLSize_t attributeCount,
                                 const bool isEmpty, const bool) {
  m_elements.append(viewOf(declaration.getFullName()), m_depth);
  for (XMLSize_t i = 0; i < attributeCount; ++i) {
    const XMLAttr& attribute = *attributes.elementAt(i);
    m_elements.appendAttribute(viewOf(attribute.getName()), viewOf(attribute.getValue()));
  }
  // The end of an empty element is not reported.
  if (!isEmpty)
    ++m_depth;
}

void XORXDOMParser::endElement(const XMLElementDecl&, const unsigned int, const bool, const XMLCh* const) {
  --m_depth;
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
