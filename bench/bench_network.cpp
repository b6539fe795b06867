// Networks of custom transformers: finishing the graph and asking for what leaves its outputs, against a
// topological sort of the same sub-graphs by a general graph library, measured in the same run; and what an
// instance costs in memory.
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>

#include <benchmark/benchmark.h>
#include <boost/graph/adjacency_list.hpp>
#include <boost/graph/topological_sort.hpp>

#include <algorithm>
#include <ctime>
#include <malloc.h>
#include <memory>
#include <vector>

namespace {

class OpenNetwork : public ExternalDocNetwork {
 public:
  using CompoundTransformerNetwork::addInput;
  using CompoundTransformerNetwork::addLink;
  using CompoundTransformerNetwork::addLoop;
  using CompoundTransformerNetwork::addOutput;
  using CompoundTransformerNetwork::addPublishedParameter;
  using CompoundTransformerNetwork::addTransformer;
};

enum class Nodes { Loops, Transformers };

// Node n is fed by n-1 and by one node further back; the outputs take from places of the second half.
struct Graph {
  explicit Graph(int size, int outputCount = 8) : nodes(size) {
    for (int node = 1; node < size; ++node) {
      links.emplace_back(node - 1, node);
      if (node >= 3)
        links.emplace_back((node * 7919LL) % (node - 1), node);
    }
    for (int output = 0; output < outputCount; ++output)
      outputs.push_back(size / 2 + (size / 2 - 1) * (output + 1) / outputCount);
  }

  int nodes;
  std::vector<std::pair<int, int>> links;
  std::vector<int> outputs;  // the node that feeds each
};

// Loop points cost nothing of their own, so that the network is measured; transformers let everything pass.
void fill(OpenNetwork& network, const Graph& graph, Nodes nodes) {
  const QString port = QStringLiteral("P");
  TransformerDefinition definition;
  definition.name = QStringLiteral("Passing");
  definition.version = 1;
  definition.inputTags = QStringList{port};
  definition.outputTags = QStringList{port};
  definition.preservesAttributes = QStringList{QStringLiteral("<ALL>")};
  TransformerCfg prototype;
  prototype.configure(definition);
  network.addInput(QStringLiteral("IN"), 0, 0);
  for (int node = 1; node < graph.nodes; ++node) {
    if (nodes == Nodes::Loops)
      network.addLoop(QString::number(node), node);
    else
      network.addTransformer(prototype.getCopy(), {}, node);
  }
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

// Of this thread's processor time, so that a busy machine does not show.
double now() {
  timespec time{};
  clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
  return static_cast<double>(time.tv_sec) + 1e-9 * static_cast<double>(time.tv_nsec);
}

template <class Work>
double seconds(const Work& work) {
  const double start = now();
  work();
  return now() - start;
}

double median(std::vector<double>& values) {
  const auto middle = values.begin() + static_cast<std::ptrdiff_t>(values.size() / 2);
  std::nth_element(values.begin(), middle, values.end());
  return *middle;
}

// Each iteration does both, and `prepare` outside of the time; the ratio counts our time in units of the
// library's.
template <class Prepare, class Work>
void compare(benchmark::State& state, const Graph& graph, const Prepare& prepare, const Work& work) {
  const auto graphs = boostGraphs(graph);
  std::vector<double> ours;
  std::vector<double> theirs;
  for (auto _ : state) {
    prepare();
    ours.push_back(seconds(work));
    theirs.push_back(seconds([&] { sortByBoost(graphs); }));
    state.SetIterationTime(ours.back());
  }
  const double own = median(ours);
  state.counters["ratio"] = own / median(theirs);
  state.counters["us_per_node"] = 1e6 * own / graph.nodes;
}

// Everything is read and ordered anew each time.
void BM_DoneAdding(benchmark::State& state, Nodes nodes) {
  const Graph graph(static_cast<int>(state.range(0)), static_cast<int>(state.range(1)));
  OpenNetwork network;
  fill(network, graph, nodes);
  compare(
      state, graph, [] {}, [&] { network.doneAdding(true); });
}

void BM_OutputAttributes(benchmark::State& state, Nodes nodes) {
  const Graph graph(static_cast<int>(state.range(0)), static_cast<int>(state.range(1)));
  OpenNetwork network;
  fill(network, graph, nodes);
  network.doneAdding(true);
  const QStringList outputs = network.getOutputs();
  // Lists of their own each time, as if they had come from elsewhere.
  const auto prepare = [&] {
    network.setInputAttributes(QStringLiteral("IN"), {QStringLiteral("id"), QStringLiteral("name")});
  };
  compare(state, graph, prepare, [&] {
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
  fill(network, Graph(100), Nodes::Loops);
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

namespace {

void sizes(benchmark::internal::Benchmark* benchmark) {
  for (const int outputs : {1, 8}) {
    for (const int nodes : {100, 1000, 10000, 100000})
      benchmark->Args({nodes, outputs});
  }
  benchmark->UseManualTime()->MinTime(0.1);
}

}  // namespace

BENCHMARK_CAPTURE(BM_DoneAdding, loops, Nodes::Loops)->Apply(sizes);
BENCHMARK_CAPTURE(BM_DoneAdding, transformers, Nodes::Transformers)->Apply(sizes);
BENCHMARK_CAPTURE(BM_OutputAttributes, loops, Nodes::Loops)->Apply(sizes);
BENCHMARK_CAPTURE(BM_OutputAttributes, transformers, Nodes::Transformers)->Apply(sizes);
BENCHMARK(BM_Instances);

BENCHMARK_MAIN();
