// Writes a workspace document to a device: first every record is queued, by kind and by document, then the
// whole document is written once.
//
// A document is named by its sub-document's name; the empty name is the main document. Records keep the order
// in which they were queued; sub-documents stand in the order in which their parameters were set first.
//
// The writer reports no errors of a failing device: these show in the state of device and stream. What could
// not be written so that a reader takes it (a character that XML forbids, a number that is not finite, a
// parameter name that is no XML name, a value of more than 16 MiB) is refused before anything is written: the
// stream's status is then QTextStream::WriteFailed, and getRefusal() says why.
//
// The virtual operations stand in the order that other modules rely on. Those that write one element may be
// replaced by a derived writer; it writes to stream().
#pragma once

#include <platform/Export.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <QHash>
#include <QIODevice>
#include <QString>
#include <QStringList>
#include <QTextStream>

#include <map>
#include <memory>
#include <vector>

class ElementText;
struct Word;

class ORX_EXPORT XMLComponentWriter {
 public:
  // The device belongs to the caller, outlives the writer, and is open for writing when writeDocument() is
  // called. The encoding is the system's until another is set.
  XMLComponentWriter(QIODevice* device, DocumentType type);
  virtual ~XMLComponentWriter();
  XMLComponentWriter(const XMLComponentWriter&) = delete;
  XMLComponentWriter& operator=(const XMLComponentWriter&) = delete;

  virtual void addDataset(const DatasetStruct& record);
  virtual void addDataType(const DataTypeStruct& record);
  virtual void addGeomType(const GeomTypeStruct& record);
  virtual void addGlobalParameter(const QString& document, const GlobalParameterStruct& record);
  virtual void setServerParameters(const ServerParameterStruct& record);
  virtual void addFeatureType(const FeatureTypeStruct& record);
  virtual void addComment(const QString& document, const CommentStruct& record);
  virtual void addBookmark(const QString& document, const BookmarkStruct& record);
  virtual void addTransformer(const QString& document, const TransformerStruct& record);
  virtual void addFeatureTypeLink(const QString& document, const LinkStruct& record);
  virtual void addBreakpoint(const QString& document, const BreakpointStruct& record);
  virtual void addAttributeLink(const QString& document, const LinkStruct& record);
  virtual void addSubDocumentIO(const QString& document, const SubDocumentIOStruct& record);
  // A sub-document is written only when this was called for it. An entry "NAME" of a sub-document is left
  // out: the document's own name is written in its place.
  virtual void setMiscParms(const QString& document, const QHash<QString, QString>& parameters);

  virtual void writeDocument();

  virtual void writeDataset(const DatasetStruct& record);
  virtual void writeDataType(const DataTypeStruct& record);
  virtual void writeGeomType(const GeomTypeStruct& record);
  virtual void writeGlobalParameter(const GlobalParameterStruct& record);
  virtual void writeServerParameters(const ServerParameterStruct& record);
  virtual void writeFeatureType(const FeatureTypeStruct& record);
  virtual void writeComment(const CommentStruct& record);
  virtual void writeBookmark(const BookmarkStruct& record);
  virtual void writeTransformer(const TransformerStruct& record);
  virtual void writeFeatureTypeLink(const LinkStruct& record);
  virtual void writeBreakpoint(const BreakpointStruct& record);
  virtual void writeAttributeLink(const LinkStruct& record);
  virtual void writeSubDocumentIO(const SubDocumentIOStruct& record);
  virtual void writeSections(const QString& document);

  // The name of a codec of Qt; before writeDocument(). False when there is none of that name, and nothing
  // changes.
  bool setEncoding(const QByteArray& name);
  // For UTF-16: whether a byte order mark is written (it is, until this says otherwise).
  void setByteOrderMark(bool on);
  // Empty unless something queued cannot be written.
  const QString& getRefusal() const { return m_refusal; }
  // Names for which records were queued, but no parameters set: these documents are not written.
  QStringList getUnwrittenDocuments() const;
  QTextStream& stream() { return m_stream; }

 private:
  // What is queued for one document.
  struct Queues {
    std::vector<GlobalParameterStruct> globalParameters;
    std::vector<CommentStruct> comments;
    std::vector<BookmarkStruct> bookmarks;
    std::vector<TransformerStruct> transformers;
    std::vector<SubDocumentIOStruct> ports;
    std::vector<LinkStruct> featureLinks;
    std::vector<BreakpointStruct> breakpoints;
    std::vector<LinkStruct> attributeLinks;
  };

  template <class Table, class Queue>
  void queue(const typename Table::Record& record, Queue& records);
  template <class Table>
  void put(const typename Table::Record& record);
  template <class Record>
  void section(const Word& name, const std::vector<Record>& records,
               void (XMLComponentWriter::*write)(const Record&));
  void flushText();
  void refuse(const QString& reason);
  void checkParameters(const QString& document, const QHash<QString, QString>& parameters);
  void checkEncoding();
  void writeParameters(const QString& document);
  void writeSubDocuments();

  DocumentType m_type;
  QTextStream m_stream;
  bool m_byteOrderMark = true;
  std::unique_ptr<ElementText> m_text;
  QString m_refusal;
  std::vector<DatasetStruct> m_datasets;
  std::vector<DataTypeStruct> m_dataTypes;
  std::vector<GeomTypeStruct> m_geomTypes;
  std::vector<FeatureTypeStruct> m_featureTypes;
  ServerParameterStruct m_serverParameters;
  std::map<QString, Queues> m_queues;
  QHash<QString, QHash<QString, QString>> m_parameters;
  QStringList m_subDocuments;  // in the order in which their parameters were set first
};
