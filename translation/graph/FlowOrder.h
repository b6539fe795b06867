// The order in which nodes are written: each behind all that feed it.
#pragma once

#include <utility>
#include <vector>

struct FlowOrder {
  std::vector<int> order;                // every node, unless there are cycles
  std::vector<std::vector<int>> cycles;  // groups of nodes that feed each other, members ascending
};

// Nodes are numbered from 0 in document order; an edge leads from a feeding node to the node that it feeds.
// Among nodes that could come next, the one first in the document does. Time and memory grow with nodes and
// edges; no recursion.
FlowOrder flowOrder(int nodeCount, const std::vector<std::pair<int, int>>& edges);
