// Reads definition files: UTF-8 text of keyword lines, text blocks and templates, any number of definitions
// in one file. Any content ends in a result: what is no definition is passed over.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerDefinition.h>

#include <QString>
#include <QStringList>

#include <functional>

class QIODevice;

class ORX_EXPORT DefinitionFileParser {
 public:
  using DefinitionHandler = std::function<void(TransformerDefinition&& definition)>;
  using CategoryHandler = std::function<void(const QString& category, const QStringList& lines)>;

  // `onDefinition` is called for each definition as its template ends, `onCategory` for each category
  // description.
  DefinitionFileParser(DefinitionHandler onDefinition, CategoryHandler onCategory);

  // The device is open for reading. `path` becomes each definition's file path.
  void parse(QIODevice& device, const QString& path);

  // Takes one header line into a definition. False when no keyword matches.
  static bool takeHeaderLine(const QString& line, TransformerDefinition& definition);

 private:
  DefinitionHandler m_onDefinition;
  CategoryHandler m_onCategory;
};
