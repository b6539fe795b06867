#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MessageNumbers.h>
#include <translation/generation/CustomDefinitions.h>

#include <algorithm>

namespace messages = orx::messages;

CustomDefinitions::CustomDefinitions(const std::vector<ExternalDocNetwork*>& networks, std::size_t used,
                                     const TransformerCfgListener& surroundings)
    : m_surroundings(surroundings), m_used(used) {
  for (const ExternalDocNetwork* network : networks)
    m_definitions.emplace_back(*network, surroundings);
}

CustomDefinitions::~CustomDefinitions() = default;

void CustomDefinitions::addInstance(const TransformerCfg* instance) {
  CompoundTransformerNetwork* network = networkOf(instance);
  if (!network)
    return;
  m_roots.push_back(network);
  InnerAttributes::ByPort& arriving = m_arriving[network];
  const InnerAttributes::ByPort& added = instance->arrivingAttributes();
  for (auto port = added.cbegin(); port != added.cend(); ++port)
    arriving[port.key()].add(port.value());
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
  checkTwins(diagnostics);
  return !diagnostics.hasErrors();
}

void CustomDefinitions::checkTwins(orx::Findings& diagnostics) {
  QHash<QPair<QString, int>, CompoundTransformerNetwork*> known;
  for (CompoundTransformerNetwork* network : nestedNetworks(m_roots)) {
    CompoundTransformerNetwork*& first = known[{network->getName(), network->getVersion()}];
    if (!first)
      first = network;
    if (first == network || statementsOf(*first) == statementsOf(*network))
      continue;
    diagnostics.reportAs(orx::Rule::CustomTransformerFault, messages::kUnequalTwins, 0, network->getName(),
                         {network->getName(), QString::number(network->getVersion()),
                          placeOf(*first, diagnostics.file()), placeOf(*network, diagnostics.file())});
  }
}

QStringList CustomDefinitions::statementsOf(const CompoundTransformerNetwork& network) const {
  const auto* document = dynamic_cast<const ExternalDocNetwork*>(&network);
  if (!document)
    return QStringList();
  orx::Findings ignored{QString()};
  CustomDefinition definition(*document, m_surroundings);
  return definition.arrange(ignored) && definition.prepare(ignored) ? definition.lines() : QStringList();
}

// The file of a linked one, or of the one that it stands in.
QString CustomDefinitions::placeOf(CompoundTransformerNetwork& network, const QString& document) const {
  for (CompoundTransformerNetwork* root : nestedNetworks(m_roots)) {
    const std::vector<CompoundTransformerNetwork*> inside = nestedNetworks(*root);
    if (!root->getFileName().isEmpty() && std::find(inside.begin(), inside.end(), &network) != inside.end())
      return root->getFileName();
  }
  return document;
}

// Outermost first: what reaches an instance inside is known when all that reaches the outside is.
void CustomDefinitions::passAttributes() {
  for (std::size_t number = m_definitions.size(); number-- > 0;) {
    CustomDefinition& definition = m_definitions[number];
    definition.passAttributes(m_arriving.take(&definition.network()));
    if (number >= m_used)
      continue;
    for (const TransformerCfg* cfg : definition.customTransformers())
      addInstance(cfg);
  }
}

void CustomDefinitions::write(MFBuffer& buffer, WrittenCheck* check) const {
  for (std::size_t number = 0; number < m_used; ++number)
    m_definitions[number].write(buffer, check);
}
