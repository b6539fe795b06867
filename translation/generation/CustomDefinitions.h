// The definitions of the custom transformers that a document embeds.
//
// A definition serves every instance, so a statement in it that names the attributes which reach it names
// those of all instances, in the order of the document; and those that the inputs declare, should there be no
// instance.
#pragma once

#include <translation/generation/CustomDefinition.h>
#include <translation/graph/InnerAttributes.h>

#include <QHash>

#include <deque>

class CompoundTransformerNetwork;

class CustomDefinitions {
 public:
  // `networks` stand each behind those inside it. `surroundings` is the listener of the workspace. Neither is
  // owned.
  CustomDefinitions(const std::vector<ExternalDocNetwork*>& networks,
                    const TransformerCfgListener& surroundings);
  ~CustomDefinitions();

  // Notes what reaches an instance in the main document; other transformers are passed over.
  void addInstance(const TransformerCfg* instance);
  // False when anything was reported as an error.
  bool prepare(orx::Findings& diagnostics);

  // Innermost first; to be written after prepare() answered true.
  const std::deque<CustomDefinition>& all() const { return m_definitions; }

 private:
  void passAttributes();

  std::deque<CustomDefinition> m_definitions;
  QHash<const CompoundTransformerNetwork*, InnerAttributes::ByPort> m_arriving;
};
