// Whole workspaces into mapping files: the time per transformer must not grow with the workspace. Loading the
// definitions is left out.
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/MFDeviceBuffer.h>
#include <translation/MappingFileWriter.h>
#include <translation/WorkspaceTranslation.h>

#include <QElapsedTimer>
#include <QFile>
#include <QTemporaryDir>

#include <cstdio>

namespace {

QString transformer(int id, const QString& type, int version, const QStringList& parameters) {
  QString text = QStringLiteral("#! <TRANSFORMER IDENTIFIER=\"%1\" TYPE=\"%2\" VERSION=\"%3\">\n")
                     .arg(id)
                     .arg(type)
                     .arg(version);
  for (int i = 0; i + 1 < parameters.size(); i += 2) {
    text += QStringLiteral("#!     <XFORM_PARM PARM_NAME=\"%1\" PARM_VALUE=\"%2\"/>\n")
                .arg(parameters.at(i), parameters.at(i + 1));
  }
  return text + QStringLiteral("#! </TRANSFORMER>\n");
}

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

  QString text = QStringLiteral(
      "#! <?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n#! <WORKSPACE>\n#! <FEATURE_TYPES>\n"
      "#! <FEATURE_TYPE IS_SOURCE=\"true\" FEATURE_TYPE_NAME=\"Parcels\" IDENTIFIER=\"1\" KEYWORD=\"IN\">\n"
      "#! <FEAT_ATTRIBUTE ATTR_NAME=\"id\"/>\n#! <FEAT_ATTRIBUTE ATTR_NAME=\"zone\"/>\n#! </FEATURE_TYPE>\n"
      "#! <FEATURE_TYPE IS_SOURCE=\"false\" FEATURE_TYPE_NAME=\"Result\" IDENTIFIER=\"2\" KEYWORD=\"OUT\"/>\n"
      "#! </FEATURE_TYPES>\n#! <TRANSFORMERS>\n");
  QString links;
  int linkCount = 0;
  const auto link = [&](int from, const QString& output, int to, const QString& input) {
    links += QStringLiteral(
                 "#! <FEAT_LINK IDENTIFIER=\"%1\" SOURCE_NODE=\"%2\" TARGET_NODE=\"%3\" "
                 "SOURCE_PORT_DESC=\"fo 0 %4\" TARGET_PORT_DESC=\"fi 0 %5\"/>\n")
                 .arg(++linkCount)
                 .arg(from)
                 .arg(to)
                 .arg(output, input);
  };
  for (int i = 0; i < count; ++i) {
    const Kind& kind = kinds[static_cast<std::size_t>(i) % kinds.size()];
    const int id = i + 3;
    text += transformer(id, kind.type, kind.version,
                        {QStringLiteral("XFORMER_NAME"), QStringLiteral("%1_%2").arg(kind.type).arg(i)});
    if (i % 10 == 0)
      link(1, QString(), id, kind.input);
    else
      link(id - 1, kinds[static_cast<std::size_t>(i - 1) % kinds.size()].output, id, kind.input);
    if (i % 10 == 9 || i == count - 1)
      link(id, kind.output, 2, QString());
  }
  text += QStringLiteral("#! </TRANSFORMERS>\n#! <FEAT_LINKS>\n") + links +
          QStringLiteral("#! </FEAT_LINKS>\n#! </WORKSPACE>\n");
  return text.toUtf8();
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
      Diagnostics diagnostics(file);
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
        for (const Diagnostic& diagnostic : diagnostics.all())
          std::printf("%s\n", qUtf8Printable(formatDiagnostic(diagnostic)));
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
