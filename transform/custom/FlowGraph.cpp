#include <transform/custom/FlowGraph.h>

#include <boost/graph/compressed_sparse_row_graph.hpp>
#include <boost/graph/depth_first_search.hpp>

#include <algorithm>
#include <cstdint>
#include <limits>

using Graph = boost::compressed_sparse_row_graph<boost::directedS>;
using Node = Graph::vertex_descriptor;

namespace {

constexpr std::uint32_t kPlaced = std::numeric_limits<std::uint32_t>::max();

}

struct FlowGraph::Data {
  struct State {
    std::uint32_t discovered = 0;  // counted through all walks
    std::uint32_t low = 0;         // the oldest node that is reached and not placed yet
    bool feedsItself = false;
  };

  Graph graph;
  std::vector<State> states;
  std::vector<boost::default_color_type> colours;
  std::uint32_t clock = 1;
  std::vector<int> pending;   // discovered and not placed, in the order of discovery
  std::vector<int> finished;  // those of them whose feeders are done, in the order of that
  std::vector<Node> met;
};

// Strongly connected components by one depth-first walk: a component is complete when everything that feeds
// it is, so components come out in dependency order.
struct FlowGraph::Components : boost::default_dfs_visitor {
  void discover_vertex(Node node, const Graph&) {
    data->states[node] = {data->clock, data->clock, false};
    ++data->clock;
    data->pending.push_back(static_cast<int>(node));
    data->met.push_back(node);
  }
  // By value: in any other form the search does not find it.
  void finish_edge(Graph::edge_descriptor edge, const Graph& graph) {
    Data::State& state = data->states[source(edge, graph)];
    const Data::State& feeder = data->states[target(edge, graph)];
    state.low = std::min(state.low, feeder.low);
    state.feedsItself = state.feedsItself || &state == &feeder;
  }
  void finish_vertex(Node node, const Graph&) {
    data->finished.push_back(static_cast<int>(node));
    if (data->states[node].low != data->states[node].discovered)
      return;
    std::size_t begin = data->pending.size();
    do
      data->states[static_cast<Node>(data->pending[--begin])].low = kPlaced;
    while (data->pending[begin] != static_cast<int>(node));
    const int* const members = data->pending.data() + begin;
    const std::size_t count = data->pending.size() - begin;
    (*visit)({members, members + count, data->finished.data() + data->finished.size() - count,
              count > 1 || data->states[node].feedsItself});
    data->pending.resize(begin);
    data->finished.resize(data->finished.size() - count);
  }

  Data* data;
  const std::function<void(const Group&)>* visit;
};

FlowGraph::FlowGraph(std::size_t nodes, const std::vector<std::pair<int, int>>& edges)
    : m_data(new Data{Graph(boost::edges_are_unsorted_multi_pass, edges.begin(), edges.end(), nodes),
                      std::vector<Data::State>(nodes),
                      std::vector<boost::default_color_type>(nodes, boost::white_color),
                      1,
                      {},
                      {},
                      {}}) {}

FlowGraph::~FlowGraph() = default;

void FlowGraph::walk(const std::vector<int>& roots, const std::function<void(const Group&)>& visit) {
  Components components;
  components.data = m_data.get();
  components.visit = &visit;
  const auto index = get(boost::vertex_index, m_data->graph);
  for (const int root : roots) {
    const auto node = static_cast<Node>(root);
    if (m_data->colours[node] == boost::white_color)
      boost::depth_first_visit(m_data->graph, node, components,
                               boost::make_iterator_property_map(m_data->colours.begin(), index));
  }
  for (const Node node : std::exchange(m_data->met, {}))
    m_data->colours[node] = boost::white_color;
}
