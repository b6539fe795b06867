#include <transform/custom/SubDocNetworkObj.h>
#include <transform/custom/network/NetworkSorter.h>

#include <algorithm>
#include <limits>

namespace {

constexpr std::uint32_t kUnknown = std::numeric_limits<std::uint32_t>::max();
constexpr std::uint32_t kPlaced = std::numeric_limits<std::uint32_t>::max();

}  // namespace

NetworkSorter::NetworkSorter(std::size_t nodes) {
  m_nodes.reserve(nodes);
  m_numbers.resize(nodes, kUnknown);
  m_rows.reserve(nodes + 1);
  m_rows.push_back(0);
  m_feeders.reserve(2 * nodes);
  m_states.reserve(nodes);
  m_open.reserve(nodes);
  m_pending.reserve(nodes);
  m_finished.reserve(nodes);
}

std::uint32_t NetworkSorter::numberOf(SubDocNetworkObj& node, std::uint32_t serial) {
  if (serial >= m_numbers.size())
    m_numbers.resize(std::max<std::size_t>(serial + 1, 2 * m_numbers.size()), kUnknown);
  std::uint32_t& number = m_numbers[serial];
  if (number == kUnknown) {
    number = static_cast<std::uint32_t>(m_nodes.size());
    m_nodes.push_back(&node);
  }
  return number;
}

std::uint32_t NetworkSorter::readUpstream(SubDocNetworkObj& node) {
  const std::uint32_t number = numberOf(node, node.m_serial);
  while (m_rows.size() <= m_nodes.size()) {
    for (const SubDocNetworkObj::Source& source : m_nodes[m_rows.size() - 1]->sources())
      m_feeders.push_back(numberOf(*source.node, source.serial));
    m_rows.push_back(static_cast<std::uint32_t>(m_feeders.size()));
  }
  m_states.resize(m_nodes.size());
  return number;
}

void NetworkSorter::discover(std::uint32_t node) {
  m_states[node] = {m_clock, m_clock};
  ++m_clock;
  m_pending.push_back(node);
  m_open.push_back({node, m_rows[node]});
}

// Takes the nodes from `first` on, which feed each other, out of those that are pending.
void NetworkSorter::place(std::uint32_t first, bool feedsItself, NetworkOrder& order) {
  std::size_t count = 1;
  while (m_pending[m_pending.size() - count] != first)
    ++count;
  if (count > 1 || feedsItself) {
    NetworkOrder::Cycle cycle;
    cycle.begin = order.nodes.size();
    cycle.end = cycle.begin + count;
    for (std::size_t at = m_finished.size() - count; at < m_finished.size(); ++at)
      cycle.flow.push_back(m_nodes[m_finished[at]]);
    order.cycles.push_back(std::move(cycle));
  }
  for (std::size_t at = m_pending.size() - count; at < m_pending.size(); ++at) {
    m_states[m_pending[at]].low = kPlaced;
    order.nodes.push_back(m_nodes[m_pending[at]]);
  }
  m_pending.resize(m_pending.size() - count);
  m_finished.resize(m_finished.size() - count);
}

// Strongly connected components by one depth-first walk, which meets the nodes in the order of the ancestor
// list: a component is complete when everything that feeds it is, so components come out in dependency order.
NetworkOrder NetworkSorter::sort(SubDocNetworkObj& output) {
  NetworkOrder order;
  const std::uint32_t root = readUpstream(output);
  order.nodes.reserve(m_nodes.size());
  const std::uint32_t begin = m_clock;
  discover(root);
  while (!m_open.empty()) {
    Walk& walk = m_open.back();
    State& state = m_states[walk.node];
    if (walk.next < m_rows[walk.node + 1]) {
      const std::uint32_t feeder = m_feeders[walk.next++];
      if (m_states[feeder].discovered < begin) {
        discover(feeder);
      } else {
        state.low = std::min(state.low, m_states[feeder].low);
        walk.feedsItself = walk.feedsItself || feeder == walk.node;
      }
      continue;
    }
    const Walk done = walk;
    m_open.pop_back();
    m_finished.push_back(done.node);
    if (!m_open.empty()) {
      State& below = m_states[m_open.back().node];
      below.low = std::min(below.low, state.low);
    }
    if (state.low == state.discovered)
      place(done.node, done.feedsItself, order);
  }
  order.nodes.shrink_to_fit();
  return order;
}
