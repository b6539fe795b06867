// The parser level of the reader: owns one XML parser and the root element of its last parse.
#pragma once

#include <transform/workspace/IXMLComponentParser.h>

#include <QPointF>
#include <QRectF>
#include <QSizeF>
#include <QStringList>

#include <memory>
#include <vector>

class ElementTable;
class ElementTree;
class LineMap;
class QIODevice;
class WorkspaceSplitter;
class XORXDOMParser;
struct LeftOutContent;

class ORX_EXPORT XMLComponentParser : public virtual IXMLComponentParser {
 public:
  XMLComponentParser();
  ~XMLComponentParser() override;

  void ReadInput(const QString& fileName) override;
  void ReadInput(const IORXString& fileName) override;
  void ReadBufferInput(const QByteArray& bytes) override;
  void StripAndReadInput(const QString& fileName, int linesToSkip) override;

  Node* getRootNode() const override;
  std::vector<Node*> getChildItems(const QString& name, Node* element) const override;
  QString getAttrString(const QString& name, Node* element,
                        const QString& defaultValue = QString()) const override;
  int getAttrInt(const QString& name, Node* element, int defaultValue) const override;

  // Further kinds of values. The default stands for an absent attribute and for a malformed text.
  bool getAttrBool(const QString& name, Node* element, bool defaultValue) const;
  double getAttrReal(const QString& name, Node* element, double defaultValue) const;
  QPointF getAttrPoint(const QString& name, Node* element, const QPointF& defaultValue = QPointF()) const;
  QSizeF getAttrSize(const QString& name, Node* element, const QSizeF& defaultValue = QSizeF(0, 0)) const;
  QRectF getAttrRect(const QString& name, Node* element, const QRectF& defaultValue = QRectF()) const;
  // The components of a colour, as they stand between commas or blanks; empty without the attribute.
  QStringList getAttrColour(const QString& name, Node* element) const;

  // What the parser left out of the tree, with the line of the file.
  std::vector<LeftOutContent> getLeftOutContent() const;
  const ElementTable& getElements() const { return *m_elements; }

 protected:
  // Parses what the device holds from where it stands; `map` leads from its lines to those of the file. The
  // document read before is gone in any case.
  void parse(QIODevice& device, const LineMap& map);
  // Takes the XML out of the comment lines of `input` and parses it, by way of a temporary file.
  void splitAndParse(WorkspaceSplitter& splitter, QIODevice& input, const QString& fileName,
                     const QString& temporaryName);
  void forgetDocument();
  // Parses a file of XML alone, if its first line holds any.
  void parseWithMarkup(QIODevice& file, const QString& fileName);

  // Called with each new document, and when the last one is gone.
  virtual void documentParsed();
  virtual void documentForgotten();

 private:
  QByteArray captureEncoding(const QByteArray& firstBytes);
  void parseGuarded(QIODevice& device, const LineMap& map);

  std::unique_ptr<XORXDOMParser> m_parser;
  std::unique_ptr<ElementTable> m_elements;
  std::unique_ptr<ElementTree> m_tree;  // of the elements of the last parse
  std::unique_ptr<LineMap> m_map;
};
