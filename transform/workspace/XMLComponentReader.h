// The reader level: knows the workspace vocabulary and builds the records.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/XMLComponentParser.h>

class PlainFile;
class QIODevice;
struct Word;

class ORX_EXPORT XMLComponentReader : public XMLComponentParser, public IXMLComponentReader {
 public:
  XMLComponentReader();
  ~XMLComponentReader() override;

  // Whether the first 100 bytes hold a root tag of a workspace, or "ORW". False for a file that cannot be
  // read.
  static bool IsFileXMLWorkspace(const QString& fileName);
  // The same of the first bytes of a file.
  static bool isXMLWorkspace(const QByteArray& bytes);
  // Splits a workspace file and answers the name of a new temporary file with its XML, which the caller
  // deletes. Header lines are appended; prompt lines (by parameter name) and macros (by name) are collected
  // when wanted.
  static QString SplitWorkspace(const QString& fileName, QStringList& headerLines,
                                QHash<QString, QString>* prompts = nullptr,
                                QHash<QString, QString>* macros = nullptr);
  // The versions in a file, in file order. `error` is empty unless the file could not be read.
  static QList<VersionInfo> getVersions(const QString& fileName, QString& error);

  using IXMLComponentReader::ReadInput;
  void ReadInput(const QString& fileName) override;
  void ReadInput(const IORXString& fileName) override;
  void ReadInput(const QString& fileName, QStringList& headerLines) override;
  // The same of a file that was opened before, and known to be one of comment lines or of XML alone.
  void ReadOpenedInput(PlainFile& file, const QString& fileName, bool isXmlAlone, QStringList& headerLines);
  void ReadVersionedInput(const QString& fileName, qint64 offset, qint64 length, bool withHeader,
                          QStringList& headerLines, QByteArray& before, QByteArray& behind) override;

  DocumentType GetDocumentType() const override;
  QString GetMiscParm(const QString& name, const QString& defaultValue = QString()) const override;
  bool HasMiscParm(const QString& name) const override;
  QStringList GetSubDocList() const override;
  QHash<QString, QString> GetSubDocParms(const QString& document) const override;
  ServerParameterStruct GetServerParameters() const override;

  ORXTValSlist<DatasetStruct> GetDatasetList() const override;
  ORXTValSlist<DataTypeStruct> GetDataTypeList() const override;
  ORXTValSlist<GeomTypeStruct> GetGeomTypeList() const override;
  ORXTValSlist<FeatureTypeStruct> GetFeatureTypeList() const override;
  ORXTValSlist<GlobalParameterStruct> GetGlobalParameterList(const QString& document) const override;
  ORXTValSlist<TransformerStruct> GetTransformerList(const QString& document) const override;
  ORXTValSlist<LinkStruct> GetFeatureTypeLinkList(const QString& document) const override;
  ORXTValSlist<LinkStruct> GetAttributeLinkList(const QString& document) const override;
  ORXTValSlist<BookmarkStruct> GetBookmarkList(const QString& document) const override;
  ORXTValSlist<BreakpointStruct> GetBreakpointList(const QString& document) const override;
  ORXTValSlist<CommentStruct> GetCommentList(const QString& document) const override;
  ORXTValSlist<ConstantStruct> GetConstantList(const QString& document,
                                               bool parameterConstants = false) const override;
  ORXTValSlist<SubDocumentIOStruct> GetSubDocumentIOList(const QString& document) const override;

  OrderedObjectList GetOrderedSubDocumentIOs(const QString& document) const override;
  bool AreVisualizersDisabled() const override;
  int GetFirstHeaderLineNumber() const override;
  int GetDocumentLine(const QString& document) const override;
  void SetPromptDefinitionSource(PromptDefinitionSource source) override;

 protected:
  void documentParsed() override;
  void documentForgotten() override;

 private:
  struct Document {
    int line = 0;
    QHash<QString, QString> parameters;
    // By name, the places of the section elements; a section that is repeated counts as one.
    QHash<QString, QVector<std::size_t>> sections;
  };

  void indexDocument(std::size_t index, const QString& name);
  template <class Table>
  ORXTValSlist<typename Table::Record> readSection(const QString& document, const Word& section) const;

  QHash<QString, Document> m_documents;
  QStringList m_subDocuments;
  ServerParameterStruct m_serverParameters;
  bool m_visualizersDisabled = false;
  int m_firstHeaderLine = 0;
  PromptDefinitionSource m_prompts;
};
