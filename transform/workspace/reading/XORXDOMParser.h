// The parser of workspace documents. It keeps the encoding's name and lists the elements with their
// attributes; its own tree stays empty, for hardly anybody asks for one (ElementTree makes it of the list).
// What the vocabulary gives no meaning to (text, comments, processing instructions) is left out; where such
// content stood is noted.
#pragma once

#include <transform/workspace/records/ElementTable.h>

#include <xercesc/parsers/XercesDOMParser.hpp>

#include <vector>

struct LeftOutContent {
  enum class Kind { Text, Comment, Instruction, Declaration };
  Kind kind;
  int line;  // where it ends, in the text that was parsed
};

class XORXDOMParser : public XERCES_CPP_NAMESPACE::XercesDOMParser {
 public:
  XORXDOMParser();
  ~XORXDOMParser() override;

  // The encoding that the last declaration names, else the one that the scanner detected behind it; null
  // without a declaration. Owned by the parser, valid until the next declaration.
  const XMLCh* getEncodingName() const { return m_encodingName; }
  // Forgets encoding, elements and left-out content.
  void forget();

  // Hands over the elements of the last parse, still without lines.
  ElementTable takeElements() { return std::move(m_elements); }
  // Text only when it is not blank, declarations only when they say more than version 1.0; at most some
  // thousand entries are noted.
  const std::vector<LeftOutContent>& leftOut() const { return m_leftOut; }

  void XMLDecl(const XMLCh* const version, const XMLCh* const encoding, const XMLCh* const standalone,
               const XMLCh* const actualEncoding) override;
  void startElement(const XERCES_CPP_NAMESPACE::XMLElementDecl& declaration, const unsigned int uriId,
                    const XMLCh* const prefix,
                    const XERCES_CPP_NAMESPACE::RefVectorOf<XERCES_CPP_NAMESPACE::XMLAttr>& attributes,
                    const XMLSize_t attributeCount, const bool isEmpty, const bool isRoot) override;
  void endElement(const XERCES_CPP_NAMESPACE::XMLElementDecl& declaration, const unsigned int uriId,
                  const bool isRoot, const XMLCh* const prefix) override;
  void docCharacters(const XMLCh* const text, const XMLSize_t length, const bool isCharacterData) override;
  void ignorableWhitespace(const XMLCh* const text, const XMLSize_t length,
                           const bool isCharacterData) override;
  void docComment(const XMLCh* const text) override;
  void docPI(const XMLCh* const target, const XMLCh* const data) override;

 private:
  void noteLeftOut(LeftOutContent::Kind kind);

  XMLCh* m_encodingName = nullptr;
  ElementTable m_elements;
  int m_depth = 0;
  std::vector<LeftOutContent> m_leftOut;
};
