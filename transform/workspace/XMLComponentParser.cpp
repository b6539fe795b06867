#include <platform/qorxcore/Local8Bit.h>
#include <transform/files/TemporaryFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLComponentParser.h>
#include <transform/workspace/reading/DecodedInputSource.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/reading/ElementTree.h>
#include <transform/workspace/reading/FileLines.h>
#include <transform/workspace/reading/WorkspaceSplitter.h>
#include <transform/workspace/reading/XORXDOMParser.h>
#include <transform/workspace/reading/XercesPlatform.h>
#include <transform/workspace/records/ElementTable.h>
#include <transform/workspace/records/ValueText.h>
#include <transform/workspace/writing/XmlText.h>

#include <QBuffer>
#include <QFile>
#include <QRegularExpression>
#include <xercesc/dom/DOMAttr.hpp>
#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/dom/DOMException.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/framework/XMLPScanToken.hpp>
#include <xercesc/sax/ErrorHandler.hpp>
#include <xercesc/sax/SAXParseException.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/XMLException.hpp>

namespace messages = orx::messages;

using namespace XERCES_CPP_NAMESPACE;

namespace {

// An XML declaration is shorter than this in any encoding.
constexpr int kFirstBytes = 1024;
const char* const kEmbeddedDocument = "#! <?xml version";

QString supportSentence() {
  return QLatin1String("\n\n") + documentText(messages::kContactSupport);
}

WorkspaceLoaderException placedError(const QString& message, int line, int column) {
  return WorkspaceLoaderException(messages::kParseErrorAt,
                                  {QString::number(line), QString::number(column), message}, line, column,
                                  supportSentence());
}

WorkspaceLoaderException generalError(const QString& message) {
  return WorkspaceLoaderException(messages::kParseError, {message}, 0, 0, supportSentence());
}

class ThrowingHandler : public ErrorHandler {
 public:
  void warning(const SAXParseException&) override {}
  void error(const SAXParseException& exception) override { throw SAXParseException(exception); }
  void fatalError(const SAXParseException& exception) override { throw SAXParseException(exception); }
  void resetErrors() override {}
};

// Sets the parser's handler for as long as a parse runs.
class HandlerScope {
 public:
  explicit HandlerScope(XercesDOMParser& parser) : m_parser(parser) { parser.setErrorHandler(&m_handler); }
  ~HandlerScope() { m_parser.setErrorHandler(nullptr); }
  HandlerScope(const HandlerScope&) = delete;
  HandlerScope& operator=(const HandlerScope&) = delete;

 private:
  XercesDOMParser& m_parser;
  ThrowingHandler m_handler;
};

const DOMElement* asElement(const DOMNode* node) {
  return node && node->getNodeType() == DOMNode::ELEMENT_NODE ? static_cast<const DOMElement*>(node)
                                                              : nullptr;
}

template <class Value>
Value attributeValue(const QString& name, const DOMNode* node, const Value& defaultValue) {
  Value value = defaultValue;
  const DOMElement* const element = asElement(node);
  if (const DOMAttr* const attribute = element ? element->getAttributeNode(toXml(name)) : nullptr)
    valuetext::read(QStringView(attribute->getValue()), value);
  return value;
}

bool firstLineHasMarkup(QIODevice& device) {
  char unit = 0;
  QByteArray chunk;
  do {
    chunk = device.read(kFirstBytes);
    for (const char byte : qAsConst(chunk)) {
      unit = byte;
      if (unit == '<' || unit == '\n')
        return unit == '<';
    }
  } while (!chunk.isEmpty());
  return false;
}

}  // namespace

IXMLComponentParser::~IXMLComponentParser() = default;

std::unique_ptr<IXMLComponentParser> IXMLComponentParser::create() {
  return std::make_unique<XMLComponentParser>();
}

XMLComponentParser::XMLComponentParser()
    : m_elements(std::make_unique<ElementTable>()), m_map(std::make_unique<LineMap>()) {
  ensureXercesPlatform();
  m_parser = std::make_unique<XORXDOMParser>();
}

XMLComponentParser::~XMLComponentParser() = default;

void XMLComponentParser::documentParsed() {}
void XMLComponentParser::documentForgotten() {}

void XMLComponentParser::ReadInput(const QString& fileName) {
  forgetDocument();
  QFile file(fileName);
  if (!file.open(QIODevice::ReadOnly))
    throw WorkspaceLoaderException(messages::kFileNotOpened, {fileName});
  parseWithMarkup(file, fileName);
}

void XMLComponentParser::parseWithMarkup(QIODevice& file, const QString& fileName) {
  forgetDocument();
  if (!firstLineHasMarkup(file))
    return;
  if (!file.seek(0))
    throw WorkspaceLoaderException(messages::kFileNotOpened, {fileName});
  parse(file, LineMap());
}

void XMLComponentParser::ReadInput(const IORXString& fileName) {
  ReadInput(QORXFromLocal8Bit(QByteArray(fileName.data(), static_cast<int>(fileName.length()))));
}

void XMLComponentParser::ReadBufferInput(const QByteArray& bytes) {
  QBuffer buffer;
  buffer.setData(bytes);
  buffer.open(QIODevice::ReadOnly);
  parse(buffer, LineMap());
}

void XMLComponentParser::StripAndReadInput(const QString& fileName, int linesToSkip) {
  forgetDocument();
  TemporaryFile version(QStringLiteral("kx-custom-xform-ver-XXXXXX"));
  {
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly) || !version.open())
      throw WorkspaceLoaderException(messages::kFileNotOpened, {fileName});
    FileLines lines(file);
    bool isFirst = true;
    while (lines.next()) {
      if (lines.lineNumber() <= linesToSkip)
        continue;
      if (lines.startsLine() && !isFirst && lines.startsWith(kEmbeddedDocument))
        break;
      isFirst = false;
      if (version.write(lines.data(), lines.size()) != lines.size())
        throw generalError(version.errorString());
    }
    if (lines.hasFailed() || !version.flush())
      throw generalError(lines.hasFailed() ? file.errorString() : version.errorString());
    version.close();
  }
  PlainFile plain(version.fileName(), QStringLiteral("kx-custom-xform-ver-XXXXXX"));
  WorkspaceSplitter splitter;
  splitter.setFirstLine(std::max(linesToSkip, 0) + 1);
  splitAndParse(splitter, plain.device(), fileName, QStringLiteral("kx-custom-xform-xml-XXXXXX"));
}

void XMLComponentParser::splitAndParse(WorkspaceSplitter& splitter, QIODevice& input, const QString& fileName,
                                       const QString& temporaryName) {
  forgetDocument();
  TemporaryFile xml(temporaryName);
  if (!xml.open())
    throw generalError(xml.errorString());
  splitter.split(input, xml, fileName);
  if (!xml.flush() || !xml.seek(0))
    throw generalError(xml.errorString());
  parse(xml, splitter.lineMap());
}

void XMLComponentParser::forgetDocument() {
  m_tree.reset();
  *m_elements = ElementTable();
  *m_map = LineMap();
  m_parser->forget();
  m_parser->resetDocumentPool();
  documentForgotten();
}

void XMLComponentParser::parse(QIODevice& device, const LineMap& map) {
  forgetDocument();
  try {
    parseGuarded(device, map);
    documentParsed();
  } catch (...) {
    forgetDocument();
    throw;
  }
}

QByteArray XMLComponentParser::captureEncoding(const QByteArray& firstBytes) {
  const MemBufInputSource source(reinterpret_cast<const XMLByte*>(firstBytes.constData()),
                                 static_cast<XMLSize_t>(firstBytes.size()), "declaration");
  // The bytes may end inside the first tag, so that the step may well fail; the declaration has been reported
  // by then, or there is none.
  XMLPScanToken token;
  try {
    m_parser->parseFirst(source, token);
  } catch (const SAXParseException&) {
  } catch (const XMLException&) {
  }
  try {
    m_parser->parseReset(token);
  } catch (const XMLException&) {
  }
  QByteArray name = fromXml(m_parser->getEncodingName()).toLatin1();
  // A name that the parser does not know is not reported.
  if (name.isEmpty()) {
    const char order = utf16ByteOrder(firstBytes);
    const QTextCodec* const wide =
        order ? QTextCodec::codecForName(order == 'L' ? "UTF-16LE" : "UTF-16BE") : nullptr;
    name = declaredEncoding(wide ? wide->toUnicode(firstBytes).toLatin1() : firstBytes);
  }
  m_parser->forget();
  m_parser->resetDocumentPool();
  return name;
}

void XMLComponentParser::parseGuarded(QIODevice& device, const LineMap& map) {
  const HandlerScope handler(*m_parser);
  DocumentGuard guard;
  try {
    const QByteArray firstBytes = device.peek(kFirstBytes);
    const QByteArray encoding = captureEncoding(firstBytes);
    int markLength = 0;
    const QTextCodec* const codec = documentCodec(firstBytes, encoding, markLength);
    if (!codec) {
      throw generalError(documentText(messages::kUnknownEncoding, {QString::fromLatin1(encoding)}));
    }
    device.read(markLength);
    m_parser->parse(DecodedInputSource(device, *codec, guard));
  } catch (const SAXParseException& exception) {
    const auto line = static_cast<int>(exception.getLineNumber());
    const auto column = static_cast<int>(exception.getColumnNumber());
    // The guard stops the document at what it refuses; an error in front of that place is the parser's own.
    const bool isGuards =
        guard.hasRefused() && std::make_pair(line, column) >= std::make_pair(guard.line(), 0);
    if (!isGuards)
      throw placedError(fromXml(exception.getMessage()), map.fileLine(line), column);
  } catch (const XMLException& exception) {
    if (!guard.hasRefused())
      throw generalError(fromXml(exception.getMessage()));
  } catch (const DOMException& exception) {
    throw generalError(fromXml(exception.getMessage()));
  } catch (const OutOfMemoryException&) {
    throw generalError(documentText(messages::kOutOfMemory));
  }
  if (guard.hasRefused())
    throw placedError(guard.refusal(), map.fileLine(guard.line()), guard.column());
  *m_map = map;
  *m_elements = m_parser->takeElements();
  m_elements->setLines(guard.elementLines(), map);
  m_tree = std::make_unique<ElementTree>(*m_elements);
}

std::vector<LeftOutContent> XMLComponentParser::getLeftOutContent() const {
  std::vector<LeftOutContent> entries = m_parser->leftOut();
  for (auto& entry : entries)
    entry.line = m_map->fileLine(entry.line);
  return entries;
}

IXMLComponentParser::Node* XMLComponentParser::getRootNode() const {
  return m_tree ? m_tree->root() : nullptr;
}

std::vector<IXMLComponentParser::Node*> XMLComponentParser::getChildItems(const QString& name,
                                                                          Node* element) const {
  std::vector<Node*> items;
  for (Node* child = element ? element->getFirstChild() : nullptr; child; child = child->getNextSibling()) {
    if (asElement(child) && XMLString::equals(child->getNodeName(), toXml(name)))
      items.push_back(child);
  }
  return items;
}

QString XMLComponentParser::getAttrString(const QString& name, Node* node,
                                          const QString& defaultValue) const {
  const DOMElement* const element = asElement(node);
  const DOMAttr* const attribute = element ? element->getAttributeNode(toXml(name)) : nullptr;
  return attribute ? fromXml(attribute->getValue()) : defaultValue;
}

int XMLComponentParser::getAttrInt(const QString& name, Node* element, int defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

bool XMLComponentParser::getAttrBool(const QString& name, Node* element, bool defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

double XMLComponentParser::getAttrReal(const QString& name, Node* element, double defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

QPointF XMLComponentParser::getAttrPoint(const QString& name, Node* element,
                                         const QPointF& defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

QSizeF XMLComponentParser::getAttrSize(const QString& name, Node* element, const QSizeF& defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

QRectF XMLComponentParser::getAttrRect(const QString& name, Node* element, const QRectF& defaultValue) const {
  return attributeValue(name, element, defaultValue);
}

QStringList XMLComponentParser::getAttrColour(const QString& name, Node* element) const {
  static const QRegularExpression separators(QStringLiteral("[,\\s]+"));
  return getAttrString(name, element).split(separators, Qt::SkipEmptyParts);
}
