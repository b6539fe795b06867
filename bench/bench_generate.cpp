// Whole workspaces into mapping files: the time per transformer must not grow with the workspace. Loading the
// definitions is left out.
#include <platform/session/session.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/generation/MappingFileWriter.h>

#include <QElapsedTimer>
#include <QFile>
#include <QTemporaryDir>

#include <cstdio>

namespace {

// Chains of ten transformers each, from one reader to one writer.
QByteArray makeWorkspace(int count, TransformerMgr& registry) {
  const QStringList types = {QStringLiteral("SequenceNumberer"), QStringLiteral("GeometryBufferer"),
                             QStringLiteral("FeatureOrderer"), QStringLiteral("NullReplacer"),
                             QStringLiteral("ConditionSplitter")};
  struct Kind {
    QString type;
    int version;
    QString input;
    QString output;
  };
  std::vector<Kind> kinds;
  for (const QString& type : types) {
    const std::unique_ptr<TransformerCfg> cfg =
        registry.makeTransformer(type, TransformerSource::kNewestVersion);
    if (!cfg)
      qFatal("no transformer %s", qUtf8Printable(type));
    QStringList inputs;
    QStringList outputs;
    cfg->getInputTags(inputs);
    cfg->getOutputTags(outputs);
    kinds.push_back({type, cfg->getVersion(), inputs.first(), outputs.first()});
  }

  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id", "zone"}).writer(2, "Result");
  for (int i = 0; i < count; ++i) {
    const Kind& kind = kinds[static_cast<std::size_t>(i) % kinds.size()];
    const int id = i + 3;
    workspace.transformer(id, kind.type, {"XFORMER_NAME", QStringLiteral("%1_%2").arg(kind.type).arg(i)},
                          {"VERSION", QString::number(kind.version)});
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

}  // namespace

int main() {
  ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&session);
  QTemporaryDir folder;
  double first = 0;
  std::printf("transformers   us/transformer   ratio to 1000   (read, order, write)\n");
  for (const int count : {1000, 10000, 100000}) {
    const QString file = folder.filePath(QStringLiteral("w.orw"));
    QFile input(file);
    if (!input.open(QIODevice::WriteOnly) || input.write(makeWorkspace(count, registry)) < 0)
      return 1;
    input.close();
    double best = 0;
    double parts[3] = {0, 0, 0};
    // A small workspace is over quickly: repeat it until the clock is worth reading.
    for (int run = 0; run < (count <= 1000 ? 20 : count <= 10000 ? 5 : 2); ++run) {
      orx::Findings diagnostics(file);
      QString error;
      QElapsedTimer timer;
      timer.start();
      const std::unique_ptr<Workspace> workspace =
          readWorkspace({file, QString(), {}}, registry, diagnostics, error);
      if (!workspace)
        return 1;
      const double read = static_cast<double>(timer.nsecsElapsed());
      MappingFileWriter writer(*workspace, diagnostics);
      if (!writer.prepare()) {
        for (const orx::Finding& diagnostic : diagnostics.all())
          std::printf("%s\n", qUtf8Printable(orx::formatFinding(diagnostic)));
        return 1;
      }
      const double prepared = static_cast<double>(timer.nsecsElapsed());
      QFile output(folder.filePath(QStringLiteral("w.mf")));
      if (!output.open(QIODevice::WriteOnly))
        return 1;
      {
        MFDeviceBuffer buffer(output);
        writer.write(buffer);
      }
      output.close();
      const double total = static_cast<double>(timer.nsecsElapsed());
      if (best == 0 || total < best) {
        best = total;
        parts[0] = read;
        parts[1] = prepared - read;
        parts[2] = total - prepared;
      }
    }
    const double each = best / 1000 / count;
    if (first == 0)
      first = each;
    std::printf("%12d   %14.2f   %13.2f   (%.2f, %.2f, %.2f)\n", count, each, each / first,
                parts[0] / 1000 / count, parts[1] / 1000 / count, parts[2] / 1000 / count);
  }
  return 0;
}
