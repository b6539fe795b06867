// Who feeds whom, and in which order that has to be worked out. Time and memory grow with nodes and edges; no
// recursion, so that chains of any length work.
#pragma once

#include <platform/Export.h>

#include <functional>
#include <memory>
#include <utility>
#include <vector>

class ORX_EXPORT FlowGraph {
 public:
  // Nodes that feed each other, or one that stands alone.
  struct Group {
    const int* begin;  // in the order in which the walk met them
    const int* end;
    const int* flow;  // the same nodes, each behind those that feed it as far as a cycle allows
    bool isCycle;
  };

  // Nodes are numbered from 0; an edge leads from a node to one that feeds it.
  FlowGraph(std::size_t nodes, const std::vector<std::pair<int, int>>& edges);
  ~FlowGraph();

  // Calls `visit` with the groups of the roots and of all upstream of them, each behind those that feed it.
  // Feeders are met in the order of their edges. A walk takes no time for nodes that it does not meet.
  void walk(const std::vector<int>& roots, const std::function<void(const Group&)>& visit);

 private:
  struct Data;
  struct Components;
  const std::unique_ptr<Data> m_data;
};
