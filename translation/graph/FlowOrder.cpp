#include <translation/graph/FlowOrder.h>

#include <boost/graph/compressed_sparse_row_graph.hpp>
#include <boost/graph/strong_components.hpp>
#include <boost/range/iterator_range.hpp>
#include <queue>

#include <algorithm>
#include <functional>

namespace {

using Graph = boost::compressed_sparse_row_graph<boost::directedS>;

std::vector<std::vector<int>> findCycles(const Graph& graph, const std::vector<std::pair<int, int>>& edges) {
  const std::size_t nodeCount = boost::num_vertices(graph);
  std::vector<int> component(nodeCount);
  const auto index = boost::get(boost::vertex_index, graph);
  const int componentCount =
      boost::strong_components(graph, boost::make_iterator_property_map(component.begin(), index));

  std::vector<std::vector<int>> members(static_cast<std::size_t>(componentCount));
  for (std::size_t node = 0; node < nodeCount; ++node)
    members[static_cast<std::size_t>(component[node])].push_back(static_cast<int>(node));
  std::vector<bool> feedsItself(nodeCount, false);
  for (const auto& [from, to] : edges) {
    if (from == to)
      feedsItself[static_cast<std::size_t>(from)] = true;
  }

  std::vector<std::vector<int>> cycles;
  for (std::vector<int>& group : members) {
    if (group.size() > 1 || feedsItself[static_cast<std::size_t>(group.front())])
      cycles.push_back(std::move(group));
  }
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
    result.cycles = findCycles(graph, edges);
  return result;
}
