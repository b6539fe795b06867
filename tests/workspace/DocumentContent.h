// Everything that a document holds, for comparison.
#pragma once

#include "RandomRecords.h"
#include <tests/support/Files.h>
#include <transform/workspace/XMLComponentReader.h>
#include <transform/workspace/XMLComponentWriter.h>

#include <QBuffer>

struct DocumentSections {
  QHash<QString, QString> parameters;
  std::vector<GlobalParameterStruct> globalParameters;
  std::vector<CommentStruct> comments;
  std::vector<BookmarkStruct> bookmarks;
  std::vector<TransformerStruct> transformers;
  std::vector<SubDocumentIOStruct> ports;
  std::vector<LinkStruct> featureLinks;
  std::vector<BreakpointStruct> breakpoints;
  std::vector<LinkStruct> attributeLinks;
};

struct DocumentContent {
  DocumentType type = kWorkspaceDocument;
  std::vector<DatasetStruct> datasets;
  std::vector<DataTypeStruct> dataTypes;
  std::vector<GeomTypeStruct> geomTypes;
  std::vector<FeatureTypeStruct> featureTypes;
  ServerParameterStruct server;
  QStringList subDocuments;
  std::map<QString, DocumentSections> documents;
};

DocumentContent randomContent(unsigned seed, int records);
void queueContent(const DocumentContent& content, XMLComponentWriter& writer);
DocumentContent contentOf(const IXMLComponentReader& reader);
// Fails the running test where the two differ.
void expectSame(const DocumentContent& left, const DocumentContent& right);

// The document as the writer writes it.
QByteArray written(const DocumentContent& content, const QByteArray& encoding = "UTF-8");
// An XMLComponentReader that has read these bytes.
std::unique_ptr<XMLComponentReader> readBytes(const QByteArray& bytes);
// What the exception of reading these bytes says; empty when there is none.
QString readingError(const QByteArray& bytes);
// A file in the system's temporary folder, gone with its holder.
class ScratchFile {
 public:
  explicit ScratchFile(const QByteArray& content);
  ~ScratchFile();
  const QString& name() const { return m_name; }
  QByteArray content() const { return readAll(m_name); }

 private:
  QString m_name;
};
