// Validation against generation of the same workspaces, in which every tenth transformer refers to an
// attribute that does not arrive, and the checks of the mapping files written: the time per transformer must
// not grow with the workspace. It is the time of the processor, so that neither the disk nor other programs
// take part.
#include <platform/session/session.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/MappingFileLint.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/WorkspaceValidation.h>

#include <QFile>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <ctime>

using orx::Severity;

namespace {

double microsecondsSince(std::clock_t start) {
  return static_cast<double>(std::clock() - start) * 1e6 / CLOCKS_PER_SEC;
}

// Chains of ten transformers each, from one reader to one writer; the last of each chain is at fault.
QByteArray makeWorkspace(int count) {
  QStringList attributes;
  for (int i = 0; i < 50; ++i)
    attributes << QStringLiteral("measure_%1").arg(i);
  SmallWorkspace workspace;
  workspace.writer(2, "Result").reader(1, "Parcels", attributes);
  for (int i = 0; i < count; ++i) {
    const bool isLast = i % 10 == 9;
    const int id = i + 3;
    workspace.transformer(id, "GeometryBufferer",
                          {"XFORMER_NAME", QStringLiteral("Zone_%1").arg(id), "EXTENT",
                           QStringLiteral("DISTANCE;@Value(%1);DISTANCE_UNIT;GROUND")
                               .arg(QLatin1String(isLast ? "measrue_49" : "measure_7"))},
                          {"VERSION", "1"});
    workspace.link(i % 10 == 0 ? 1 : id - 1, i % 10 == 0 ? "fo 0" : "fo 0 OUTPUT", id, "fi 0 INPUT");
    if (isLast)
      workspace.link(id, "fo 0 OUTPUT", 2, "fi 0");
  }
  return workspace.text().toUtf8();
}

}  // namespace

int main() {
  ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&session);
  QTemporaryDir folder;
  const QString file = folder.filePath(QStringLiteral("w.orw"));
  const QString written = folder.filePath(QStringLiteral("w.mf"));
  std::printf("transformers   faults   us/transformer validated   generated   ratio   linted\n");
  for (const int count : {1000, 10000, 100000}) {
    QFile input(file);
    if (!input.open(QIODevice::WriteOnly) || input.write(makeWorkspace(count)) < 0)
      return 1;
    input.close();
    double validated = 0;
    double generated = 0;
    double linted = 0;
    for (int run = 0; run < (count <= 1000 ? 5 : count <= 10000 ? 2 : 1); ++run) {
      std::clock_t start = std::clock();
      const ValidationReport report = validateWorkspace(file, registry);
      const double validation = microsecondsSince(start) / count;
      if (report.count(Severity::Error) != count / 10 ||
          !std::is_sorted(
              report.findings.begin(), report.findings.end(),
              [](const orx::Finding& left, const orx::Finding& right) { return left.line < right.line; })) {
        std::printf("%d findings instead of %d, or not in their order\n", report.count(Severity::Error),
                    count / 10);
        return 1;
      }
      if (!report.findings.back().text.contains(QLatin1String("'measure_49'"))) {
        std::printf("the last finding suggests nothing\n");
        return 1;
      }
      orx::Findings diagnostics(file);
      QString error;
      start = std::clock();
      if (translateWorkspace({file, written, {}}, registry, diagnostics, error) != TranslationResult::Done)
        return 1;
      const double generation = microsecondsSince(start) / count;
      start = std::clock();
      const MappingFileFindings findings = lintMappingFile(written, written, {});
      const double lint = microsecondsSince(start) / count;
      if (!findings.readError.isEmpty() || !findings.findings.empty()) {
        std::printf("%zu findings in the mapping file\n", findings.findings.size());
        return 1;
      }
      validated = run == 0 ? validation : std::min(validated, validation);
      generated = run == 0 ? generation : std::min(generated, generation);
      linted = run == 0 ? lint : std::min(linted, lint);
    }
    std::printf("%12d %8d %26.1f %11.1f %7.2f %8.1f\n", count, count / 10, validated, generated,
                validated / generated, linted);
  }
  return 0;
}
