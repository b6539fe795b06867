// The transformers of a workspace in their order, connected by named flows, each with the attributes that
// reach it.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

#include <QHash>
#include <QString>
#include <QStringList>

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
  // The flow of a feature type, and, of a reader with copied attributes, the one behind the copies.
  QString flowOfType(int node) const { return m_flows[at(node)].value(QString()); }
  const QString& flowBehindCopies(int node) const { return m_copiedFlows[at(node)]; }
  QStringList functionsOfType(int node) const { return m_functions[at(node)].value(QString()); }
  // The flow that leaves a link's source through its port.
  const QString& flowOf(const WorkspaceLink& link) const;

 private:
  static std::size_t at(int number) { return static_cast<std::size_t>(number); }
  bool findOrder();
  void reserveFixedNames(FlowNames& names, bool ofCustom);
  void addMembers(InnerNames& inner);
  void nameFlows();
  void connect();
  void pushAttributes();

  Workspace& m_workspace;
  orx::Findings& m_findings;
  std::vector<int> m_order;
  std::vector<QHash<QString, QString>> m_flows;          // per node: output tag to flow; "" for feature types
  std::vector<QHash<QString, QStringList>> m_functions;  // per node: output tag to output functions
  std::vector<QHash<QString, QStringList>> m_copies;  // per node: output tag to attributes that functions add
  std::vector<QString> m_copiedFlows;
  std::vector<std::vector<int>> m_incoming;
  bool m_isConnected;
};
