// The part of a network that feeds one output: its nodes in dependency order, and its cycles.
//
// Time and memory are proportional to those nodes and the links between them; no recursion, so that chains of
// any length work.
#pragma once

#include <platform/Export.h>

#include <QtGlobal>

#include <vector>

class SubDocNetworkObj;

// A set of nodes of one network. Of several sets on the same nodes only the one made last may be used.
class ORX_EXPORT NodeSet {
 public:
  NodeSet();
  // False when it was there already.
  bool insert(SubDocNetworkObj& node);
  bool contains(const SubDocNetworkObj& node) const;

 private:
  quint64 m_mark;
};

class ORX_EXPORT NetworkOrder {
 public:
  // Nodes that feed each other: those from `begin` to before `end` of nodes().
  struct Cycle {
    std::size_t begin = 0;
    std::size_t end = 0;
    // The same nodes, each behind those that feed it as far as the cycle allows.
    std::vector<SubDocNetworkObj*> flow;
  };

  // The node and everything upstream of it, depth first, ports in name order, links in the order of adding.
  static void appendAncestors(SubDocNetworkObj& node, std::vector<SubDocNetworkObj*>& list, NodeSet& set);

  NetworkOrder() = default;
  // Orders a list of ancestors: every node stands behind the nodes of the list that feed it. Nodes that do
  // not feed each other, and the nodes of a cycle, keep the order of the list.
  explicit NetworkOrder(const std::vector<SubDocNetworkObj*>& ancestors);

  const std::vector<SubDocNetworkObj*>& nodes() const { return m_nodes; }
  const std::vector<Cycle>& cycles() const { return m_cycles; }

 private:
  std::vector<SubDocNetworkObj*> m_nodes;
  std::vector<Cycle> m_cycles;
};
