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
class MFBuffer;
class WrittenCheck;

class CustomDefinitions {
 public:
  // `networks` stand each behind those inside it; behind the first `used` of them stand some that are checked
  // alone. `surroundings` is the listener of the workspace. Neither is owned.
  CustomDefinitions(const std::vector<ExternalDocNetwork*>& networks, std::size_t used,
                    const TransformerCfgListener& surroundings);
  ~CustomDefinitions();

  // Notes what reaches an instance in the main document; other transformers are passed over.
  void addInstance(const TransformerCfg* instance);
  // False when anything was reported as an error.
  bool prepare(orx::Findings& diagnostics);

  // Innermost first; to be written after prepare() answered true.
  const std::deque<CustomDefinition>& all() const { return m_definitions; }
  // Writes those in use, and tells the check, when there is one, who writes. Call after prepare().
  void write(MFBuffer& buffer, WrittenCheck* check) const;

 private:
  void passAttributes();
  // An engine finds a definition by name and version, so what has the same has to be the same.
  void checkTwins(orx::Findings& diagnostics);
  // The statements of the definition; none when they cannot be written.
  QStringList statementsOf(const CompoundTransformerNetwork& network) const;
  QString placeOf(CompoundTransformerNetwork& network, const QString& document) const;

  const TransformerCfgListener& m_surroundings;
  std::deque<CustomDefinition> m_definitions;
  std::size_t m_used;
  std::vector<CompoundTransformerNetwork*> m_roots;  // of the instances in the main document
  QHash<const CompoundTransformerNetwork*, InnerAttributes::ByPort> m_arriving;
};
