// Puts what feeds the outputs of one network into dependency order. The links are read once for all outputs.
#pragma once

#include <transform/custom/FlowGraph.h>
#include <transform/custom/network/NetworkOrder.h>

#include <list>
#include <optional>

// The network must not change meanwhile.
class NetworkSorter {
 public:
  explicit NetworkSorter(const std::list<SubDocNetworkObj*>& nodes);
  // The node and everything upstream of it.
  NetworkOrder sort(const SubDocNetworkObj& output);

 private:
  std::vector<SubDocNetworkObj*> m_nodes;  // by serial
  std::optional<FlowGraph> m_graph;
};
