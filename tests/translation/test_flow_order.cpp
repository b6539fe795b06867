#include <tests/support/QtPrinters.h>
#include <translation/generation/FlowNames.h>
#include <translation/graph/FlowOrder.h>

#include <gtest/gtest.h>

namespace {

struct OrderCase {
  const char* promise;
  int nodes;
  std::vector<std::pair<int, int>> edges;
  std::vector<int> order;
  std::vector<std::vector<int>> cycles;
};

TEST(FlowOrder, EachNodeStandsBehindWhatFeedsIt) {
  const OrderCase cases[] = {
      {"nothing", 0, {}, {}, {}},
      {"unlinked nodes keep document order", 3, {}, {0, 1, 2}, {}},
      {"a chain against document order", 3, {{2, 1}, {1, 0}}, {2, 1, 0}, {}},
      {"ties by document order", 5, {{4, 0}, {3, 1}}, {2, 3, 1, 4, 0}, {}},
      {"a freed node comes before later ones", 4, {{1, 0}}, {1, 0, 2, 3}, {}},
      {"parallel links count once", 3, {{1, 0}, {1, 0}, {2, 0}}, {1, 2, 0}, {}},
      {"a diamond", 4, {{0, 1}, {0, 2}, {1, 3}, {2, 3}}, {0, 1, 2, 3}, {}},
      {"a node that feeds itself", 2, {{1, 1}}, {0}, {{1}}},
      {"two circles and what hangs behind them",
       6,
       {{0, 1}, {1, 0}, {3, 4}, {4, 3}, {1, 2}},
       {5},
       {{0, 1}, {3, 4}}},
  };
  for (const OrderCase& test : cases) {
    const FlowOrder flow = flowOrder(test.nodes, test.edges);
    EXPECT_EQ(flow.order, test.order) << test.promise;
    EXPECT_EQ(flow.cycles, test.cycles) << test.promise;
  }
}

TEST(FlowOrder, LongChainsAndCirclesNeedNoStack) {
  constexpr int kNodes = 200000;
  std::vector<std::pair<int, int>> edges;
  for (int node = kNodes - 1; node > 0; --node)
    edges.emplace_back(node, node - 1);
  EXPECT_EQ(flowOrder(kNodes, edges).order.back(), 0);
  edges.emplace_back(0, kNodes - 1);
  const FlowOrder circle = flowOrder(kNodes, edges);
  ASSERT_EQ(circle.cycles.size(), 1u);
  EXPECT_EQ(circle.cycles.front().size(), static_cast<std::size_t>(kNodes));
}

TEST(FlowNames, EachNameIsGivenOutOnce) {
  FlowNames names;
  const std::pair<const char*, const char*> claims[] = {
      {"Roads", "Roads"},   {"Roads", "Roads_2"}, {"Roads_2", "Roads_2_2"}, {"Roads_4", "Roads_4"},
      {"Roads", "Roads_3"}, {"Roads", "Roads_5"}, {"roads", "roads"},       {"", ""},
      {"", "_2"},
  };
  for (const auto& [wanted, given] : claims)
    EXPECT_EQ(names.claim(wanted), QString(given)) << wanted;
}

}  // namespace
