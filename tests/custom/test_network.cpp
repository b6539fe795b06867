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
  OpenNetwork inner(QStringLiteral("Inner"));
  assemble(inner, {QStringLiteral("in IN"), QStringLiteral("out OUT"), QStringLiteral("add T x"),
                   QStringLiteral("IN -> T"), QStringLiteral("T -> OUT")});
  for (const Propagation& row : kPropagations) {
    OpenNetwork network;
    assemble(network, QString::fromLatin1(row.graph).split(QLatin1Char(';')), &inner);
    for (const QString& input : network.getInputs())
      network.setInputAttributes(input, {input.toLower(), QStringLiteral("k")});
    const QString output = QLatin1String(row.output);
    // Asked twice: what a query left behind must not show in the next.
    network.attributesOf(output);
    QStringList attributes = network.attributesOf(output);
    QStringList expected = names(QLatin1String(row.attributes));
    EXPECT_EQ(attributes.size(), expected.size()) << row.what;
    attributes.sort();
    expected.sort();
    EXPECT_EQ(attributes, expected) << row.what << ": " << qPrintable(attributes.join(QLatin1Char(',')));
    EXPECT_EQ(network.getUpstreamInputs(output), names(QLatin1String(row.upstreamInputs))) << row.what;
  }
}

TEST(Network, TellsWhereAttributesComeFrom) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("add T t"), QStringLiteral("out O"),
                     QStringLiteral("A -> T"), QStringLiteral("T -> O")});
  network.setStaticInputAttributes(QStringLiteral("A"), {QStringLiteral("declared")});
  network.setInputAttributes(QHash<QString, QStringList>{{QStringLiteral("A"), {QStringLiteral("a")}}});
  QHash<QString, QString> origins;
  EXPECT_EQ(network.getOutputAttributes(QStringLiteral("O"), origins), names(QStringLiteral("declared,a,t")));
  EXPECT_EQ(origins.value(QStringLiteral("a")), QStringLiteral("A"));
  EXPECT_EQ(origins.value(QStringLiteral("t")), QStringLiteral("T"));
  EXPECT_EQ(network.getInputAttributes(QStringLiteral("A"), false), names(QStringLiteral("a")));
  EXPECT_EQ(network.getInputAttributes(QStringLiteral("A"), true), names(QStringLiteral("declared,a")));
  EXPECT_EQ(network.getInputAttributes(QStringLiteral("O"), true), QStringList());
}

// The list and the order of a graph whose circle stands between an input and the output.
TEST(Network, OrdersAncestors) {
  OpenNetwork network;
  assemble(
      network,
      QStringLiteral("out O;in B;in A;pass S;pass T;pass U;S -> O;U -> O;T -> S;A -> S;S -> T;B -> T;A -> U")
          .split(QLatin1Char(';')));
  std::vector<SubDocNetworkObj*> ancestors;
  OpenNetwork::NodeSet set;
  OpenNetwork::createAncestorList(network.nodeByNumber(0), ancestors, set);
  const auto namesOf = [](const std::vector<SubDocNetworkObj*>& nodes) {
    QStringList list;
    for (const SubDocNetworkObj* node : nodes)
      list.append(node->name());
    return list.join(QLatin1Char(' '));
  };
  EXPECT_EQ(namesOf(ancestors), QStringLiteral("O S T B A U"));
  const NetworkOrder order = NetworkSorter(network.nodes().size()).sort(*network.nodeByNumber(0));
  EXPECT_EQ(namesOf(order.nodes), QStringLiteral("B A S T U O"));
  ASSERT_EQ(order.cycles.size(), 1U);
  EXPECT_EQ(order.cycles.front().begin, 2U);
  EXPECT_EQ(order.cycles.front().end, 4U);
}

// Against the plain reading of the rule: of the nodes and cycles whose feeders are all placed, the one that
// stands first in the list of ancestors is next.
TEST(Network, OrdersRandomGraphs) {
  constexpr int kMostNodes = 10;
  std::mt19937 random(1);
  for (int graph = 0; graph < 300; ++graph) {
    const int count = 2 + static_cast<int>(random() % (kMostNodes - 1));
    const auto anyNode = [&] { return static_cast<int>(random() % static_cast<unsigned>(count)); };
    OpenNetwork network;
    network.addOutput(QStringLiteral("O"), 0, kOutgoingArriving, {}, 0);
    for (int number = 1; number < count; ++number)
      network.addLoop(QString::number(number), number);
    std::vector<std::vector<bool>> feeds(kMostNodes, std::vector<bool>(kMostNodes));
    for (int links = static_cast<int>(random() % 20); links >= 0; --links) {
      const int from = anyNode();
      const int to = anyNode();
      network.addLink(from, QStringLiteral("P"), to, QString::number(random() % 3));
      feeds[from][to] = true;
    }
    std::vector<std::vector<bool>> reaches = feeds;
    for (int by = 0; by < count; ++by) {
      for (int from = 0; from < count; ++from) {
        for (int to = 0; to < count; ++to)
          reaches[from][to] = reaches[from][to] || (reaches[from][by] && reaches[by][to]);
      }
    }

    std::vector<SubDocNetworkObj*> ancestors;
    OpenNetwork::NodeSet set;
    OpenNetwork::createAncestorList(network.nodeByNumber(0), ancestors, set);
    std::vector<SubDocNetworkObj*> expected;
    std::vector<bool> isPlaced(kMostNodes);
    std::size_t cycles = 0;
    const auto isOneCycle = [&](int left, int right) { return reaches[left][right] && reaches[right][left]; };
    for (auto next = ancestors.begin(); next != ancestors.end();) {
      const int number = (*next)->number();
      const bool isReady =
          !isPlaced[number] && std::all_of(ancestors.begin(), ancestors.end(), [&](auto* other) {
            return isPlaced[other->number()] || !reaches[other->number()][number] ||
                   isOneCycle(other->number(), number);
          });
      if (!isReady) {
        ++next;
        continue;
      }
      cycles += reaches[number][number] ? 1 : 0;
      for (SubDocNetworkObj* member : ancestors) {
        if (member->number() == number || isOneCycle(member->number(), number)) {
          expected.push_back(member);
          isPlaced[member->number()] = true;
        }
      }
      next = ancestors.begin();
    }
    const NetworkOrder order = NetworkSorter(network.nodes().size()).sort(*network.nodeByNumber(0));
    EXPECT_EQ(order.nodes, expected) << graph;
    EXPECT_EQ(order.cycles.size(), cycles) << graph;
  }
}

// A row of nodes whose links run both ways: against the order, an attribute gets on by one node a round.
TEST(Network, CarriesAttributesAgainstTheOrderOfACycle) {
  constexpr int kLength = 40;
  OpenNetwork network;
  const QString port = QStringLiteral("P");
  const auto link = [&](int from, int to) { EXPECT_TRUE(network.addLink(from, port, to, port)); };
  network.addInput(QStringLiteral("A"), 0, 0);
  network.addOutput(QStringLiteral("O"), kLength + 1, kOutgoingArriving, {}, 0);
  for (int number = 1; number <= kLength; ++number)
    network.addLoop(QString::number(number), number);
  for (int number = 1; number < kLength; ++number)
    link(number + 1, number);
  for (int number = 0; number < kLength; ++number)
    link(number, number + 1);
  link(1, kLength + 1);
  link(kLength, kLength + 1);
  network.doneAdding(true);
  network.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_EQ(network.attributesOf(QStringLiteral("O")), names(QStringLiteral("a")));
  network.nodeByNumber(kLength)->addAttributeCopy(port, QStringLiteral("a"), QStringLiteral("far"));
  EXPECT_EQ(network.attributesOf(QStringLiteral("O")), names(QStringLiteral("a,far")));
}

// Built, ordered, asked, closed to a circle and destroyed; with every second node a transformer.
TEST(Network, WalksLongChainsWithoutRecursion) {
  constexpr int kLength = 100000;
  const QString port = QStringLiteral("P");
  TransformerDefinition definition = passing(QStringLiteral("Pass"), port);
  definition.inputTags = QStringList{port};
  const std::unique_ptr<TransformerCfg> prototype = configured(definition);
  OpenNetwork network;
  network.addInput(QStringLiteral("A"), 0, 0);
  for (int number = 1; number <= kLength; ++number) {
    if (number % 2 == 0)
      network.addTransformer(prototype->getCopy(), {}, number);
    else
      network.addLoop(QString::number(number), number);
  }
  network.addOutput(QStringLiteral("O"), kLength + 1, kOutgoingArriving, {}, 0);
  for (int number = 0; number <= kLength; ++number)
    network.addLink(number, port, number + 1, port);
  network.doneAdding(true);
  network.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  EXPECT_EQ(network.attributesOf(QStringLiteral("O")), names(QStringLiteral("a")));
  network.addLink(kLength, port, 0, port);
  EXPECT_EQ(network.attributesOf(QStringLiteral("O")), names(QStringLiteral("a")));
  EXPECT_EQ(network.getUpstreamInputs(QStringLiteral("O")), names(QStringLiteral("A")));
}

TEST(Network, AnswersAsAWhole) {
  OpenNetwork network;
  EXPECT_TRUE(network.getIsAsynchronous());
  EXPECT_FALSE(network.getIsBlocking());
  EXPECT_EQ(network.getLoopTo(), QString());
  network.addLoop(QStringLiteral("L1"), 1);
  network.addLoop(QStringLiteral("L1"), 2);
  network.addLoop(QStringLiteral("L2"), 3);
  EXPECT_EQ(network.getLoops(), names(QStringLiteral("L1,L2")));
  EXPECT_EQ(network.nodes().size(), 2U);
  EXPECT_EQ(network.nodeByNumber(2), network.nodeByNumber(1));
  EXPECT_EQ(network.getLoopTo(), QStringLiteral("L1"));
  EXPECT_EQ(network.getLoopOutput(), QStringLiteral("INCOMPLETE"));
  TransformerDefinition holder = passing(QStringLiteral("Holder"));
  holder.featureHolding = 4;
  network.addTransformer(configured(holder).release(), {}, 4);
  EXPECT_FALSE(network.getIsAsynchronous());
  EXPECT_TRUE(network.getIsBlocking());
  EXPECT_TRUE(network.getUsesTransformer(QStringLiteral("Holder"), nullptr));
  EXPECT_FALSE(network.getUsesTransformer(QStringLiteral("holder"), nullptr));
  QSet<QString> visited;
  EXPECT_TRUE(network.getUsesTransformer(QStringLiteral("Holder"), &visited));
  EXPECT_FALSE(network.getUsesTransformer(QStringLiteral("Holder"), &visited)) << "no second look";
  EXPECT_EQ(OpenNetwork::createExposedParmName(QStringLiteral("T"), QStringLiteral("P")),
            QStringLiteral("T_P"));
  EXPECT_EQ(network.addTransformer(configured(holder).release(), {}, 4), nullptr) << "number taken";
  EXPECT_FALSE(network.addLink(4, QStringLiteral("OUT"), 9, QStringLiteral("IN"))) << "no such node";

  auto mode = kOutgoingOwnList;
  QStringList list{QStringLiteral("untouched")};
  network.getOutputAttributeMode(QStringLiteral("none"), mode, list);
  EXPECT_EQ(mode, kOutgoingArriving);
  EXPECT_EQ(list, names(QStringLiteral("untouched")));
  network.addOutput(QStringLiteral("O"), 5, kOutgoingArriving, {}, 0);
  network.setOutputAttributeMode(QStringLiteral("none"), kOutgoingOwnList, names(QStringLiteral("y")));
  network.setOutputAttributeMode(QStringLiteral("O"), kOutgoingOwnList, names(QStringLiteral("x")));
  network.getOutputAttributeMode(QStringLiteral("O"), mode, list);
  EXPECT_EQ(mode, kOutgoingOwnList);
  EXPECT_EQ(list, names(QStringLiteral("x")));
  EXPECT_EQ(network.attributesOf(QStringLiteral("O")), list);
}

// --- editing while instances exist -------------------------------------------------------------------------

class Watcher : public CompoundTransformerNetworkListener {
 public:
  Watcher(CompoundTransformerNetwork& network, QStringList& log, const QString& name)
      : m_network(&network), m_log(log), m_name(name) {
    network.addListener(this);
  }
  ~Watcher() override {
    if (m_network)
      m_network->removeListener(this);
  }
  void networkChanged(bool parametersChanged) override {
    m_log.append(m_name + (parametersChanged ? QLatin1String("!") : QLatin1String("")));
    if (onChange)
      onChange();
  }
  void networkDeleted() override {
    m_log.append(m_name + QLatin1String(" gone"));
    m_network = nullptr;
  }
  void renameIONode(bool isInput, const QString& oldName, const QString& newName) override {
    m_log.append(m_name + QLatin1Char(' ') + (isInput ? QLatin1String("in ") : QLatin1String("out ")) +
                 oldName + QLatin1Char('>') + newName);
  }
  std::function<void()> onChange;

 private:
  CompoundTransformerNetwork* m_network;
  QStringList& m_log;
  QString m_name;
};

TEST(Network, TellsListenersInOrder) {
  QStringList log;
  auto network = std::make_unique<OpenNetwork>();
  assemble(*network, {QStringLiteral("in A"), QStringLiteral("out O"), QStringLiteral("loop L"),
                      QStringLiteral("A -> O"), QStringLiteral("L -> O")});
  EXPECT_FALSE(network->getIsInUse());
  auto first = std::make_unique<Watcher>(*network, log, QStringLiteral("1"));
  auto second = std::make_unique<Watcher>(*network, log, QStringLiteral("2"));
  auto third = std::make_unique<Watcher>(*network, log, QStringLiteral("3"));
  EXPECT_TRUE(network->getIsInUse());
  EXPECT_TRUE(network->renameInput(QStringLiteral("A"), QStringLiteral("B")));
  EXPECT_FALSE(network->renameInput(QStringLiteral("A"), QStringLiteral("C")));
  EXPECT_EQ(log.join(QLatin1Char(',')), QStringLiteral("1 in A>B,2 in A>B,3 in A>B,1,2,3"));
  log.clear();
  std::unique_ptr<Watcher> fourth;
  first->onChange = [&] {
    second.reset();
    if (!fourth)
      fourth = std::make_unique<Watcher>(*network, log, QStringLiteral("4"));
  };
  network->doneAdding(true);
  EXPECT_EQ(log.join(QLatin1Char(',')), QStringLiteral("1!,3!"));
  log.clear();
  third.reset();
  EXPECT_TRUE(network->removeLoop(QStringLiteral("L"), 2));
  EXPECT_FALSE(network->removeLoop(QStringLiteral("L"), 2));
  EXPECT_TRUE(network->removeOutput(QStringLiteral("O"), 1));
  EXPECT_TRUE(network->removeInput(QStringLiteral("B"), 0));
  EXPECT_TRUE(network->nodes().empty());
  network->clear();
  EXPECT_EQ(log.join(QLatin1Char(',')), QStringLiteral("1,4,1,4,1,4,1!,4!"));
  log.clear();
  network.reset();
  EXPECT_EQ(log.join(QLatin1Char(',')), QStringLiteral("1 gone,4 gone"));
}

TEST(Network, InstancesFollowEditing) {
  OpenNetwork network;
  assemble(network, {QStringLiteral("in A"), QStringLiteral("in B"), QStringLiteral("out O"),
                     QStringLiteral("A -> O"), QStringLiteral("B -> O")});
  CompoundTransformerCfg instance(&network);
  instance.addInputFeatureType(QStringLiteral("A"), QStringLiteral("f"));
  instance.addInputFeatureType(QStringLiteral("B"), QStringLiteral("g"));
  instance.setOutputFeatureType(QStringLiteral("O"), QStringLiteral("h"));
  instance.setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
  instance.setInputAttributes(QStringLiteral("B"), {QStringLiteral("b")});

  EXPECT_TRUE(network.renameInput(QStringLiteral("A"), QStringLiteral("Z")));
  EXPECT_TRUE(network.renameOutput(QStringLiteral("O"), QStringLiteral("P")));
  EXPECT_FALSE(network.renameInput(QStringLiteral("Z"), QStringLiteral("B"))) << "taken";
  QStringList tags;
  instance.getInputTags(tags);
  EXPECT_EQ(tags, names(QStringLiteral("Z,B")));
  EXPECT_EQ(instance.getInputFeatureTypes(QStringLiteral("Z")), names(QStringLiteral("f")));
  QString featureType;
  EXPECT_TRUE(instance.getOutputFeatureType(QStringLiteral("P"), featureType));
  EXPECT_EQ(featureType, QStringLiteral("h"));
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("P")), names(QStringLiteral("a,b")));
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("O")), QStringList());

  EXPECT_FALSE(network.removeInput(QStringLiteral("B"), 0)) << "another node's number";
  EXPECT_TRUE(network.removeInput(QStringLiteral("B"), 1));
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("P")), names(QStringLiteral("a")));
  EXPECT_EQ(instance.getInputFeatureTypes(QStringLiteral("B")), QStringList());
  EXPECT_TRUE(network.removeOutput(QStringLiteral("P"), 2));
  EXPECT_FALSE(instance.getOutputFeatureType(QStringLiteral("P"), featureType));
  EXPECT_EQ(instance.getOutputAttributes(QStringLiteral("P")), QStringList());
  network.clear();
  instance.getInputTags(tags);
  EXPECT_EQ(tags, QStringList());
}

// Networks, instances, copies and the networks that they stand in may go in any order.
TEST(Network, GoesInEveryOrder) {
  std::vector<int> order{0, 1, 2, 3};
  int runs = 0;
  do {
    auto inner = std::make_unique<OpenNetwork>(QStringLiteral("Inner"));
    assemble(*inner, {QStringLiteral("in A"), QStringLiteral("out O"), QStringLiteral("A -> O")});
    auto outer = std::make_unique<OpenNetwork>(QStringLiteral("Outer"));
    outer->addInput(QStringLiteral("A"), 0, 0);
    outer->addOutput(QStringLiteral("O"), 1, kOutgoingArriving, {}, 0);
    outer->addTransformer(new CompoundTransformerCfg(inner.get()), {}, 2);
    outer->addLink(0, QStringLiteral("A"), 2, QStringLiteral("A"));
    outer->addLink(2, QStringLiteral("O"), 1, QStringLiteral("O"));
    outer->doneAdding(true);
    auto instance = std::make_unique<CompoundTransformerCfg>(outer.get());
    auto copy = std::unique_ptr<TransformerCfg>(instance->getCopy());
    instance->setInputAttributes(QStringLiteral("A"), {QStringLiteral("a")});
    ASSERT_EQ(instance->getOutputAttributes(QStringLiteral("O")), names(QStringLiteral("a")));
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
        const QStringList expected = inner && outer ? names(QStringLiteral("a")) : QStringList();
        EXPECT_EQ(instance->getOutputAttributes(QStringLiteral("O")), expected);
        TextBuffer buffer;
        EXPECT_EQ(instance->doInstantiate(buffer, true), outer != nullptr);
      }
    }
    ++runs;
  } while (std::next_permutation(order.begin(), order.end()));
  EXPECT_EQ(runs, 24);
}

}  // namespace
