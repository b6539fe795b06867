// Whole workspaces into mapping files: the time per transformer must not grow with the workspace, and judging
// the workspace first may cost at most 1.3 times what translating costs without. Loading the definitions is
// left out. It is the time of the processor, so that neither the disk nor other programs take part.
#include <platform/session/session.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/WorkspaceJudgement.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/generation/PreparedWorkspace.h>

#include <QFile>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <ctime>

namespace {

// Chains of ten transformers each, from one reader to one writer.
QByteArray makeWorkspace(int count, TransformerMgr& registry) {
  // With the values that each must have.
  const std::pair<QString, QStringList> types[] = {
      {"SequenceNumberer", {}},
      {"GeometryBufferer", {}},
      {"FeatureOrderer", {"ORDER_BY", "id;NUMBER;ASCENDING"}},
      {"NullReplacer", {"ATTRIBUTES", "zone"}},
      {"ConditionSplitter",
       {"CONDITION", "<commercialat>Value<leftparenthesis>id<rightparenthesis><space>=<space>1"}}};
  struct Kind {
    QString type;
    QStringList parameters;
    int version;
    QString input;
    QString output;
  };
  std::vector<Kind> kinds;
  for (const auto& [type, parameters] : types) {
    const std::unique_ptr<TransformerCfg> cfg =
        registry.makeTransformer(type, TransformerSource::kNewestVersion);
    if (!cfg)
      qFatal("no transformer %s", qUtf8Printable(type));
    QStringList inputs;
    QStringList outputs;
    cfg->getInputTags(inputs);
    cfg->getOutputTags(outputs);
    kinds.push_back({type, parameters, cfg->getVersion(), inputs.first(), outputs.first()});
  }

  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id", "zone"}).writer(2, "Result");
  for (int i = 0; i < count; ++i) {
    const Kind& kind = kinds[static_cast<std::size_t>(i) % kinds.size()];
    const int id = i + 3;
    const QStringList name = {"XFORMER_NAME", QStringLiteral("%1_%2").arg(kind.type).arg(i)};
    workspace.transformer(id, kind.type, name + kind.parameters, {"VERSION", QString::number(kind.version)});
    if (i % 10 == 0)
      workspace.link(1, "fo 0", id, "fi 0 " + kind.input);
    else
      workspace.link(id - 1, "fo 0 " + kinds[static_cast<std::size_t>(i - 1) % kinds.size()].output, id,
                     "fi 0 " + kind.input);
    if (i % 10 == 9 || i == count - 1)
      workspace.link(id, "fo 0 " + kind.output, 2, "fi 0");
  }
  return workspace.text().toUtf8();
}

struct Times {
  double read = 0;  // microseconds, each from the start
  double prepared = 0;
  double written = 0;
};

double microsecondsSince(std::clock_t start) {
  return static_cast<double>(std::clock() - start) * 1e6 / CLOCKS_PER_SEC;
}

[[noreturn]] void fail(const std::vector<orx::Finding>& findings) {
  if (!findings.empty())
    std::printf("%s\n", qUtf8Printable(orx::formatFinding(findings.front())));
  std::exit(1);
}

template <typename Writer>
void writeTo(const QString& fileName, Writer& writer) {
  QFile output(fileName);
  if (!output.open(QIODevice::WriteOnly))
    qFatal("cannot write");
  MFDeviceBuffer buffer(output);
  if (!writer.write(buffer))
    qFatal("not written");
}

Times translate(const QString& file, const QString& written, TransformerMgr& registry) {
  orx::Findings diagnostics(file);
  QString error;
  Times times;
  const std::clock_t start = std::clock();
  const std::unique_ptr<Workspace> workspace =
      readWorkspace({file, QString(), {}}, registry, diagnostics, error);
  if (!workspace)
    fail(diagnostics.all());
  times.read = microsecondsSince(start);
  PreparedWorkspace prepared(*workspace, diagnostics);
  if (diagnostics.hasErrors())
    fail(diagnostics.all());
  times.prepared = microsecondsSince(start);
  writeTo(written, prepared);
  times.written = microsecondsSince(start);
  return times;
}

double translateJudged(const QString& file, const QString& written, TransformerMgr& registry) {
  const std::clock_t start = std::clock();
  WorkspaceJudgement judgement(file, registry);
  if (!judgement.allowsWriting())
    fail(judgement.findings());
  writeTo(written, judgement);
  return microsecondsSince(start);
}

}  // namespace

int main() {
  ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&session);
  QTemporaryDir folder;
  const QString file = folder.filePath(QStringLiteral("w.orw"));
  const QString written = folder.filePath(QStringLiteral("w.mf"));
  double first = 0;
  std::printf("transformers   us/transformer   ratio to 1000   (read, order, write)   judged   ratio\n");
  for (const int count : {1000, 10000, 100000}) {
    QFile input(file);
    if (!input.open(QIODevice::WriteOnly) || input.write(makeWorkspace(count, registry)) < 0)
      return 1;
    input.close();
    Times best;
    double judged = 0;
    // A small workspace is over quickly: repeat it until the clock is worth reading.
    for (int run = 0; run < (count <= 1000 ? 20 : count <= 10000 ? 5 : 2); ++run) {
      const Times times = translate(file, written, registry);
      if (run == 0 || times.written < best.written)
        best = times;
      const double time = translateJudged(file, written, registry);
      judged = run == 0 ? time : std::min(judged, time);
    }
    const double each = best.written / count;
    if (first == 0)
      first = each;
    std::printf("%12d   %14.2f   %13.2f   (%.2f, %.2f, %.2f)   %.2f   %.2f\n", count, each, each / first,
                best.read / count, (best.prepared - best.read) / count,
                (best.written - best.prepared) / count, judged / count, judged / best.written);
  }
  return 0;
}
