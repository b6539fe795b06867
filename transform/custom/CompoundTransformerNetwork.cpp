// Building, editing and listeners; the answers stand in the files beginning with its name.
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/CompoundTransformerNetworkListener.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/SubDocNetworkObjInput.h>
#include <transform/custom/SubDocNetworkObjLoop.h>
#include <transform/custom/SubDocNetworkObjOutput.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/custom/instance/InnerTransformerListener.h>
#include <transform/custom/network/AttributeMemo.h>
#include <transform/custom/network/NetworkListeners.h>
#include <transform/custom/network/NetworkSorter.h>

#include <algorithm>

const QString CompoundTransformerNetwork::kLoopOutput = QStringLiteral("INCOMPLETE");

CompoundTransformerNetwork::CompoundTransformerNetwork()
    : m_listeners(std::make_unique<NetworkListeners>()),
      m_orders(std::make_unique<std::map<QString, NetworkOrder>>()),
      m_innerListener(std::make_unique<InnerTransformerListener>(*this)) {}

CompoundTransformerNetwork::~CompoundTransformerNetwork() {
  m_listeners->tellAll([](CompoundTransformerNetworkListener& listener) { listener.networkDeleted(); });
  m_listeners->clear();
  clearNodes();
}

// --- building ----------------------------------------------------------------------------------------------

void CompoundTransformerNetwork::noteNumber(int number, SubDocNetworkObj* node) {
  if (m_nodesByNumber.emplace(number, node).second)
    m_numbers.insert(node, number);
}

template <class Node>
Node* CompoundTransformerNetwork::enter(std::unique_ptr<Node> node) {
  m_nodes.push_back(node.get());
  Node* entered = node.release();
  entered->m_serial = m_nextSerial++;
  noteNumber(entered->number(), entered);
  forgetOrders();
  return entered;
}

void CompoundTransformerNetwork::addInput(const QString& name, int nodeNumber, int position) {
  const auto known = m_inputNodes.find(name);
  if (known != m_inputNodes.end()) {
    noteNumber(nodeNumber, known->second);
    return;
  }
  m_inputNodes[name] = enter(std::make_unique<SubDocNetworkObjInput>(name, nodeNumber, position));
  m_inputs.append(name);
}

void CompoundTransformerNetwork::addOutput(const QString& name, int nodeNumber,
                                           OutgoingAttributePropogationMode mode,
                                           const QStringList& attributes, int position) {
  const auto known = m_outputNodes.find(name);
  if (known != m_outputNodes.end()) {
    noteNumber(nodeNumber, known->second);
    return;
  }
  m_outputNodes[name] =
      enter(std::make_unique<SubDocNetworkObjOutput>(name, nodeNumber, mode, attributes, position));
  m_outputs.append(name);
}

void CompoundTransformerNetwork::addLoop(const QString& name, int nodeNumber) {
  const auto known = m_loopNodes.find(name);
  if (known != m_loopNodes.end()) {
    noteNumber(nodeNumber, known->second);
    return;
  }
  m_loopNodes[name] = enter(std::make_unique<SubDocNetworkObjLoop>(name, nodeNumber));
  m_loops.append(name);
}

SubDocNetworkObjXformer* CompoundTransformerNetwork::addTransformer(
    TransformerCfg* cfg, const QHash<QString, QStringList>& inputAttributes, int nodeNumber) {
  std::unique_ptr<TransformerCfg> owned(cfg);
  if (!owned || m_nodesByNumber.count(nodeNumber) > 0)
    return nullptr;
  m_transformers.push_back(cfg);
  if (!cfg->listener())
    cfg->setListener(m_innerListener.get());
  if (isCustomTransformer(cfg))
    m_customTransformers.push_back(cfg);
  return enter(std::make_unique<SubDocNetworkObjXformer>(std::move(owned), inputAttributes, nodeNumber));
}

SubDocNetworkObj* CompoundTransformerNetwork::nodeByNumber(int number) const {
  const auto at = m_nodesByNumber.find(number);
  return at == m_nodesByNumber.end() ? nullptr : at->second;
}

bool CompoundTransformerNetwork::addLink(int fromNode, const QString& fromPort, int toNode,
                                         const QString& toPort) {
  SubDocNetworkObj* from = nodeByNumber(fromNode);
  SubDocNetworkObj* to = nodeByNumber(toNode);
  if (!from || !to)
    return false;
  SubDocNetworkObj::addLink(*from, fromPort, *to, toPort);
  forgetOrders();
  return true;
}

void CompoundTransformerNetwork::addPublishedParameter(const GUIType& type, const QString& name) {
  if (!m_parameters.contains(name))
    m_parameterNames.append(name);
  CompoundTransformerParm& parameter = m_parameters[name];
  parameter.type = type;
  parameter.type.setName(name);
  m_prototype.reset();
}

void CompoundTransformerNetwork::addPublishedParameter(const QString& name, const QString& value) {
  if (!m_parameters.contains(name))
    m_parameterNames.append(name);
  m_parameters[name].defaultValue = value;
  m_prototype.reset();
}

void CompoundTransformerNetwork::createAncestorList(SubDocNetworkObj* node,
                                                    std::vector<SubDocNetworkObj*>& list, NodeSet& set) {
  std::vector<SubDocNetworkObj*> open{node};
  while (!open.empty()) {
    SubDocNetworkObj* next = open.back();
    open.pop_back();
    if (!next || set.contains(next))
      continue;
    set.insert(next);
    list.push_back(next);
    // The last one entered is visited first.
    const SubDocNetworkObj::Ports& ports = next->feeders();
    for (auto port = ports.rbegin(); port != ports.rend(); ++port) {
      for (auto link = port->second.rbegin(); link != port->second.rend(); ++link)
        open.push_back(link->node);
    }
  }
}

void CompoundTransformerNetwork::doneAdding(bool parametersChanged) {
  forgetOrders();
  ensureOrders();
  onNetworkChanged(parametersChanged);
}

void CompoundTransformerNetwork::ensureOrders() const {
  if (m_ordersValid)
    return;
  m_orders->clear();
  NetworkSorter sorter(m_nodes);
  for (const auto& [name, output] : m_outputNodes)
    m_orders->emplace_hint(m_orders->end(), name, sorter.sort(*output));
  m_ordersValid = true;
}

bool CompoundTransformerNetwork::getIsInUse() const {
  return !m_listeners->isEmpty();
}

void CompoundTransformerNetwork::forgetOrders() {
  m_ordersValid = false;
}

// --- editing -----------------------------------------------------------------------------------------------

bool CompoundTransformerNetwork::removeNode(SubDocNetworkObj* node) {
  node->removeLinks();
  for (const int number : m_numbers.values(node))
    m_nodesByNumber.erase(number);
  m_numbers.remove(node);
  m_nodes.remove(node);
  m_orders->clear();
  forgetOrders();
  delete node;
  onNetworkChanged(false);
  return true;
}

bool CompoundTransformerNetwork::removeInput(const QString& name, int nodeNumber) {
  const auto at = m_inputNodes.find(name);
  if (at == m_inputNodes.end() || nodeByNumber(nodeNumber) != at->second)
    return false;
  SubDocNetworkObj* node = at->second;
  m_inputNodes.erase(at);
  m_inputs.removeOne(name);
  return removeNode(node);
}

bool CompoundTransformerNetwork::removeOutput(const QString& name, int nodeNumber) {
  const auto at = m_outputNodes.find(name);
  if (at == m_outputNodes.end() || nodeByNumber(nodeNumber) != at->second)
    return false;
  SubDocNetworkObj* node = at->second;
  m_outputNodes.erase(at);
  m_outputs.removeOne(name);
  return removeNode(node);
}

bool CompoundTransformerNetwork::removeLoop(const QString& name, int nodeNumber) {
  const auto at = m_loopNodes.find(name);
  if (at == m_loopNodes.end() || nodeByNumber(nodeNumber) != at->second)
    return false;
  SubDocNetworkObj* node = at->second;
  m_loopNodes.erase(at);
  m_loops.removeOne(name);
  return removeNode(node);
}

namespace {

// Moves a node to another name in its map and in the list of names. False when that cannot be.
template <class Node>
bool rename(std::map<QString, Node*>& nodes, QStringList& names, const QString& oldName,
            const QString& newName) {
  const auto at = nodes.find(oldName);
  if (at == nodes.end() || newName.isEmpty() || nodes.count(newName) > 0)
    return false;
  Node* node = at->second;
  nodes.erase(at);
  nodes[newName] = node;
  node->setName(newName);
  names[names.indexOf(oldName)] = newName;
  return true;
}

}  // namespace

bool CompoundTransformerNetwork::renameInput(const QString& oldName, const QString& newName) {
  if (!rename(m_inputNodes, m_inputs, oldName, newName))
    return false;
  m_listeners->tellAll(
      [&](CompoundTransformerNetworkListener& listener) { listener.renameIONode(true, oldName, newName); });
  onNetworkChanged(false);
  return true;
}

bool CompoundTransformerNetwork::renameOutput(const QString& oldName, const QString& newName) {
  if (!rename(m_outputNodes, m_outputs, oldName, newName))
    return false;
  forgetOrders();
  m_listeners->tellAll(
      [&](CompoundTransformerNetworkListener& listener) { listener.renameIONode(false, oldName, newName); });
  onNetworkChanged(false);
  return true;
}

void CompoundTransformerNetwork::clearNodes() {
  const std::list<SubDocNetworkObj*> nodes = std::move(m_nodes);
  m_nodes.clear();
  m_nextSerial = 0;
  m_nodesByNumber.clear();
  m_numbers.clear();
  m_inputNodes.clear();
  m_outputNodes.clear();
  m_loopNodes.clear();
  m_inputs.clear();
  m_outputs.clear();
  m_loops.clear();
  m_transformers.clear();
  m_customTransformers.clear();
  m_parameters.clear();
  m_parameterNames.clear();
  m_orders->clear();
  m_attributeOwner = nullptr;
  m_prototype.reset();
  forgetOrders();
  for (SubDocNetworkObj* node : nodes)
    delete node;
}

void CompoundTransformerNetwork::clear() {
  clearNodes();
  onNetworkChanged(true);
}

// --- listeners ---------------------------------------------------------------------------------------------

void CompoundTransformerNetwork::addListener(CompoundTransformerNetworkListener* listener) {
  m_listeners->add(listener);
}

void CompoundTransformerNetwork::removeListener(CompoundTransformerNetworkListener* listener) {
  m_listeners->remove(listener);
}

void CompoundTransformerNetwork::onNetworkChanged(bool parametersChanged) {
  m_attributeOwner = nullptr;
  if (parametersChanged)
    m_prototype.reset();
  m_listeners->tellAll([parametersChanged](CompoundTransformerNetworkListener& listener) {
    listener.networkChanged(parametersChanged);
  });
}
