// The transformers of a workspace in their order, connected by named flows, each with the attributes that
// reach it.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/generation/CopiedFlows.h>
#include <translation/graph/Workspace.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <utility>
#include <vector>

class FlowNames;
class InnerNames;

// The factory that leads to a writer's feature type.
QString writerRouteName(const WorkspaceNode& writer);

class WorkspaceConnection {
 public:
  // Changes the transformers of the workspace. Neither is owned.
  WorkspaceConnection(Workspace& workspace, orx::Findings& findings);

  // Whether there is an order. Without one nothing is connected.
  bool isConnected() const { return m_isConnected; }
  // The transformers, each behind what feeds it.
  const std::vector<int>& order() const { return m_order; }
  // The links that lead to a node, in the order of the sources.
  const std::vector<int>& incoming(int node) const { return m_incoming[at(node)]; }
  QString flowOfType(int node) const { return m_flows[at(node)].value(QString()); }
  // The flow under which a link's features arrive.
  QString flowOf(const WorkspaceLink& link) const;
  // From the flows of a node on, the first of a pair, to those behind copied attributes.
  std::vector<std::pair<QString, CopiedFlows::Route>> copiesFrom(int node) const;

 private:
  static std::size_t at(int number) { return static_cast<std::size_t>(number); }
  bool findOrder();
  void reserveFixedNames(FlowNames& names, bool ofCustom);
  void addMembers(InnerNames& inner);
  void nameFlows();
  void nameCopies(FlowNames& names, InnerNames& inner);
  void connect();
  void pushAttributes();
  QString flowBeforeCopies(const WorkspaceLink& link) const {
    return m_flows[at(link.source)].value(link.output);
  }

  Workspace& m_workspace;
  orx::Findings& m_findings;
  std::vector<int> m_order;
  std::vector<QHash<QString, QString>> m_flows;  // per node: output tag to flow; "" for feature types
  CopiedFlows m_copied;
  std::vector<std::vector<int>> m_incoming;
  bool m_isConnected;
};
