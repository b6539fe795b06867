#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <translation/generation/CustomDefinitions.h>

#include <algorithm>

CustomDefinitions::CustomDefinitions(const std::vector<ExternalDocNetwork*>& networks,
                                     const TransformerCfgListener& surroundings) {
  for (const ExternalDocNetwork* network : networks)
    m_definitions.emplace_back(*network, surroundings);
}

CustomDefinitions::~CustomDefinitions() = default;

void CustomDefinitions::addInstance(const TransformerCfg* instance) {
  const CompoundTransformerNetwork* network = networkOf(instance);
  if (!network)
    return;
  InnerAttributes::ByPort& arriving = m_arriving[network];
  const InnerAttributes::ByPort added = instance->getInputAttributes();
  for (auto port = added.cbegin(); port != added.cend(); ++port)
    arriving[port.key()] += port.value();
}

bool CustomDefinitions::prepare(orx::Findings& diagnostics) {
  bool isArranged = true;
  for (CustomDefinition& definition : m_definitions)
    isArranged = definition.arrange(diagnostics) && isArranged;
  if (isArranged && std::any_of(m_definitions.begin(), m_definitions.end(),
                                [](const CustomDefinition& each) { return each.namesAttributes(); }))
    passAttributes();
  for (CustomDefinition& definition : m_definitions)
    definition.prepare(diagnostics);
  return !diagnostics.hasErrors();
}

// Outermost first: what reaches an instance inside is known when all that reaches the outside is.
void CustomDefinitions::passAttributes() {
  for (auto definition = m_definitions.rbegin(); definition != m_definitions.rend(); ++definition) {
    InnerAttributes::ByPort arriving = m_arriving.take(&definition->network());
    for (QStringList& attributes : arriving)
      attributes.removeDuplicates();
    definition->passAttributes(arriving);
    for (const TransformerCfg* cfg : definition->customTransformers())
      addInstance(cfg);
  }
}
