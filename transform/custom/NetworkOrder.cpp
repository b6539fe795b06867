#include <transform/custom/NetworkOrder.h>
#include <transform/custom/SubDocNetworkObj.h>

#include <algorithm>
#include <atomic>

namespace {

// A walk over the feeders of one node that can be interrupted.
struct FeederWalk {
  explicit FeederWalk(SubDocNetworkObj& walked)
      : node(&walked), port(walked.feeders().begin()), end(walked.feeders().end()) {}

  // Null at the end.
  SubDocNetworkObj* next() {
    while (port != end) {
      if (link < port->second.size())
        return port->second[link++].node;
      ++port;
      link = 0;
    }
    return nullptr;
  }

  SubDocNetworkObj* node;
  SubDocNetworkObj::Ports::const_iterator port;
  SubDocNetworkObj::Ports::const_iterator end;
  std::size_t link = 0;
};

quint64 nextMark() {
  static std::atomic<quint64> last{0};
  return ++last;
}

}  // namespace

NodeSet::NodeSet() : m_mark(nextMark()) {}

bool NodeSet::insert(SubDocNetworkObj& node) {
  if (node.m_mark == m_mark)
    return false;
  node.m_mark = m_mark;
  return true;
}

bool NodeSet::contains(const SubDocNetworkObj& node) const {
  return node.m_mark == m_mark;
}

void NetworkOrder::appendAncestors(SubDocNetworkObj& node, std::vector<SubDocNetworkObj*>& list,
                                   NodeSet& set) {
  if (!set.insert(node))
    return;
  list.push_back(&node);
  std::vector<FeederWalk> open;
  open.emplace_back(node);
  while (!open.empty()) {
    SubDocNetworkObj* feeder = open.back().next();
    if (!feeder) {
      open.pop_back();
    } else if (set.insert(*feeder)) {
      list.push_back(feeder);
      open.emplace_back(*feeder);
    }
  }
}

// Strongly connected components by one depth-first walk: a component is complete when everything that feeds
// it is, so components come out in dependency order.
NetworkOrder::NetworkOrder(const std::vector<SubDocNetworkObj*>& ancestors) {
  const int count = static_cast<int>(ancestors.size());
  for (int position = 0; position < count; ++position)
    ancestors[static_cast<std::size_t>(position)]->m_position = position;
  const auto positionOf = [&](const SubDocNetworkObj& node) {
    const int position = node.m_position;
    return position >= 0 && position < count && ancestors[static_cast<std::size_t>(position)] == &node
               ? position
               : -1;
  };

  constexpr int kNone = -1;
  struct State {
    int discovered = kNone;
    int low = 0;
    int cycle = kNone;
    bool isPending = false;
    bool feedsItself = false;
  };
  std::vector<State> states(ancestors.size());
  const auto state = [&](int position) -> State& { return states[static_cast<std::size_t>(position)]; };
  std::vector<int> pending;   // discovered, component not complete
  std::vector<int> finished;  // in the order in which all their feeders were done
  std::vector<FeederWalk> open;
  int clock = 0;
  m_nodes.reserve(ancestors.size());

  const auto enter = [&](int position) {
    state(position).discovered = state(position).low = clock++;
    state(position).isPending = true;
    pending.push_back(position);
    open.emplace_back(*ancestors[static_cast<std::size_t>(position)]);
  };
  const auto complete = [&](int root) {
    auto first = pending.end();
    do {
      --first;
      state(*first).isPending = false;
    } while (*first != root);
    if (pending.end() - first > 1 || state(root).feedsItself) {
      std::sort(first, pending.end());
      Cycle cycle;
      cycle.begin = m_nodes.size();
      cycle.end = cycle.begin + static_cast<std::size_t>(pending.end() - first);
      for (auto at = first; at != pending.end(); ++at)
        state(*at).cycle = static_cast<int>(m_cycles.size());
      m_cycles.push_back(std::move(cycle));
    }
    for (auto at = first; at != pending.end(); ++at)
      m_nodes.push_back(ancestors[static_cast<std::size_t>(*at)]);
    pending.erase(first, pending.end());
  };

  for (int start = 0; start < count; ++start) {
    if (state(start).discovered != kNone)
      continue;
    enter(start);
    while (!open.empty()) {
      const int current = positionOf(*open.back().node);
      SubDocNetworkObj* feeder = open.back().next();
      if (feeder) {
        const int next = positionOf(*feeder);
        if (next == kNone)
          continue;
        if (next == current)
          state(current).feedsItself = true;
        if (state(next).discovered == kNone)
          enter(next);
        else if (state(next).isPending)
          state(current).low = std::min(state(current).low, state(next).discovered);
        continue;
      }
      open.pop_back();
      finished.push_back(current);
      if (!open.empty()) {
        const int below = positionOf(*open.back().node);
        state(below).low = std::min(state(below).low, state(current).low);
      }
      if (state(current).low == state(current).discovered)
        complete(current);
    }
  }
  if (m_cycles.empty())
    return;
  for (const int position : finished) {
    if (state(position).cycle != kNone)
      m_cycles[static_cast<std::size_t>(state(position).cycle)].flow.push_back(
          ancestors[static_cast<std::size_t>(position)]);
  }
}
