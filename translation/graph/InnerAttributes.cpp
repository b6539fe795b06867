#include <transform/core/TransformerCfg.h>
#include <transform/custom/AttributeFlow.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/SubDocNetworkObjInput.h>
#include <transform/custom/SubDocNetworkObjLoop.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <translation/graph/InnerAttributes.h>

namespace {

// What comes back by a loop may bring more back in the next round; lists that grow with each round would do
// so without end.
constexpr int kMostRounds = 8;

}  // namespace

void InnerAttributes::pass(const ByPort& arriving) {
  m_entering = arriving;
  m_returning.clear();
  m_cfgs.clear();
  takeDeclared();
  for (const Member& member : m_members)
    m_cfgs.insert(member.node, member.cfg);
  for (int round = 0; round < kMostRounds; ++round) {
    m_leaving.clear();
    for (const Member& member : m_members)
      attribute_flow::enter(*member.cfg, collect(*member.node));
    if (!takeReturning())
      return;
  }
}

void InnerAttributes::takeDeclared() {
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (const auto* input = dynamic_cast<const SubDocNetworkObjInput*>(node)) {
      AttributeSet entering = input->staticAttributes();
      entering.add(m_entering.value(input->name()));
      m_entering[input->name()] = entering;
    }
  }
}

bool InnerAttributes::takeReturning() {
  ByPort returning;
  for (const SubDocNetworkObj* node : m_network.nodes()) {
    if (!dynamic_cast<const SubDocNetworkObjLoop*>(node))
      continue;
    for (const AttributeSet& attributes : collect(*node))
      returning[node->name()].add(attributes);
  }
  if (returning == m_returning)
    return false;
  m_returning = returning;
  return true;
}

InnerAttributes::ByPort InnerAttributes::collect(const SubDocNetworkObj& node) {
  ByPort collected;
  for (const auto& [port, links] : node.feeders()) {
    AttributeSet& attributes = collected[port];
    for (const SubDocNetworkObj::Link& link : links)
      attributes.add(
          link.node->attributeCopies(link.port, node, port).applied(leaving(*link.node, link.port)));
  }
  return collected;
}

const AttributeSet& InnerAttributes::leaving(const SubDocNetworkObj& node, const QString& port) {
  const auto key = qMakePair(&node, port);
  const auto known = m_leaving.constFind(key);
  if (known != m_leaving.constEnd())
    return *known;
  AttributeSet attributes;
  if (TransformerCfg* cfg = m_cfgs.value(&node)) {
    attributes = attribute_flow::leaving(*cfg, port);
    attributes.add(static_cast<const SubDocNetworkObjXformer&>(node).exposedAttributes().value(port));
  } else {
    // An input and a loop point of one name are one flow.
    attributes = m_entering.value(node.name());
    attributes.add(m_returning.value(node.name()));
  }
  return *m_leaving.insert(key, attributes);
}
