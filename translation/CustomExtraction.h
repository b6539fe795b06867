// Makes of an embedded custom transformer what a file of its own holds: the fields of its opening line, the
// lines of its definition, its document with the custom transformers that it needs.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Findings.h>
#include <translation/GlobalParameters.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

class ExternalDocNetwork;
class IXMLComponentReader;
class SubDocumentLibrary;
class TransformerSource;

class ORX_EXPORT CustomExtraction {
 public:
  // `reader` holds the document, `headerLines` belong to its file, and `source` makes the transformers
  // inside. Neither reader nor source is owned.
  CustomExtraction(const IXMLComponentReader& reader, const QStringList& headerLines,
                   TransformerSource& source);

  // The custom transformers that the document embeds, in its order.
  QStringList names() const;
  // `name` is one of names(); a version of 0 leaves the document's own. False when the custom transformer
  // cannot be written: the diagnostics say why.
  bool prepare(const QString& name, int version, orx::Findings& diagnostics);

  // All below: valid after prepare() answered true.
  const QStringList& fields() const { return m_fields; }
  // The definitions of the custom transformers inside stand in front, each as a block of its own.
  const QStringList& definition() const { return m_definition; }
  const QByteArray& document() const { return m_document; }
  // Itself and those that it needs, in the document's order.
  const QStringList& parts() const { return m_parts; }
  // Parameters and header macros of the workspace that the inside refers to, in the workspace's order: the
  // file does not hold them. A script that looks macros up may refer to each whose name stands in it.
  const QStringList& workspaceParameters() const { return m_workspaceParameters; }

 private:
  bool judge(orx::Findings& diagnostics);
  void findParts(const QString& name);
  void findWorkspaceParameters();
  bool makeDefinition(SubDocumentLibrary& library, orx::Findings& diagnostics);
  void addFields(const ExternalDocNetwork& network, int version);
  bool makeDocument(const QString& name, int version, orx::Findings& diagnostics);

  const IXMLComponentReader& m_reader;
  const QStringList m_headerLines;
  TransformerSource& m_source;
  QStringList m_fields;
  QStringList m_definition;
  GlobalParameters m_global;
  QByteArray m_document;
  QStringList m_parts;
  QStringList m_workspaceParameters;
};
