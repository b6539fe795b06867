// Reads a workspace document into lists of records.
//
// A document is named by its sub-document's name; the empty name is the main document. Getters never fail: an
// unknown document or an absent section gives an empty list. Of several sub-documents of one name the first
// counts.
#pragma once

#include <platform/vtl/ORXTValSlist.h>
#include <transform/workspace/IXMLComponentParser.h>
#include <transform/workspace/VersionInfo.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <QHash>
#include <QList>
#include <QStringList>

#include <functional>

// Answers the prompt line of a transformer's parameter, or an empty text when it knows none.
using PromptDefinitionSource =
    std::function<QString(const QString& transformerType, int version, const QString& parameterName)>;

class ORX_EXPORT IXMLComponentReader : public virtual IXMLComponentParser {
 public:
  static std::unique_ptr<IXMLComponentReader> create();
  ~IXMLComponentReader() override;

  using IXMLComponentParser::ReadInput;
  // Loads a workspace file; its header lines are appended to `headerLines`.
  virtual void ReadInput(const QString& fileName, QStringList& headerLines) = 0;
  // Loads the version of `length` bytes at `offset` (VersionInfo has both). Header lines are appended when
  // `withHeader` is set; `before` and `behind` receive the file's bytes around the version.
  virtual void ReadVersionedInput(const QString& fileName, qint64 offset, qint64 length, bool withHeader,
                                  QStringList& headerLines, QByteArray& before, QByteArray& behind) = 0;

  virtual DocumentType GetDocumentType() const = 0;
  virtual QString GetMiscParm(const QString& name, const QString& defaultValue = QString()) const = 0;
  virtual bool HasMiscParm(const QString& name) const = 0;
  virtual QStringList GetSubDocList() const = 0;
  // All attributes of a sub-document, its "NAME" among them, or of the root for the empty name.
  virtual QHash<QString, QString> GetSubDocParms(const QString& document) const = 0;
  virtual ServerParameterStruct GetServerParameters() const = 0;

  virtual ORXTValSlist<DatasetStruct> GetDatasetList() const = 0;
  virtual ORXTValSlist<DataTypeStruct> GetDataTypeList() const = 0;
  virtual ORXTValSlist<GeomTypeStruct> GetGeomTypeList() const = 0;
  virtual ORXTValSlist<FeatureTypeStruct> GetFeatureTypeList() const = 0;

  virtual ORXTValSlist<GlobalParameterStruct> GetGlobalParameterList(const QString& document) const = 0;
  virtual ORXTValSlist<TransformerStruct> GetTransformerList(const QString& document) const = 0;
  virtual ORXTValSlist<LinkStruct> GetFeatureTypeLinkList(const QString& document) const = 0;
  virtual ORXTValSlist<LinkStruct> GetAttributeLinkList(const QString& document) const = 0;
  virtual ORXTValSlist<BookmarkStruct> GetBookmarkList(const QString& document) const = 0;
  virtual ORXTValSlist<BreakpointStruct> GetBreakpointList(const QString& document) const = 0;
  virtual ORXTValSlist<CommentStruct> GetCommentList(const QString& document) const = 0;
  // With `parameterConstants`, the "PARAMETER_CONSTANT" elements of the section instead of its "CONSTANT"
  // ones.
  virtual ORXTValSlist<ConstantStruct> GetConstantList(const QString& document,
                                                       bool parameterConstants = false) const = 0;
  virtual ORXTValSlist<SubDocumentIOStruct> GetSubDocumentIOList(const QString& document) const = 0;

  // The same ports sorted by their key.
  virtual OrderedObjectList GetOrderedSubDocumentIOs(const QString& document) const = 0;
  // Whether the root attribute "DISABLE_VISUALIZERS" is "true".
  virtual bool AreVisualizersDisabled() const = 0;
  // File line of the first header line of the last reading; the others follow it without a gap. 0: no header.
  virtual int GetFirstHeaderLineNumber() const = 0;
  // File line of a sub-document's element, or of the root for the empty name; 0 when there is none.
  virtual int GetDocumentLine(const QString& document) const = 0;
  // Where the prompt line of a custom-prompted parameter takes its type from; without a source, or when the
  // source knows none, it is an optional text.
  virtual void SetPromptDefinitionSource(PromptDefinitionSource source) = 0;
};
