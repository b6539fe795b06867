// What is wrong with the way features take through a workspace: inputs that nothing feeds, features that
// nothing takes, and where, in consequence, nobody can tell which attributes arrive.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

#include <QSet>
#include <QString>

#include <vector>

class ExternalDocNetwork;

class FlowChecks {
 public:
  // Not owned. Looks at the links once.
  explicit FlowChecks(const Workspace& workspace);

  // Ends that a link leads to which had to be left out are passed over: the link's own finding is enough.
  void report(orx::Findings& diagnostics) const;
  // Whether everything that flows into the node is known; where it is not, attributes may only seem to be
  // missing.
  bool knowsWhatArrives(int node) const { return m_isKnown[static_cast<std::size_t>(node)]; }

 private:
  void findUnknownFlows();
  static void reportInputs(const WorkspaceNode& node, const QSet<QString>& fed, orx::Findings& diagnostics);
  static void reportOutputs(const WorkspaceNode& node, const QSet<QString>& taken,
                            orx::Findings& diagnostics);

  const Workspace& m_workspace;
  std::vector<QSet<QString>> m_fed;    // per node: inputs that a link leads to
  std::vector<QSet<QString>> m_taken;  // per node: outputs that a link leaves by
  std::vector<bool> m_isKnown;
};

// The same for the inside of a custom transformer.
void reportFlowsInside(const ExternalDocNetwork& network, orx::Findings& diagnostics);
