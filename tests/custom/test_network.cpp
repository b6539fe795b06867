#include "CustomFixtures.h"
#include <transform/custom/SubDocNetworkObj.h>
#include <transform/custom/network/NetworkSorter.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <random>

namespace {

struct Propagation {
  const char* what;
  const char* graph;  // lines of assemble(), separated by ";"
  const char* output;
  const char* attributes;
  const char* upstreamInputs;
};

// Every input receives the attribute of its own name in lower case, and "k".
const Propagation kPropagations[] = {
    {"nothing feeds the output", "out O", "O", "", ""},
    {"unknown output", "in A;out O;A -> O", "X", "", ""},
    {"straight through", "in A;out O;A -> O", "O", "a,k", "A"},
    {"own list, whatever arrives", "in A;own O x,y;A -> O", "O", "x,y", "A"},
    {"own list without a feeder", "own O a,b", "O", "a,b", ""},
    {"added on the way", "in A;out O;add T x;A -> T;T -> O", "O", "a,k,x", "A"},
    {"two inputs, first link first", "in B;in A;out O;A -> O;B -> O", "O", "a,k,b", "A,B"},
    {"only what feeds this output", "in A;in B;out O;out P;A -> O;B -> P", "P", "b,k", "B"},
    {"diamond", "in A;out O;add S s;add T t;pass U;A -> S;A -> T;S -> U;T -> U;U -> O", "O", "a,k,s,t", "A"},
    {"order against the numbers", "out O;add T t;add S s;in A;T -> O;S -> T;A -> S", "O", "a,k,s,t", "A"},
    {"circle of two behind an input", "in A;out O;add S s;add T t;A -> S;T -> S;S -> T;T -> O", "O",
     "a,k,t,s", "A"},
    {"a circle that the output reaches at its head", "in A;out O;add S s;add T t;A -> S;T -> S;S -> T;S -> O",
     "O", "a,k,t,s", "A"},
    {"feeds itself", "in A;out O;add S s;A -> S;S -> S;S -> O", "O", "a,k,s", "A"},
    {"circle without an input", "out O;add S s;add T t;S -> T;T -> S;T -> O", "O", "s,t", ""},
    {"through a loop point", "in A;out O;loop L;add T t;A -> T;T -> L;L -> O", "O", "a,k,t", "A"},
    {"sent back to an input", "in A;out O;loop L;add T t;A -> T;T -> L;L -> A;T -> O", "O", "a,k,t", "A"},
    {"nested", "in A;out O;use T;A -> T;T -> O", "O", "a,k,x", "A"},
    {"nested twice, each with its own", "in A;in B;out O;out P;use S;use T;A -> S;B -> T;S -> O;T -> P", "P",
     "b,k,x", "B"},
    {"nested behind each other", "in A;in B;out O;use S;use T;A -> S;B -> T;S -> T;T -> O", "O", "a,b,k,x",
     "B,A"},
    {"nested in a circle", "in A;out O;use T;add S s;A -> T;T -> S;S -> T;S -> O", "O", "a,k,x,s", "A"},
};

TEST(Network, PropagatesAttributes) {
  OpenNetwork inner("Inner");
  assemble(inner, {"in IN", "out OUT", "add T x", "IN -> T", "T -> OUT"});
  for (const Propagation& row : kPropagations) {
    OpenNetwork network;
    assemble(network, QString::fromLatin1(row.graph).split(';'), &inner);
    for (const QString& input : network.getInputs())
      network.setInputAttributes(input, {input.toLower(), "k"});
    const QString output = row.output;
    // Asked twice: what a query left behind must not show in the next.
    network.attributesOf(output);
    QStringList attributes = network.attributesOf(output);
    QStringList expected = names(row.attributes);
    EXPECT_EQ(attributes.size(), expected.size()) << row.what;
    attributes.sort();
    expected.sort();
    EXPECT_EQ(attributes, expected) << row.what << ": " << qPrintable(attributes.join(','));
    EXPECT_EQ(network.getUpstreamInputs(output), names(row.upstreamInputs)) << row.what;
  }
}

TEST(Network, TellsWhereAttributesComeFrom) {
  OpenNetwork network;
  assemble(network, {"in A", "add T t", "out O", "A -> T", "T -> O"});
  network.setStaticInputAttributes("A", {"declared"});
  network.setInputAttributes(QHash<QString, QStringList>{{"A", {"a"}}});
  QHash<QString, QString> origins;
  EXPECT_EQ(network.getOutputAttributes("O", origins), names("declared,a,t"));
  EXPECT_EQ(origins.value("a"), "A");
  EXPECT_EQ(origins.value("t"), "T");
  EXPECT_EQ(network.getInputAttributes("A", false), names("a"));
  EXPECT_EQ(network.getInputAttributes("A", true), names("declared,a"));
  EXPECT_EQ(network.getInputAttributes("O", true), QStringList());
}

// The list and the order of a graph whose circle stands between an input and the output.
TEST(Network, OrdersAncestors) {
  OpenNetwork network;
  assemble(
      network,
      QStringLiteral("out O;in B;in A;pass S;pass T;pass U;S -> O;U -> O;T -> S;A -> S;S -> T;B -> T;A -> U")
          .split(';'));
  std::vector<SubDocNetworkObj*> ancestors;
  OpenNetwork::NodeSet set;
  OpenNetwork::createAncestorList(network.nodeByNumber(0), ancestors, set);
  const auto namesOf = [](const std::vector<SubDocNetworkObj*>& nodes) {
    QStringList list;
    for (const SubDocNetworkObj* node : nodes)
      list.append(node->name());
    return list.join(' ');
  };
  EXPECT_EQ(namesOf(ancestors), "O S T B A U");
}

// Each ancestor stands once, each cycle in one piece, and all that feeds a node stands before it or shares
// its cycle.
TEST(Network, OrdersRandomGraphs) {
  constexpr int kMostNodes = 10;
  std::mt19937 random(1);
  for (int graph = 0; graph < 300; ++graph) {
    const int count = 2 + static_cast<int>(random() % (kMostNodes - 1));
    OpenNetwork network;
    network.addOutput("O", 0, kOutgoingArriving, {}, 0);
    for (int number = 1; number < count; ++number)
      network.addLoop(QString::number(number), number);
    bool reaches[kMostNodes][kMostNodes] = {};
    for (int links = static_cast<int>(random() % 20); links >= 0; --links) {
      const int from = static_cast<int>(random() % static_cast<unsigned>(count));
      const int to = static_cast<int>(random() % static_cast<unsigned>(count));
      network.addLink(from, "P", to, QString::number(random() % 3));
      reaches[from][to] = true;
    }
    for (int at = 0; at < count * count * count; ++at) {
      const int by = at / count / count, from = at / count % count, to = at % count;
      reaches[from][to] = reaches[from][to] || (reaches[from][by] && reaches[by][to]);
    }
    const NetworkOrder order = NetworkSorter(network.nodes()).sort(*network.nodeByNumber(0));
    int places[kMostNodes];
    std::fill_n(places, kMostNodes, -1);
    for (std::size_t i = 0; i < order.nodes.size(); ++i)
      places[order.nodes[i]->number()] = static_cast<int>(i);
    std::vector<int> cycleOf(order.nodes.size(), -1);
    for (std::size_t cycle = 0; cycle < order.cycles.size(); ++cycle) {
      for (std::size_t i = order.cycles[cycle].begin; i < order.cycles[cycle].end; ++i)
        cycleOf[i] = static_cast<int>(cycle);
    }
    std::size_t ancestors = 0;
    for (int node = 0; node < count; ++node) {
      ancestors += node == 0 || reaches[node][0];
      EXPECT_EQ(places[node] >= 0, node == 0 || reaches[node][0]) << graph;
      if (places[node] < 0)
        continue;
      EXPECT_EQ(cycleOf[places[node]] >= 0, reaches[node][node]) << graph;
      for (int other = 0; other < count; ++other) {
        if (other == node || !reaches[other][node] || places[other] < 0)
          continue;
        EXPECT_TRUE(reaches[node][other] ? cycleOf[places[other]] == cycleOf[places[node]]
                                         : places[other] < places[node])
            << graph;
      }
    }
    EXPECT_EQ(order.nodes.size(), ancestors) << graph;
  }
}

// A row of nodes whose links run both ways: against the order, an attribute gets on by one node a round.
TEST(Network, CarriesAttributesAgainstTheOrderOfACycle) {
  constexpr int kLength = 40;
  OpenNetwork network;
  const QString port = "P";
  const auto link = [&](int from, int to) { EXPECT_TRUE(network.addLink(from, port, to, port)); };
  network.addInput("A", 0, 0);
  network.addOutput("O", kLength + 1, kOutgoingArriving, {}, 0);
  for (int number = 1; number <= kLength; ++number)
    network.addLoop(QString::number(number), number);
  for (int number = 1; number < kLength; ++number)
    link(number + 1, number);
  for (int number = 0; number < kLength; ++number)
    link(number, number + 1);
  link(1, kLength + 1);
  link(kLength, kLength + 1);
  network.doneAdding(true);
  network.setInputAttributes("A", {"a"});
  EXPECT_EQ(network.attributesOf("O"), names("a"));
  network.nodeByNumber(kLength)->addAttributeCopy(port, *network.nodeByNumber(kLength + 1), port, "a", "far");
  EXPECT_EQ(network.attributesOf("O"), names("a,far"));
}

// Built, ordered, asked, closed to a circle and destroyed; with every second node a transformer.
TEST(Network, WalksLongChainsWithoutRecursion) {
  constexpr int kLength = 100000;
  const QString port = "P";
  TransformerDefinition definition = passing("Pass", port);
  definition.inputTags = QStringList{port};
  const std::unique_ptr<TransformerCfg> prototype = configured(definition);
  OpenNetwork network;
  network.addInput("A", 0, 0);
  for (int number = 1; number <= kLength; ++number) {
    if (number % 2 == 0)
      network.addTransformer(prototype->getCopy(), {}, number);
    else
      network.addLoop(QString::number(number), number);
  }
  network.addOutput("O", kLength + 1, kOutgoingArriving, {}, 0);
  for (int number = 0; number <= kLength; ++number)
    network.addLink(number, port, number + 1, port);
  network.doneAdding(true);
  network.setInputAttributes("A", {"a"});
  EXPECT_EQ(network.attributesOf("O"), names("a"));
  network.addLink(kLength, port, 0, port);
  EXPECT_EQ(network.attributesOf("O"), names("a"));
  EXPECT_EQ(network.getUpstreamInputs("O"), names("A"));
}

TEST(Network, AnswersAsAWhole) {
  OpenNetwork network;
  EXPECT_TRUE(network.getIsAsynchronous() && !network.getIsBlocking() && network.getLoopTo().isEmpty());
  network.addLoop("L1", 1);
  network.addLoop("L1", 2);
  network.addLoop("L2", 3);
  EXPECT_EQ(network.getLoops(), names("L1,L2"));
  EXPECT_EQ(network.nodeByNumber(2), network.nodeByNumber(1));
  EXPECT_EQ(network.getLoopTo(), "L1");
  TransformerDefinition holder = passing("Holder");
  holder.featureHolding = 4;
  network.addTransformer(configured(holder).release(), {}, 4);
  EXPECT_TRUE(!network.getIsAsynchronous() && network.getIsBlocking());
  QSet<QString> visited;
  EXPECT_FALSE(network.getUsesTransformer("holder", nullptr));
  EXPECT_TRUE(network.getUsesTransformer("Holder", &visited));
  EXPECT_FALSE(network.getUsesTransformer("Holder", &visited)) << "no second look";
  EXPECT_EQ(network.addTransformer(configured(holder).release(), {}, 4), nullptr) << "number taken";
  EXPECT_FALSE(network.addLink(4, "OUT", 9, "IN")) << "no such node";

  auto mode = kOutgoingOwnList;
  QStringList list{"untouched"};
  network.getOutputAttributeMode("none", mode, list);
  EXPECT_EQ(mode, kOutgoingArriving);
  EXPECT_EQ(list, names("untouched"));
  network.addOutput("O", 5, kOutgoingArriving, {}, 0);
  network.setOutputAttributeMode("O", kOutgoingOwnList, names("x"));
  network.getOutputAttributeMode("O", mode, list);
  EXPECT_EQ(mode, kOutgoingOwnList);
  EXPECT_EQ(network.attributesOf("O"), names("x"));
}

// --- editing while instances exist -------------------------------------------------------------------------

class Watcher : public CompoundTransformerNetworkListener {
 public:
  Watcher(CompoundTransformerNetwork& network, QStringList& log, const QString& name)
      : m_network(network), m_log(log), m_name(name) {
    network.addListener(this);
  }
  ~Watcher() override { m_network.removeListener(this); }
  void networkChanged(bool parametersChanged) override {
    m_log.append(m_name + (parametersChanged ? "!" : ""));
    if (onChange)
      onChange();
  }
  void networkDeleted() override {}
  void renameIONode(bool, const QString& oldName, const QString& newName) override {
    m_log.append(m_name + ' ' + oldName + '>' + newName);
  }
  std::function<void()> onChange;

 private:
  CompoundTransformerNetwork& m_network;
  QStringList& m_log;
  QString m_name;
};

// Those who come or go while others are told are not told, or told no more.
TEST(Network, TellsListenersInOrder) {
  QStringList log;
  OpenNetwork network;
  assemble(network, {"in A", "out O", "A -> O"});
  Watcher first(network, log, "1");
  auto second = std::make_unique<Watcher>(network, log, "2");
  const Watcher third(network, log, "3");
  EXPECT_TRUE(network.renameInput("A", "B"));
  EXPECT_FALSE(network.renameInput("A", "C"));
  EXPECT_EQ(log.join(','), "1 A>B,2 A>B,3 A>B,1,2,3");
  log.clear();
  std::unique_ptr<Watcher> fourth;
  first.onChange = [&] {
    second.reset();
    if (!fourth)
      fourth = std::make_unique<Watcher>(network, log, "4");
  };
  network.doneAdding(true);
  EXPECT_TRUE(network.removeOutput("O", 1));
  EXPECT_EQ(log.join(','), "1!,3!,1,3,4");
}

TEST(Network, InstancesFollowEditing) {
  OpenNetwork network;
  assemble(network, {"in A", "in B", "out O", "A -> O", "B -> O"});
  CompoundTransformerCfg instance(&network);
  instance.addInputFeatureType("A", "f");
  instance.addInputFeatureType("B", "g");
  instance.setOutputFeatureType("O", "h");
  instance.setInputAttributes("A", {"a"});
  instance.setInputAttributes("B", {"b"});

  EXPECT_TRUE(network.renameInput("A", "Z"));
  EXPECT_TRUE(network.renameOutput("O", "P"));
  EXPECT_FALSE(network.renameInput("Z", "B")) << "taken";
  QStringList tags;
  instance.getInputTags(tags);
  EXPECT_EQ(tags, names("Z,B"));
  EXPECT_EQ(instance.getInputFeatureTypes("Z"), names("f"));
  QString featureType;
  EXPECT_TRUE(instance.getOutputFeatureType("P", featureType));
  EXPECT_EQ(featureType, "h");
  EXPECT_EQ(instance.getOutputAttributes("P"), names("a,b"));
  EXPECT_EQ(instance.getOutputAttributes("O"), QStringList());

  EXPECT_FALSE(network.removeInput("B", 0)) << "another node's number";
  EXPECT_TRUE(network.removeInput("B", 1));
  EXPECT_EQ(instance.getOutputAttributes("P"), names("a"));
  EXPECT_EQ(instance.getInputFeatureTypes("B"), QStringList());
  EXPECT_TRUE(network.removeOutput("P", 2));
  EXPECT_FALSE(instance.getOutputFeatureType("P", featureType));
  EXPECT_EQ(instance.getOutputAttributes("P"), QStringList());
  network.clear();
  instance.getInputTags(tags);
  EXPECT_EQ(tags, QStringList());
}

// Networks, instances, copies and the networks that they stand in may go in any order.
TEST(Network, GoesInEveryOrder) {
  std::vector<int> order{0, 1, 2, 3};
  int runs = 0;
  do {
    auto inner = std::make_unique<OpenNetwork>("Inner");
    assemble(*inner, {"in A", "out O", "A -> O"});
    auto outer = std::make_unique<OpenNetwork>("Outer");
    outer->addInput("A", 0, 0);
    outer->addOutput("O", 1, kOutgoingArriving, {}, 0);
    outer->addTransformer(new CompoundTransformerCfg(inner.get()), {}, 2);
    outer->addLink(0, "A", 2, "A");
    outer->addLink(2, "O", 1, "O");
    outer->doneAdding(true);
    auto instance = std::make_unique<CompoundTransformerCfg>(outer.get());
    auto copy = std::unique_ptr<TransformerCfg>(instance->getCopy());
    instance->setInputAttributes("A", {"a"});
    ASSERT_EQ(instance->getOutputAttributes("O"), names("a"));
    for (const int what : order) {
      if (what == 0)
        inner.reset();
      else if (what == 1)
        outer.reset();
      else if (what == 2)
        instance.reset();
      else
        copy.reset();
      if (instance) {
        const QStringList expected = inner && outer ? names("a") : QStringList();
        EXPECT_EQ(instance->getOutputAttributes("O"), expected);
        TextBuffer buffer;
        EXPECT_EQ(instance->doInstantiate(buffer, true), outer != nullptr);
      }
    }
    ++runs;
  } while (std::next_permutation(order.begin(), order.end()));
  EXPECT_EQ(runs, 24);
}

}  // namespace
