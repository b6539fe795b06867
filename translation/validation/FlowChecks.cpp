#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/SubDocNetworkObjXformer.h>
#include <transform/text/MessageNumbers.h>
#include <translation/validation/FlowChecks.h>

namespace messages = orx::messages;

using orx::Rule;

namespace {

std::size_t at(int number) {
  return static_cast<std::size_t>(number);
}

void reportUnfed(const TransformerCfg& cfg, const QSet<QString>& fed, int line, const QString& title,
                 orx::Findings& diagnostics) {
  QStringList tags;
  cfg.getInputTags(tags);
  for (const QString& tag : tags) {
    if (!fed.contains(tag) && tag != cfg.getHiddenInputTag())
      diagnostics.report(Rule::UnfedInput, line, title, {tag});
  }
}

void reportDropped(const TransformerCfg& cfg, const QSet<QString>& taken, int line, const QString& title,
                   orx::Findings& diagnostics) {
  QStringList tags;
  cfg.getOutputTags(tags);
  tags.removeAll(cfg.getHiddenOutputTag());
  // Further outputs are often left alone on purpose (the rejected, the members of a group); the first is what
  // the node is for.
  if (tags.isEmpty() || taken.contains(tags.first()))
    return;
  QStringList dropped;
  for (const QString& tag : tags) {
    if (!taken.contains(tag))
      dropped.append(tag);
  }
  diagnostics.report(Rule::DroppedOutput, line, title, {dropped.join(QLatin1String(", "))});
}

QSet<QString> connectedPorts(const SubDocNetworkObj::Ports& ports) {
  QSet<QString> names;
  for (const auto& [port, links] : ports) {
    if (!links.empty())
      names.insert(port);
  }
  return names;
}

}  // namespace

FlowChecks::FlowChecks(const Workspace& workspace)
    : m_workspace(workspace),
      m_fed(workspace.nodes.size()),
      m_taken(workspace.nodes.size()),
      m_isKnown(workspace.nodes.size(), true) {
  for (const WorkspaceLink& link : workspace.links) {
    m_fed[at(link.target)].insert(link.input);
    m_taken[at(link.source)].insert(link.output);
  }
  findUnknownFlows();
}

void FlowChecks::findUnknownFlows() {
  std::vector<std::vector<int>> targets(m_workspace.nodes.size());
  for (const WorkspaceLink& link : m_workspace.links)
    targets[at(link.source)].push_back(link.target);
  std::vector<int> open;
  for (std::size_t number = 0; number < m_workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = m_workspace.nodes[number];
    const bool isUnfed = node.isTransformer() && m_fed[number].isEmpty() && !node.cfg->getIsSource();
    if (node.lacksInputLink || isUnfed)
      open.push_back(static_cast<int>(number));
  }
  while (!open.empty()) {
    const int node = open.back();
    open.pop_back();
    if (!m_isKnown[at(node)])
      continue;
    m_isKnown[at(node)] = false;
    open.insert(open.end(), targets[at(node)].begin(), targets[at(node)].end());
  }
}

void FlowChecks::report(orx::Findings& diagnostics) const {
  for (std::size_t number = 0; number < m_workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = m_workspace.nodes[number];
    if (!node.lacksInputLink && node.kind != WorkspaceNode::Kind::Reader)
      reportInputs(node, m_fed[number], diagnostics);
    if (!node.lacksOutputLink && node.kind != WorkspaceNode::Kind::Writer)
      reportOutputs(node, m_taken[number], diagnostics);
  }
}

void FlowChecks::reportInputs(const WorkspaceNode& node, const QSet<QString>& fed,
                              orx::Findings& diagnostics) {
  if (node.isTransformer())
    reportUnfed(*node.cfg, fed, node.line, node.name, diagnostics);
  else if (fed.isEmpty())
    diagnostics.report(Rule::UnfedWriter, node.line, node.name);
}

void FlowChecks::reportOutputs(const WorkspaceNode& node, const QSet<QString>& taken,
                               orx::Findings& diagnostics) {
  if (node.isTransformer())
    reportDropped(*node.cfg, taken, node.line, node.name, diagnostics);
  else if (taken.isEmpty())
    diagnostics.report(Rule::UnusedReader, node.line, node.name);
}

void reportFlowsInside(const ExternalDocNetwork& network, orx::Findings& diagnostics) {
  for (const SubDocNetworkObj* node : network.nodes()) {
    const QString title = network.getName() + QLatin1Char('/') + node->name();
    const auto* inner = dynamic_cast<const SubDocNetworkObjXformer*>(node);
    if (!node->lacksInputLink()) {
      if (inner)
        reportUnfed(*inner->getTransformer(), connectedPorts(node->feeders()), node->line(), title,
                    diagnostics);
      else if (node->kind() == SubDocNetworkObj::Kind::Output && node->feeders().empty())
        diagnostics.reportAs(Rule::UnfedWriter, messages::kUnfedOutputPort, node->line(), title);
    }
    if (!node->lacksOutputLink()) {
      if (inner)
        reportDropped(*inner->getTransformer(), connectedPorts(node->consumers()), node->line(), title,
                      diagnostics);
      else if (node->kind() == SubDocNetworkObj::Kind::Input && node->consumers().empty())
        diagnostics.reportAs(Rule::UnusedReader, messages::kUnusedInputPort, node->line(), title);
    }
  }
}
