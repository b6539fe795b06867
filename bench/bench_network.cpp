// Networks of custom transformers: finishing the graph and asking for what leaves its outputs, against a
// topological sort of the same sub-graphs by a general graph library, measured in the same run; and what an
// instance costs in memory.
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>

#include <benchmark/benchmark.h>
#include <boost/graph/adjacency_list.hpp>
#include <boost/graph/topological_sort.hpp>

#include <chrono>
#include <malloc.h>
#include <memory>
#include <vector>

namespace {

constexpr int kOutputs = 8;

class OpenNetwork : public ExternalDocNetwork {
 public:
  using CompoundTransformerNetwork::addInput;
  using CompoundTransformerNetwork::addLink;
  using CompoundTransformerNetwork::addLoop;
  using CompoundTransformerNetwork::addOutput;
  using CompoundTransformerNetwork::addPublishedParameter;
};

// Node n is fed by n-1 and by one node further back; the outputs take from eight places of the second half.
// Loop points stand for the transformers: they cost nothing of their own, so that the network is measured.
struct Graph {
  explicit Graph(int size) : nodes(size) {
    for (int node = 1; node < size; ++node) {
      links.emplace_back(node - 1, node);
      if (node >= 3)
        links.emplace_back((node * 7919LL) % (node - 1), node);
    }
    for (int output = 0; output < kOutputs; ++output)
      outputs.push_back(size / 2 + (size / 2 - 1) * (output + 1) / kOutputs);
  }

  int nodes;
  std::vector<std::pair<int, int>> links;
  std::vector<int> outputs;  // the node that feeds each
};

void fill(OpenNetwork& network, const Graph& graph) {
  network.addInput(QStringLiteral("IN"), 0, 0);
  for (int node = 1; node < graph.nodes; ++node)
    network.addLoop(QString::number(node), node);
  const QString port = QStringLiteral("P");
  for (const auto& [from, to] : graph.links)
    network.addLink(from, port, to, port);
  for (std::size_t output = 0; output < graph.outputs.size(); ++output) {
    const int number = graph.nodes + static_cast<int>(output);
    network.addOutput(QString::number(output), number, kOutgoingArriving, {}, static_cast<int>(output));
    network.addLink(graph.outputs[output], port, number, port);
  }
}

using BoostGraph = boost::adjacency_list<boost::vecS, boost::vecS, boost::directedS>;

// The sub-graph that feeds one output, its edges pointing at the feeders.
std::vector<std::unique_ptr<BoostGraph>> boostGraphs(const Graph& graph) {
  std::vector<std::vector<int>> feeders(static_cast<std::size_t>(graph.nodes));
  for (const auto& [from, to] : graph.links)
    feeders[static_cast<std::size_t>(to)].push_back(from);
  std::vector<std::unique_ptr<BoostGraph>> graphs;
  for (const int root : graph.outputs) {
    std::vector<int> numbers(static_cast<std::size_t>(graph.nodes), -1);
    std::vector<int> found{root};
    numbers[static_cast<std::size_t>(root)] = 0;
    std::vector<std::pair<int, int>> edges;
    for (std::size_t at = 0; at < found.size(); ++at) {
      for (const int feeder : feeders[static_cast<std::size_t>(found[at])]) {
        int& number = numbers[static_cast<std::size_t>(feeder)];
        if (number < 0) {
          number = static_cast<int>(found.size());
          found.push_back(feeder);
        }
        edges.emplace_back(static_cast<int>(at), number);
      }
    }
    graphs.push_back(std::make_unique<BoostGraph>(found.size()));
    for (const auto& [from, to] : edges)
      boost::add_edge(static_cast<std::size_t>(from), static_cast<std::size_t>(to), *graphs.back());
  }
  return graphs;
}

void sortByBoost(const std::vector<std::unique_ptr<BoostGraph>>& graphs) {
  for (const auto& graph : graphs) {
    std::vector<BoostGraph::vertex_descriptor> order;
    order.reserve(boost::num_vertices(*graph));
    boost::topological_sort(*graph, std::back_inserter(order));
    benchmark::DoNotOptimize(order.data());
  }
}

template <class Work>
double seconds(const Work& work) {
  const auto start = std::chrono::steady_clock::now();
  work();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

// Each iteration does both; the ratio counts our time in units of the library's.
template <class Work>
void compare(benchmark::State& state, const Graph& graph, const Work& work) {
  const auto graphs = boostGraphs(graph);
  double ours = 0;
  double theirs = 0;
  for (auto _ : state) {
    const double own = seconds(work);
    ours += own;
    theirs += seconds([&] { sortByBoost(graphs); });
    state.SetIterationTime(own);
  }
  state.counters["ratio"] = ours / theirs;
  state.counters["us_per_node"] = 1e6 * ours / (static_cast<double>(state.iterations()) * graph.nodes);
}

void BM_DoneAdding(benchmark::State& state) {
  const Graph graph(static_cast<int>(state.range(0)));
  OpenNetwork network;
  fill(network, graph);
  compare(state, graph, [&] { network.doneAdding(true); });
}

void BM_OutputAttributes(benchmark::State& state) {
  const Graph graph(static_cast<int>(state.range(0)));
  OpenNetwork network;
  fill(network, graph);
  network.doneAdding(true);
  network.setInputAttributes(QStringLiteral("IN"), {QStringLiteral("id"), QStringLiteral("name")});
  const QStringList outputs = network.getOutputs();
  compare(state, graph, [&] {
    for (const QString& output : outputs) {
      QHash<QString, QString> origins;
      if (network.getOutputAttributes(output, origins).size() != 2)
        state.SkipWithError("attributes got lost");
    }
  });
}

void BM_Instances(benchmark::State& state) {
  constexpr int kInstances = 1000;
  OpenNetwork network;
  fill(network, Graph(100));
  for (int parameter = 0; parameter < 20; ++parameter) {
    const QString name = QStringLiteral("P%1").arg(parameter);
    network.addPublishedParameter(GUIType::fromGuiLine(QStringLiteral("GUI TEXT %1 Parameter %1").arg(name)),
                                  name);
    network.addPublishedParameter(name, QStringLiteral("default value"));
  }
  network.doneAdding(true);
  const CompoundTransformerCfg prototype(&network);
  double bytes = 0;
  for (auto _ : state) {
    std::vector<std::unique_ptr<TransformerCfg>> instances;
    instances.reserve(kInstances);
    const std::size_t before = mallinfo2().uordblks;
    for (int instance = 0; instance < kInstances; ++instance)
      instances.emplace_back(prototype.getCopy());
    bytes = static_cast<double>(mallinfo2().uordblks - before) / kInstances;
    benchmark::DoNotOptimize(instances.data());
  }
  state.counters["bytes_per_instance"] = bytes;
}

}  // namespace

BENCHMARK(BM_DoneAdding)->RangeMultiplier(10)->Range(100, 100000)->UseManualTime();
BENCHMARK(BM_OutputAttributes)->RangeMultiplier(10)->Range(100, 100000)->UseManualTime();
BENCHMARK(BM_Instances);

BENCHMARK_MAIN();
