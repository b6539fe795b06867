// Parses an XML document and answers questions about single elements and attributes.
//
// Safe with documents of strangers: a document type declaration is refused, nothing external is ever opened,
// elements nest at most 256 deep and no value is longer than 16 MiB. Each failure throws
// WorkspaceLoaderException and leaves no document behind.
//
// Nodes belong to the parser and live until the next reading or the parser's end.
#pragma once

#include <platform/Export.h>
#include <platform/session/IORXString.h>

#include <QByteArray>
#include <QString>
#include <xercesc/util/XercesDefs.hpp>

#include <memory>
#include <vector>

XERCES_CPP_NAMESPACE_BEGIN
class DOMNode;
XERCES_CPP_NAMESPACE_END

class ORX_EXPORT IXMLComponentParser {
 public:
  using Node = XERCES_CPP_NAMESPACE::DOMNode;

  static std::unique_ptr<IXMLComponentParser> create();
  virtual ~IXMLComponentParser();

  // Parses the whole file when its first line holds "<"; otherwise parses nothing.
  virtual void ReadInput(const QString& fileName) = 0;
  virtual void ReadInput(const IORXString& fileName) = 0;
  virtual void ReadBufferInput(const QByteArray& bytes) = 0;
  // Parses the document that stands in comment lines of a larger file, behind its first `linesToSkip` lines.
  virtual void StripAndReadInput(const QString& fileName, int linesToSkip) = 0;

  // The root element; null when nothing has been parsed.
  virtual Node* getRootNode() const = 0;
  // The element children of that name, in document order.
  virtual std::vector<Node*> getChildItems(const QString& name, Node* element) const = 0;
  virtual QString getAttrString(const QString& name, Node* element,
                                const QString& defaultValue = QString()) const = 0;
  // The default also stands for a text that is no decimal integer.
  virtual int getAttrInt(const QString& name, Node* element, int defaultValue) const = 0;
};
