// Puts what feeds the outputs of one network into dependency order.
//
// The links are read once for all outputs. From then on time is proportional, for each output, to the nodes
// that feed it and the links between them; no recursion, so that chains of any length work.
#pragma once

#include <transform/custom/network/NetworkOrder.h>

#include <cstdint>

// The network must not change meanwhile.
class NetworkSorter {
 public:
  // `nodes` is how many there may be.
  explicit NetworkSorter(std::size_t nodes);
  // The node and everything upstream of it.
  NetworkOrder sort(SubDocNetworkObj& output);

 private:
  struct State {
    std::uint32_t discovered = 0;  // counted through all calls; what is older than the call is unknown to it
    std::uint32_t low = 0;         // the oldest node that is reached and not placed yet
  };
  // A walk over the feeders of one node that can be interrupted.
  struct Walk {
    std::uint32_t node;
    std::uint32_t next;
    bool feedsItself = false;
  };

  std::uint32_t numberOf(SubDocNetworkObj& node, std::uint32_t serial);
  std::uint32_t readUpstream(SubDocNetworkObj& node);
  void discover(std::uint32_t node);
  void place(std::uint32_t first, bool feedsItself, NetworkOrder& order);

  // The nodes met so far by number, and the numbers of their feeders: those of node n stand in m_feeders from
  // m_rows[n] to before m_rows[n + 1], ports in name order, links in the order of adding.
  std::vector<SubDocNetworkObj*> m_nodes;
  std::vector<std::uint32_t> m_numbers;  // by the serial of the node, so that known nodes need not be read
  std::vector<std::uint32_t> m_rows;
  std::vector<std::uint32_t> m_feeders;

  std::vector<State> m_states;
  std::vector<Walk> m_open;
  std::vector<std::uint32_t> m_pending;   // discovered and not placed, in the order of discovery
  std::vector<std::uint32_t> m_finished;  // those of them whose feeders are done, in the order of that
  std::uint32_t m_clock = 1;
};
