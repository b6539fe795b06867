// A definition interpreted: what configure() makes of the plain fields. One object serves every instance of
// the transformer; it is never changed once an instance shares it (TransformerCfg::detachDefinition() copies
// first).
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeRules.h>
#include <transform/core/RenameMapping.h>
#include <transform/core/TransformerDefinition.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>

class CompiledTemplate;

// The tags of one kind, in definition order.
struct TagList {
  QStringList tags;
  QHash<QString, QString> aliases;     // tag to the name written in its place in input lines
  QHash<QString, QString> shownNames;  // tag to the name shown to people, decoded

  // Reads tokens TAG[:ALIAS[:SHOWN]]; an empty ALIAS means none.
  static TagList parse(const QStringList& tokens);
};

class ORX_EXPORT ConfiguredDefinition {
 public:
  // The tags that a definition's category names.
  static QStringList tagsOf(const QString& category);

  TransformerDefinition fields;
  TagList inputTags;
  TagList dynamicInputTags;
  TagList outputTags;
  QStringList categoryTags;
  AttributeRules attributeRules;
  QHash<QString, QString> inputTagAliases;  // of all kinds of input tags
  RenameMapping renamedParameters;
  RenameMapping renamedInputTags;
  RenameMapping renamedOutputTags;
  QString localizedName;
  bool dependencyMet = true;
  QString dependencyMessage;
  // Compiled once; null while the definition has no template.
  std::shared_ptr<const CompiledTemplate> compiledTemplate;
};
