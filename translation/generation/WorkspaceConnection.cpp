#include <transform/core/TransformerCfg.h>
#include <transform/custom/AttributeFlow.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MappingFileKeywords.h>
#include <translation/generation/FlowNames.h>
#include <translation/generation/WorkspaceConnection.h>
#include <translation/graph/FlowOrder.h>
#include <translation/graph/InnerNames.h>

#include <QSet>

#include <algorithm>
#include <limits>

using orx::Rule;

WorkspaceConnection::WorkspaceConnection(Workspace& workspace, orx::Findings& findings)
    : m_workspace(workspace),
      m_findings(findings),
      m_flows(workspace.nodes.size()),
      m_incoming(workspace.nodes.size()),
      m_isConnected(findOrder()) {
  if (!m_isConnected)
    return;
  nameFlows();
  connect();
  pushAttributes();
}

QString writerRouteName(const WorkspaceNode& writer) {
  return writer.keyword + QLatin1Char(' ') + writer.name + kOutputRenamerName;
}

bool WorkspaceConnection::findOrder() {
  std::vector<std::pair<int, int>> edges;
  edges.reserve(m_workspace.links.size());
  for (const WorkspaceLink& link : m_workspace.links)
    edges.emplace_back(link.source, link.target);
  const FlowOrder flow = flowOrder(static_cast<int>(m_workspace.nodes.size()), edges);
  for (const std::vector<int>& cycle : flow.cycles) {
    QStringList names;
    for (const int member : cycle)
      names.append(m_workspace.nodes[at(member)].name);
    m_findings.report(Rule::Cycle, m_workspace.nodes[at(cycle.front())].line, names.first(),
                      {names.join(QLatin1String(", "))});
  }
  for (const int node : flow.order) {
    if (m_workspace.nodes[at(node)].isTransformer())
      m_order.push_back(node);
  }
  return flow.cycles.empty();
}

void WorkspaceConnection::nameFlows() {
  std::vector<QSet<QString>> connected(m_workspace.nodes.size());
  for (const WorkspaceLink& link : m_workspace.links)
    connected[at(link.source)].insert(link.output);

  FlowNames names;
  InnerNames inner;
  const int count = static_cast<int>(m_workspace.nodes.size());
  const auto claimTypes = [&](WorkspaceNode::Kind kind) {
    for (int node = 0; node < count; ++node) {
      if (m_workspace.nodes[at(node)].kind == kind)
        m_flows[at(node)].insert(QString(), names.claim(m_workspace.nodes[at(node)].name));
    }
  };
  // The names between the statements of a transformer are fixed. What a writer takes keeps the writer's own
  // name where it can, and the inner names of custom transformers are fixed, so those come first.
  reserveFixedNames(names, false);
  claimTypes(WorkspaceNode::Kind::Writer);
  reserveFixedNames(names, true);
  claimTypes(WorkspaceNode::Kind::Reader);
  for (int node = 0; node < count; ++node) {
    const WorkspaceNode& place = m_workspace.nodes[at(node)];
    if (place.isTransformer()) {
      QStringList tags;
      place.cfg->getOutputTags(tags);
      for (const QString& tag : tags) {
        if (connected[at(node)].contains(tag))
          m_flows[at(node)].insert(tag, names.claim(outputFlowName(*place.cfg, place.name, tag)));
        inner.addFlow(m_flows[at(node)].value(tag));
      }
    }
    inner.addFlow(m_flows[at(node)].value(QString()));
  }
  nameCopies(names, inner);
  addMembers(inner);
  inner.report(QString(), m_findings);
}

// Only flows that some link copies on are looked at: in most workspaces there is none.
void WorkspaceConnection::nameCopies(FlowNames& names, InnerNames& inner) {
  QSet<QString> copied;
  for (const WorkspaceLink& link : m_workspace.links) {
    if (!link.copies.isEmpty())
      copied.insert(flowBeforeCopies(link));
  }
  if (copied.isEmpty())
    return;
  for (const WorkspaceLink& link : m_workspace.links) {
    const QString flow = flowBeforeCopies(link);
    if (copied.contains(flow))
      m_copied.add(flow, m_workspace.nodes[at(link.source)].isTransformer(), link.copies);
  }
  m_copied.nameRoutes(names);
  for (const WorkspaceLink& link : m_workspace.links) {
    if (!link.copies.isEmpty())
      inner.addFlow(flowOf(link));
  }
}

void WorkspaceConnection::reserveFixedNames(FlowNames& names, bool ofCustom) {
  for (const WorkspaceNode& node : m_workspace.nodes) {
    if (!node.isTransformer() || isCustomTransformer(node.cfg.get()) != ofCustom)
      continue;
    for (const QString& taken : names.reserve(*node.cfg, node.name))
      reportTakenFlow(*node.cfg, taken, node.line, node.name, m_findings);
  }
}

void WorkspaceConnection::addMembers(InnerNames& inner) {
  std::vector<bool> isFed(m_workspace.nodes.size());
  for (const WorkspaceLink& link : m_workspace.links)
    isFed[at(link.target)] = true;
  for (std::size_t number = 0; number < m_workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = m_workspace.nodes[number];
    if (node.isTransformer())
      inner.add(node.name, node.line, *node.cfg);
    else if (node.kind == WorkspaceNode::Kind::Writer && isFed[number])
      inner.addFactory(writerRouteName(node), node.line, node.name);
  }
  for (const GlobalParameters::Parameter& parameter : m_workspace.parameters.all())
    inner.addParameter(parameter.name);
}

QString WorkspaceConnection::flowOf(const WorkspaceLink& link) const {
  return m_copied.behind(flowBeforeCopies(link), link.copies);
}

std::vector<std::pair<QString, CopiedFlows::Route>> WorkspaceConnection::copiesFrom(int node) const {
  QStringList tags = m_flows[at(node)].keys();
  tags.sort();
  std::vector<std::pair<QString, CopiedFlows::Route>> all;
  for (const QString& tag : qAsConst(tags)) {
    const QString flow = m_flows[at(node)].value(tag);
    for (const CopiedFlows::Route& route : m_copied.routes(flow))
      all.emplace_back(flow, route);
  }
  return all;
}

void WorkspaceConnection::connect() {
  for (std::size_t number = 0; number < m_workspace.links.size(); ++number)
    m_incoming[at(m_workspace.links[number].target)].push_back(static_cast<int>(number));

  for (std::size_t target = 0; target < m_workspace.nodes.size(); ++target) {
    const WorkspaceNode& node = m_workspace.nodes[target];
    QHash<QString, QHash<QString, int>> ranks;
    for (auto port = node.inputOrder.cbegin(); port != node.inputOrder.cend(); ++port) {
      for (int position = 0; position < port->size(); ++position)
        ranks[port.key()].insert(port->at(position), position);
    }
    const auto rank = [&](int number) {
      constexpr int last = std::numeric_limits<int>::max();
      const WorkspaceLink& link = m_workspace.links[at(number)];
      const int byOrder =
          ranks.isEmpty() ? last : ranks.value(link.input).value(flowBeforeCopies(link), last);
      return std::make_pair(byOrder, link.executionIndex < 0 ? last : link.executionIndex);
    };
    std::stable_sort(m_incoming[target].begin(), m_incoming[target].end(),
                     [&](int left, int right) { return rank(left) < rank(right); });
    if (!node.isTransformer())
      continue;
    for (const int number : m_incoming[target]) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      node.cfg->addInputFeatureType(link.input, flowOf(link));
    }
    for (auto flow = m_flows[target].cbegin(); flow != m_flows[target].cend(); ++flow) {
      node.cfg->setOutputFeatureType(flow.key(), flow.value());
      const QString function = m_copied.ownFunction(flow.value());
      if (!function.isEmpty())
        node.cfg->setOutputTagFuncs(flow.key(), QStringList(function));
    }
  }
}

void WorkspaceConnection::pushAttributes() {
  // What leaves an output is asked once, however many links take it on.
  std::vector<QHash<QString, AttributeSet>> leaving(m_workspace.nodes.size());
  const auto attributesOf = [&](const WorkspaceLink& link) -> const AttributeSet& {
    QHash<QString, AttributeSet>& known = leaving[at(link.source)];
    const auto found = known.constFind(link.output);
    if (found != known.constEnd())
      return found.value();
    return known.insert(link.output, m_workspace.nodes[at(link.source)].leaving(link.output)).value();
  };

  for (const int target : m_order) {
    QHash<QString, AttributeSet> arriving;
    for (const int number : m_incoming[at(target)]) {
      const WorkspaceLink& link = m_workspace.links[at(number)];
      arriving[link.input].add(link.copies.applied(attributesOf(link)));
    }
    attribute_flow::enter(*m_workspace.nodes[at(target)].cfg, arriving);
  }
}
