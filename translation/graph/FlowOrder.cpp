#include <transform/custom/FlowGraph.h>
#include <translation/graph/FlowOrder.h>

#include <boost/graph/compressed_sparse_row_graph.hpp>
#include <boost/range/iterator_range.hpp>
#include <queue>

#include <algorithm>
#include <functional>
#include <numeric>

namespace {

using Graph = boost::compressed_sparse_row_graph<boost::directedS>;

std::vector<std::vector<int>> findCycles(std::size_t nodeCount,
                                         const std::vector<std::pair<int, int>>& edges) {
  std::vector<int> nodes(nodeCount);
  std::iota(nodes.begin(), nodes.end(), 0);
  std::vector<std::vector<int>> cycles;
  // They are the same ones whichever way the edges lead.
  FlowGraph(nodeCount, edges).walk(nodes, [&](const FlowGraph::Group& group) {
    if (!group.isCycle)
      return;
    cycles.emplace_back(group.begin, group.end);
    std::sort(cycles.back().begin(), cycles.back().end());
  });
  std::sort(cycles.begin(), cycles.end());
  return cycles;
}

}  // namespace

FlowOrder flowOrder(int nodeCount, const std::vector<std::pair<int, int>>& edges) {
  const Graph graph(boost::edges_are_unsorted_multi_pass, edges.begin(), edges.end(),
                    static_cast<std::size_t>(nodeCount));
  std::vector<int> feeders(static_cast<std::size_t>(nodeCount), 0);
  for (const auto& edge : edges)
    ++feeders[static_cast<std::size_t>(edge.second)];

  // The library's own topological sort settles ties by its walk; document order needs the smallest ready
  // node.
  std::priority_queue<int, std::vector<int>, std::greater<>> ready;
  for (int node = 0; node < nodeCount; ++node) {
    if (feeders[static_cast<std::size_t>(node)] == 0)
      ready.push(node);
  }
  FlowOrder result;
  result.order.reserve(static_cast<std::size_t>(nodeCount));
  while (!ready.empty()) {
    const int node = ready.top();
    ready.pop();
    result.order.push_back(node);
    for (const auto& edge :
         boost::make_iterator_range(boost::out_edges(static_cast<std::size_t>(node), graph))) {
      const std::size_t target = boost::target(edge, graph);
      if (--feeders[target] == 0)
        ready.push(static_cast<int>(target));
    }
  }
  if (static_cast<int>(result.order.size()) != nodeCount)
    result.cycles = findCycles(feeders.size(), edges);
  return result;
}
