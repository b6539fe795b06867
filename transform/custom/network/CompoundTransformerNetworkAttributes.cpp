// What leaves the outputs of a network.
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedQuestion.h>
#include <transform/custom/SubDocNetworkObjInput.h>
#include <transform/custom/SubDocNetworkObjOutput.h>
#include <transform/custom/network/AttributeMemo.h>
#include <transform/custom/network/NetworkOrder.h>

#include <QScopedValueRollback>

#include <algorithm>

namespace {

// Rounds through a cycle go on until nothing changes any more, at most once for each node that a name may
// have to pass. When rounds make new names (a list that grows with each), what is there after some of them is
// taken as it is; so it is in cycles of many thousand nodes most of whose links run against the order.
constexpr std::size_t kMostRoundsWithNewNames = 8;
constexpr std::size_t kMostStepsInCycle = 10 * 1000 * 1000;
// What the custom transformers inside may cost within one outermost query, in characters of the attributes
// that reach them. Definitions that are placed in each other again and again, each time with other
// attributes, could ask for more than any machine has: what exceeds this is told, and gives what reaches it.
constexpr qint64 kMostCost = 32 * 1024 * 1024;
constexpr qint64 kCostOfQuestion = 512;

constexpr auto kKind = NestedQuestion::Kind::Attributes;

void computeCycle(const NetworkOrder::Cycle& cycle, MetAttributes& met) {
  for (SubDocNetworkObj* node : cycle.flow)
    node->beginQuery();
  std::size_t newNames = 0;
  std::size_t rounds =
      kMostRoundsWithNewNames + std::min(cycle.flow.size(), kMostStepsInCycle / cycle.flow.size());
  for (bool hasChanged = true; hasChanged && newNames < kMostRoundsWithNewNames && rounds > 0; --rounds) {
    const int names = met.names.size();
    hasChanged = false;
    for (SubDocNetworkObj* node : cycle.flow) {
      node->compute(met);
      hasChanged = hasChanged || node->hasChanged();
    }
    newNames += met.names.size() > names ? 1 : 0;
  }
}

}  // namespace

void CompoundTransformerNetwork::setInputAttributes(const QString& input, const QStringList& attributes) {
  const auto at = m_inputNodes.find(input);
  if (at == m_inputNodes.end())
    return;
  at->second->setAttributes(AttributeSet(attributes));
  m_attributeOwner = nullptr;
}

void CompoundTransformerNetwork::setInputAttributes(const QHash<QString, QStringList>& attributes) {
  for (const auto& [name, node] : m_inputNodes)
    node->setAttributes(AttributeSet(attributes.value(name)));
  m_attributeOwner = nullptr;
}

void CompoundTransformerNetwork::setArrivingAttributes(const QHash<QString, AttributeSet>& attributes) {
  for (const auto& [name, node] : m_inputNodes)
    node->setAttributes(attributes.value(name));
  m_attributeOwner = nullptr;
}

void CompoundTransformerNetwork::setStaticInputAttributes(const QString& input,
                                                          const QStringList& attributes) {
  const auto at = m_inputNodes.find(input);
  if (at != m_inputNodes.end())
    at->second->setStaticAttributes(AttributeSet(attributes));
}

QStringList CompoundTransformerNetwork::getInputAttributes(const QString& input, bool withStatic) const {
  const auto at = m_inputNodes.find(input);
  if (at == m_inputNodes.end())
    return QStringList();
  return (withStatic ? at->second->ownAttributes() : at->second->setAttributes()).names();
}

AttributeSet CompoundTransformerNetwork::arrivingAttributes() const {
  AttributeSet all;
  for (const QString& input : m_inputs)
    all.add(m_inputNodes.at(input)->ownAttributes());
  return all;
}

QStringList CompoundTransformerNetwork::getOutputAttributes(const QString& output,
                                                            QHash<QString, QString>& origins) const {
  MetAttributes met{AttributeSet(origins.keys()), &origins};
  return leavingAttributes(output, met).names();
}

AttributeSet CompoundTransformerNetwork::leavingAttributes(const QString& output) const {
  MetAttributes met;
  return leavingAttributes(output, met);
}

AttributeSet CompoundTransformerNetwork::leavingAttributes(const QString& output, MetAttributes& met) const {
  const auto node = m_outputNodes.find(output);
  // A network that is being worked out stands inside itself.
  if (node == m_outputNodes.end() || m_isEvaluating || NestedQuestion::depth(kKind) >= kDeepestNesting)
    return AttributeSet();
  ensureOrders();
  const NetworkOrder& order = m_orders->at(output);
  if (NestedQuestion::depth(kKind) == 0)
    return evaluate(*node->second, order, met);

  if (!m_memo)
    m_memo = std::make_unique<AttributeMemo>();
  if (m_memo->query != NestedQuestion::number(kKind)) {
    m_memo->query = NestedQuestion::number(kKind);
    m_memo->answers.clear();
  }
  AttributeMemo::Key key;
  key.output = output;
  qint64 cost = kCostOfQuestion;
  for (const QString& input : m_inputs) {
    key.inputs.append(m_inputNodes.at(input)->setAttributes());
    cost += key.inputs.last().characters();
  }
  if (!NestedQuestion::spend(kKind, cost, kMostCost))
    return arrivingAttributes();
  for (const QString& parameter : m_parameterNames)
    key.values.append(m_attributeOwner ? m_attributeOwner->getParameterValue(parameter, UnpackLevel::Resolved)
                                       : QString());
  const auto known = m_memo->answers.constFind(key);
  if (known != m_memo->answers.constEnd())
    return *known;
  const AttributeSet answer = evaluate(*node->second, order, met);
  m_memo->answers.insert(key, answer);
  return answer;
}

AttributeSet CompoundTransformerNetwork::evaluate(SubDocNetworkObjOutput& output, const NetworkOrder& order,
                                                  MetAttributes& met) const {
  const NestedQuestion question(kKind);
  const QScopedValueRollback<bool> evaluating(m_isEvaluating, true);
  auto cycle = order.cycles.begin();
  for (std::size_t at = 0; at < order.nodes.size();) {
    if (cycle == order.cycles.end() || cycle->begin != at) {
      SubDocNetworkObj* node = order.nodes[at++];
      node->beginQuery();
      node->compute(met);
      continue;
    }
    computeCycle(*cycle, met);
    at = cycle->end;
    ++cycle;
  }
  return output.getAttributes(output.name());
}

QStringList CompoundTransformerNetwork::getUpstreamInputs(const QString& output) const {
  QStringList inputs;
  ensureOrders();
  const auto order = m_orders->find(output);
  if (order == m_orders->end())
    return inputs;
  for (const SubDocNetworkObj* node : order->second.nodes) {
    if (node->kind() == SubDocNetworkObj::Kind::Input)
      inputs.append(node->name());
  }
  return inputs;
}

void CompoundTransformerNetwork::getOutputAttributeMode(const QString& output,
                                                        OutgoingAttributePropogationMode& mode,
                                                        QStringList& attributes) const {
  const auto at = m_outputNodes.find(output);
  if (at == m_outputNodes.end()) {
    mode = kOutgoingArriving;
    return;
  }
  mode = at->second->mode();
  attributes = at->second->ownAttributes();
}

void CompoundTransformerNetwork::setOutputAttributeMode(const QString& output,
                                                        OutgoingAttributePropogationMode mode,
                                                        const QStringList& attributes) {
  const auto at = m_outputNodes.find(output);
  if (at != m_outputNodes.end())
    at->second->setMode(mode, attributes);
}
