// The part of a network that feeds one output: its nodes in dependency order, and its cycles.
#pragma once

#include <cstddef>
#include <vector>

class SubDocNetworkObj;

struct NetworkOrder {
  // Nodes that feed each other: those from `begin` to before `end` of `nodes`.
  struct Cycle {
    std::size_t begin = 0;
    std::size_t end = 0;
    // The same nodes, each behind those that feed it as far as the cycle allows.
    std::vector<SubDocNetworkObj*> flow;
  };

  // Every node stands behind the nodes that feed it. Nodes that do not feed each other, and the nodes of a
  // cycle, stand as in the list of ancestors.
  std::vector<SubDocNetworkObj*> nodes;
  std::vector<Cycle> cycles;
};
