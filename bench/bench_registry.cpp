// The registry: loading a folder of generated definitions against reading the same files line by line,
// measured in the same run; what a definition costs in memory, unread and read; the first use of a
// definition, which reads it, and further ones in small and large registries; and the start-up of the command
// against that of a program that does nothing.
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QProcess>
#include <QTemporaryDir>
#include <QTextStream>
#include <benchmark/benchmark.h>

#include <chrono>
#include <cstdio>
#include <fstream>
#include <malloc.h>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <vector>

namespace {

QString nameOf(int number) {
  return QStringLiteral("Generated%1").arg(number);
}

QString aliasOf(int number) {
  return QStringLiteral("Alias%1").arg(number);
}

QByteArray definition(int number) {
  QString text = QStringLiteral(
                     "# One of many.\nTRANSFORMER_NAME: %1\nVERSION: 1\nCATEGORY: Generated,Group%2\n"
                     "FEATURE_HOLDING: NONE\nALIASES: %3\nINPUT_TAGS: INPUT\n"
                     "OUTPUT_TAGS: OUTPUT::Result REJECTED::Rejected\n"
                     "TAG_DESCRIPTION INPUT Features to be changed\n"
                     "TAG_DESCRIPTION OUTPUT Features with their new values\n"
                     "PRESERVES_ATTRIBUTES: <ALL>\nATTRIBUTES_ADDED: REJECTED:reject_reason\n\n")
                     .arg(nameOf(number), QString::number(number % 20), aliasOf(number));
  const char* const types[] = {"INT",
                               "FLOAT_OR_ATTR",
                               "LOOKUP_CHOICE \"Both sides\",BOTH%Left,LEFT%Right,RIGHT",
                               "OPTIONAL ATTR_LIST_ENCODED",
                               "TEXT_OR_ATTR_ENCODED",
                               "CHOICE YES%NO"};
  const char* const defaults[] = {"1", "0.5", "BOTH", "", "some<space>text", "YES"};
  QString used;
  for (int parameter = 0; parameter < 6; ++parameter) {
    text += QStringLiteral(
                "PARAMETER_NAME: P%1\nPARAMETER_TYPE: %2\nPARAMETER_PROMPT: Prompt of Number %1\n"
                "PARAMETER_DEFAULT: %3\n\n")
                .arg(QString::number(parameter), QLatin1String(types[parameter]),
                     QLatin1String(defaults[parameter]));
    used += QStringLiteral(" P%1 $(P%1)").arg(parameter);
  }
  text +=
      QStringLiteral(
          "DESCRIPTION_START\nChanges each feature by the values of its parameters, as others do.\n"
          "A feature that cannot be changed leaves by Rejected, with the reason in an attribute.\n"
          "DESCRIPTION_END\n\nTOOLTIP_START\nFirst: $(P0), second: $(P1)\nTOOLTIP_END\n\n"
          "CHANGE_LOG_START\nFirst version.\nCHANGE_LOG_END\n\nTEMPLATE_START\n"
          "FACTORY_DEF * GeneratedFactory FACTORY_NAME $(XFORMER_NAME) $(INPUT_LINES)%1 OUTPUT OUTPUT "
          "FEATURE_TYPE $(XFORMER_NAME_ENCODED)|OUTPUT\n"
          "FACTORY_DEF * TeeFactory FACTORY_NAME $(XFORMER_NAME_ENCODED)|OUTPUT_Router INPUT FEATURE_TYPE "
          "$(XFORMER_NAME_ENCODED)|OUTPUT OUTPUT FEATURE_TYPE $(OUTPUT_OUTPUT_FTYPE) "
          "$(OUTPUT_OUTPUT_FUNCS)\nTEMPLATE_END\n")
          .arg(used);
  return text.toUtf8();
}

// A home with that many definitions, a file each; kept until the program ends.
class Home {
 public:
  explicit Home(int definitions) {
    const QString folder = m_folder.filePath(QStringLiteral("transformers"));
    QDir().mkpath(folder);
    for (int number = 0; number < definitions; ++number) {
      m_files.push_back(folder + QLatin1Char('/') + nameOf(number) + QLatin1String(".ort"));
      QFile file(m_files.back());
      if (!file.open(QIODevice::WriteOnly) || file.write(definition(number)) < 0)
        std::abort();
    }
  }

  static const Home& of(int definitions) {
    static std::map<int, std::unique_ptr<Home>> homes;
    std::unique_ptr<Home>& home = homes[definitions];
    if (!home)
      home = std::make_unique<Home>(definitions);
    return *home;
  }

  TransformerMgr& load() const {
    static ORXSession session;
    qputenv("ORX_HOME", QFile::encodeName(m_folder.path()));
    qputenv("XDG_DATA_HOME", QFile::encodeName(m_folder.path()));
    qunsetenv("ORX_TRANSFORMER_PATH");
    TransformerMgr& registry = TransformerMgr::getTransformerMgr();
    registry.loadTransformers(&session);
    return registry;
  }

  // What any reader of text by lines has to do at least: open, read, decode.
  qint64 readLines() const {
    qint64 lines = 0;
    for (const QString& path : m_files) {
      QFile file(path);
      file.open(QIODevice::ReadOnly);
      QTextStream stream(&file);
      stream.setCodec("UTF-8");
      for (QString line; stream.readLineInto(&line);)
        ++lines;
    }
    return lines;
  }

  // The same as bytes, nothing decoded.
  qint64 readByteLines() const {
    qint64 lines = 0;
    for (const QString& path : m_files) {
      std::ifstream file(QFile::encodeName(path).toStdString());
      for (std::string line; std::getline(file, line);)
        ++lines;
    }
    return lines;
  }

 private:
  QTemporaryDir m_folder;
  std::vector<QString> m_files;
};

void useAll(TransformerMgr& registry) {
  for (const QString& name : registry.transformerNames())
    delete registry.getTransformer(name, ITransformerMgr::NEWEST_VERSION);
}

template <class Work>
double seconds(const Work& work) {
  const auto start = std::chrono::steady_clock::now();
  work();
  return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
}

void BM_Load(benchmark::State& state) {
  const int definitions = static_cast<int>(state.range(0));
  const Home& home = Home::of(definitions);
  double load = 0;
  double lines = 0;
  double bytes = 0;
  qint64 read = home.readLines();
  for (auto _ : state) {
    // As at the start of a program: nothing to throw away first, no memory at hand.
    Home::of(0).load();
    malloc_trim(0);
    const double own = seconds([&] {
      if (home.load().transformerNames().size() != definitions)
        state.SkipWithError("definitions got lost");
    });
    load += own;
    lines += seconds([&] { benchmark::DoNotOptimize(read = home.readLines()); });
    bytes += seconds([&] { benchmark::DoNotOptimize(read = home.readByteLines()); });
    state.SetIterationTime(own);
  }
  state.counters["ratio_text"] = load / lines;
  state.counters["ratio_bytes"] = load / bytes;
  state.counters["us_each"] = 1e6 * load / (static_cast<double>(state.iterations()) * definitions);
}

// In KiB; 0 where the system does not tell.
double processMemory(const char* key) {
  std::ifstream status("/proc/self/status");
  for (std::string line; std::getline(status, line);) {
    if (line.rfind(key, 0) == 0)
      return std::stod(line.substr(line.find(':') + 1));
  }
  return 0;
}

// The first use of each definition, which makes its prototype, and of all of them the second.
void BM_FirstUse(benchmark::State& state) {
  const int definitions = static_cast<int>(state.range(0));
  const Home& home = Home::of(definitions);
  double first = 0;
  double second = 0;
  for (auto _ : state) {
    TransformerMgr& registry = home.load();
    const double once = seconds([&] { useAll(registry); });
    second += seconds([&] { useAll(registry); });
    first += once;
    state.SetIterationTime(once);
  }
  const double uses = static_cast<double>(state.iterations()) * definitions;
  state.counters["us_first"] = 1e6 * first / uses;
  state.counters["us_second"] = 1e6 * second / uses;
}

// Above what the process held before loading.
void BM_PeakMemory(benchmark::State& state) {
  const int definitions = static_cast<int>(state.range(0));
  const Home& home = Home::of(definitions);
  double loaded = 0;
  double used = 0;
  for (auto _ : state) {
    Home::of(0).load();
    malloc_trim(0);
    const double before = processMemory("VmRSS");
    if (!(std::ofstream("/proc/self/clear_refs") << "5" << std::flush)) {  // the peak begins anew
      state.SkipWithError("the peak cannot be reset");
      break;
    }
    TransformerMgr& registry = home.load();
    loaded = processMemory("VmHWM") - before;
    useAll(registry);
    used = processMemory("VmHWM") - before;
  }
  state.counters["KiB_each"] = loaded / definitions;
  state.counters["KiB_each_used"] = used / definitions;
}

enum class By { Name, Key, Alias };

void BM_LookUp(benchmark::State& state, By by) {
  const int definitions = static_cast<int>(state.range(0));
  TransformerMgr& registry = Home::of(definitions).load();
  useAll(registry);
  QStringList asked;
  std::minstd_rand random;
  for (int i = 0; i < 100; ++i) {
    const int number = static_cast<int>(random() % static_cast<unsigned>(definitions));
    asked << (by == By::Alias ? aliasOf(number) : nameOf(number));
  }
  const int version = by == By::Key ? 1 : ITransformerMgr::NEWEST_VERSION;
  int at = 0;
  for (auto _ : state) {
    const std::unique_ptr<TransformerCfg> copy(registry.getTransformer(asked.at(at), version));
    if (!copy)
      state.SkipWithError("a definition is not found");
    at = (at + 1) % asked.size();
  }
}

double run(const QString& program, const QStringList& arguments) {
  QProcess process;
  process.setStandardOutputFile(QProcess::nullDevice());
  return seconds([&] {
    process.start(program, arguments);
    process.waitForFinished();
  });
}

void BM_StartUp(benchmark::State& state) {
  qputenv("ORX_HOME", ORX_SOURCE_DIR "/resources");
  const QString orxt = QFileInfo(QFile::symLinkTarget(QStringLiteral("/proc/self/exe"))).absolutePath() +
                       QLatin1String("/orxt");
  double own = 0;
  double nothing = 0;
  for (auto _ : state) {
    const double once = run(
        orxt, {QStringLiteral("transformers"), QStringLiteral("show"), QStringLiteral("GeometryBufferer")});
    own += once;
    nothing += run(QStringLiteral("true"), {});
    state.SetIterationTime(once);
  }
  state.counters["ms"] = 1e3 * own / static_cast<double>(state.iterations());
  state.counters["ms_true"] = 1e3 * nothing / static_cast<double>(state.iterations());
}

}  // namespace

BENCHMARK(BM_StartUp)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(BM_PeakMemory)->Arg(1000)->Arg(10000)->Iterations(1);
BENCHMARK(BM_Load)->Arg(1000)->Arg(10000)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK(BM_FirstUse)->Arg(1000)->Arg(10000)->UseManualTime()->Unit(benchmark::kMillisecond);
BENCHMARK_CAPTURE(BM_LookUp, name, By::Name)->RangeMultiplier(10)->Range(100, 10000);
BENCHMARK_CAPTURE(BM_LookUp, key, By::Key)->RangeMultiplier(10)->Range(100, 10000);
BENCHMARK_CAPTURE(BM_LookUp, alias, By::Alias)->RangeMultiplier(10)->Range(100, 10000);

BENCHMARK_MAIN();
