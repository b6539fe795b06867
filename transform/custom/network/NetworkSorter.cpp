#include <transform/custom/SubDocNetworkObj.h>
#include <transform/custom/network/NetworkSorter.h>

NetworkSorter::NetworkSorter(const std::list<SubDocNetworkObj*>& nodes) {
  std::vector<std::pair<int, int>> edges;
  edges.reserve(2 * nodes.size());
  for (SubDocNetworkObj* node : nodes) {
    if (node->m_serial >= m_nodes.size())
      m_nodes.resize(node->m_serial + std::size_t(1));
    m_nodes[node->m_serial] = node;
    // Ports in name order, links in the order of adding.
    for (const SubDocNetworkObj::Source& source : node->sources())
      edges.emplace_back(node->m_serial, source.serial);
  }
  m_graph.emplace(m_nodes.size(), edges);
}

NetworkOrder NetworkSorter::sort(const SubDocNetworkObj& output) {
  NetworkOrder order;
  m_graph->walk({static_cast<int>(output.m_serial)}, [&](const FlowGraph::Group& group) {
    const auto add = [this](const int* begin, const int* end, std::vector<SubDocNetworkObj*>& to) {
      for (; begin != end; ++begin)
        to.push_back(m_nodes[static_cast<std::size_t>(*begin)]);
    };
    const std::size_t begin = order.nodes.size();
    add(group.begin, group.end, order.nodes);
    if (!group.isCycle)
      return;
    order.cycles.push_back({begin, order.nodes.size(), {}});
    add(group.flow, group.flow + (group.end - group.begin), order.cycles.back().flow);
  });
  order.nodes.shrink_to_fit();
  return order;
}
