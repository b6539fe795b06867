#include <transform/core/TransformerCfg.h>
#include <translation/FlowChecks.h>

namespace {

std::size_t at(int number) {
  return static_cast<std::size_t>(number);
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

void FlowChecks::report(Diagnostics& diagnostics) const {
  for (std::size_t number = 0; number < m_workspace.nodes.size(); ++number) {
    const WorkspaceNode& node = m_workspace.nodes[number];
    if (!node.lacksInputLink && node.kind != WorkspaceNode::Kind::Reader)
      reportInputs(node, m_fed[number], diagnostics);
    if (!node.lacksOutputLink && node.kind != WorkspaceNode::Kind::Writer)
      reportOutputs(node, m_taken[number], diagnostics);
  }
}

void FlowChecks::reportInputs(const WorkspaceNode& node, const QSet<QString>& fed, Diagnostics& diagnostics) {
  if (!node.isTransformer()) {
    if (fed.isEmpty())
      diagnostics.report(Rule::UnfedWriter, node.line, node.name);
    return;
  }
  QStringList tags;
  node.cfg->getInputTags(tags);
  for (const QString& tag : tags) {
    if (!fed.contains(tag) && tag != node.cfg->getHiddenInputTag())
      diagnostics.report(Rule::UnfedInput, node.line, node.name, {tag});
  }
}

void FlowChecks::reportOutputs(const WorkspaceNode& node, const QSet<QString>& taken,
                               Diagnostics& diagnostics) {
  if (!node.isTransformer()) {
    if (taken.isEmpty())
      diagnostics.report(Rule::UnusedReader, node.line, node.name);
    return;
  }
  QStringList tags;
  node.cfg->getOutputTags(tags);
  tags.removeAll(node.cfg->getHiddenOutputTag());
  // Further outputs are often left alone on purpose (the rejected, the members of a group); the first is what
  // the node is for.
  if (tags.isEmpty() || taken.contains(tags.first()))
    return;
  QStringList dropped;
  for (const QString& tag : tags) {
    if (!taken.contains(tag))
      dropped.append(tag);
  }
  diagnostics.report(Rule::DroppedOutput, node.line, node.name, {dropped.join(QLatin1String(", "))});
}
