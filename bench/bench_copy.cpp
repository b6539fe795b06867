// What a copy of a prototype costs: allocations, and time against detaching as many strings as it has
// parameters.
//
// A copy shares the definition and all texts, so its number of allocations does not grow with the parameters;
// the program fails when it does.
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>

#include <QString>
#include <QStringList>
#include <benchmark/benchmark.h>

#include <atomic>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <vector>

namespace {

std::atomic<long> g_allocations{0};

}  // namespace

extern "C" {

void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* block, std::size_t size);

// Every allocation of the process passes here, those of the string library included.
void* malloc(std::size_t size) {
  g_allocations.fetch_add(1, std::memory_order_relaxed);
  return __libc_malloc(size);
}

void* calloc(std::size_t count, std::size_t size) {
  g_allocations.fetch_add(1, std::memory_order_relaxed);
  return __libc_calloc(count, size);
}

void* realloc(void* block, std::size_t size) {
  g_allocations.fetch_add(1, std::memory_order_relaxed);
  return __libc_realloc(block, size);
}

}  // extern "C"

namespace {

constexpr int kParameterCounts[] = {4, 40, 400};
constexpr int kRounds = 15;
constexpr double kRoundSeconds = 0.02;

TransformerDefinition makeDefinition(int parameters) {
  TransformerDefinition definition;
  definition.name = QStringLiteral("Prototype");
  definition.inputTags << QStringLiteral("INPUT");
  definition.outputTags << QStringLiteral("OUTPUT");
  definition.templateLines << QStringLiteral("FACTORY_DEF * PrototypeFactory $(INPUT_LINES)");
  for (int i = 0; i < parameters; ++i) {
    definition.parameterNames << QStringLiteral("PARAMETER_%1").arg(i);
    definition.parameterTypes << (i % 2 ? QStringLiteral("CHOICE one%two%three")
                                        : QStringLiteral("TEXT_OR_ATTR"));
    definition.parameterPrompts << QStringLiteral("Parameter number %1").arg(i);
    definition.parameterDefaults << QStringLiteral("the value of %1").arg(i);
  }
  return definition;
}

// The best of several rounds, in nanoseconds per call.
template <typename Call>
double nanoseconds(const Call& call) {
  using Clock = std::chrono::steady_clock;
  double best = 0;
  for (int round = 0; round < kRounds; ++round) {
    long calls = 0;
    double elapsed = 0;
    const auto start = Clock::now();
    do {
      for (int i = 0; i < 16; ++i) {
        call();
      }
      calls += 16;
      elapsed = std::chrono::duration<double>(Clock::now() - start).count();
    } while (elapsed < kRoundSeconds);
    const double each = elapsed * 1e9 / double(calls);
    best = round == 0 ? each : std::min(best, each);
  }
  return best;
}

template <typename Call>
long allocations(const Call& call) {
  const long before = g_allocations.load();
  call();
  return g_allocations.load() - before;
}

}  // namespace

int main() {
  std::printf("%10s %12s %10s %14s %8s\n", "parameters", "allocations", "copy ns", "strings ns", "ratio");
  std::vector<long> counts;
  for (const int parameters : kParameterCounts) {
    TransformerCfg prototype;
    prototype.configure(makeDefinition(parameters));
    QStringList values;
    for (const QString& name : prototype.getParameters()) {
      values << prototype.getParameterValue(name) + QLatin1Char('.');
    }
    const auto copy = [&] {
      const std::unique_ptr<TransformerCfg> own(prototype.getCopy());
      benchmark::DoNotOptimize(own.get());
    };
    const auto detach = [&] {
      QStringList own;
      own.reserve(values.size());
      for (const QString& value : values) {
        own.append(QString(value.constData(), value.size()));
      }
      benchmark::DoNotOptimize(own);
    };
    copy();
    counts.push_back(allocations(copy));
    const double copyTime = nanoseconds(copy);
    const double detachTime = nanoseconds(detach);
    std::printf("%10d %12ld %10.0f %14.0f %8.2f\n", parameters, counts.back(), copyTime, detachTime,
                copyTime / detachTime);
  }
  if (counts.front() != counts.back()) {
    std::printf("a copy's allocations grow with its parameters\n");
    return EXIT_FAILURE;
  }
  return EXIT_SUCCESS;
}
