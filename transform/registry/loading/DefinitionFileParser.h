// Reads definition files: keyword lines, text blocks and templates, any number of definitions in one file.
// Any content ends in a result: what is no definition is passed over, and told by unfinished().
#pragma once

#include <transform/core/TransformerDefinition.h>
#include <transform/registry/loading/DefinitionText.h>

#include <QByteArray>
#include <QString>

#include <vector>

class QIODevice;

class DefinitionFileParser {
 public:
  // The device is open for reading; `path` becomes each definition's file path. False, with nothing
  // collected, when the device cannot be read or holds too much; errorString() tells why.
  bool parse(QIODevice& device, const QString& path);
  QString errorString() const { return m_error; }

  const std::vector<DefinitionText>& definitions() const { return m_definitions; }
  // In order of appearance; of several descriptions of one category the last holds.
  const std::vector<CategoryText>& categories() const { return m_categories; }
  // What stood behind the last template: without a template of its own it is no definition.
  const DefinitionText& unfinished() const { return m_unfinished; }
  // The first line of a block that the end of the file ends; 0 when every block has its end.
  int openBlockLine() const { return m_openBlockLine; }
  bool isSoundUtf8() const { return m_isSoundUtf8; }

  // Takes the fields from the collected lines.
  static TransformerDefinition interpret(const DefinitionText& text);
  // The definition that stands in these bytes of a file, from its first line to the end of its template.
  static TransformerDefinition definitionAlone(const QByteArray& bytes, const QString& path);

 private:
  class Visitor;

  void read(DefinitionLines& lines, const QString& path);

  bool m_keepsUnknownLines = true;
  std::vector<DefinitionText> m_definitions;
  std::vector<CategoryText> m_categories;
  DefinitionText m_unfinished;
  int m_openBlockLine = 0;
  bool m_isSoundUtf8 = true;
  QString m_error;
};
