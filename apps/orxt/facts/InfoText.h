// A document's description for a person.
#pragma once

#include <transform/workspace/IXMLComponentReader.h>

#include <QString>

class WorkspaceDocument;

class InfoText {
 public:
  explicit InfoText(const WorkspaceDocument& document) : m_document(document) {}

  // Everything that was found, in paragraphs; ends with a line end.
  QString text(const QString& fileName);

 private:
  void head(const QString& fileName);
  void attributes(const QHash<QString, QString>& attributes);
  void versions();
  void datasets();
  void featureTypes();
  void server();
  void sections(const QString& document);
  void parameters(const QString& document);
  void transformers(const QString& document);
  void links(const QString& document);
  void notes(const QString& document);
  void subDocument(const QString& name);

  // A paragraph with a title and, behind it, how many there are; nothing when there are none.
  void paragraph(long title, std::size_t count, const QString& body);

  const WorkspaceDocument& m_document;
  QString m_text;
};
