// What a definition file holds, as far as the registry needs it before anyone asks for a transformer. Nothing
// but the lines that tell this becomes text; the definitions themselves stay the bytes that they are.
#pragma once

#include <transform/core/TransformerDefinition.h>
#include <transform/registry/loading/DefinitionText.h>

#include <QByteArray>
#include <QString>

#include <vector>

struct IndexedDefinition {
  TransformerDefinition facts;  // what the keywords of registration say
  QByteArray bytes;             // DefinitionFileParser::definitionAlone() reads them
};

class DefinitionIndex {
 public:
  // Finds the same definitions and categories as DefinitionFileParser does.
  void read(const QByteArray& file);

  std::vector<IndexedDefinition>& definitions() { return m_definitions; }
  const std::vector<CategoryText>& categories() const { return m_categories; }
  // Whether lines stand behind the last template, which are no definition, and the name that they give.
  bool endsUnfinished() const { return m_endsUnfinished; }
  const QString& unfinishedName() const { return m_unfinishedName; }

 private:
  class Visitor;

  std::vector<IndexedDefinition> m_definitions;
  std::vector<CategoryText> m_categories;
  bool m_endsUnfinished = false;
  QString m_unfinishedName;
};
