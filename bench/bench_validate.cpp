// Validation against generation of the same workspaces, in which every tenth transformer refers to an
// attribute that does not arrive, and the checks of the mapping files written: the time per transformer must
// not grow with the workspace. It is the time of the processor, so that neither the disk nor other programs
// take part.
#include <platform/session/session.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/MappingFileLint.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/WorkspaceValidation.h>

#include <QFile>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <ctime>

namespace {

double microsecondsSince(std::clock_t start) {
  return static_cast<double>(std::clock() - start) * 1e6 / CLOCKS_PER_SEC;
}

QString link(int number, int from, const QString& output, int to, const QString& input) {
  return QStringLiteral(
             "#! <FEAT_LINK IDENTIFIER=\"%1\" SOURCE_NODE=\"%2\" TARGET_NODE=\"%3\" SOURCE_PORT_DESC=\"fo "
             "0%4\" "
             "TARGET_PORT_DESC=\"fi 0%5\"/>\n")
      .arg(number)
      .arg(from)
      .arg(to)
      .arg(output, input);
}

// Chains of ten transformers each, from one reader to one writer; the last of each chain is at fault.
QByteArray makeWorkspace(int count) {
  QString text = QStringLiteral(
      "#! <?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n#! <WORKSPACE>\n#! <FEATURE_TYPES>\n"
      "#! <FEATURE_TYPE IS_SOURCE=\"false\" FEATURE_TYPE_NAME=\"Result\" IDENTIFIER=\"2\" KEYWORD=\"OUT\"/>\n"
      "#! <FEATURE_TYPE IS_SOURCE=\"true\" FEATURE_TYPE_NAME=\"Parcels\" IDENTIFIER=\"1\" KEYWORD=\"IN\">\n");
  for (int i = 0; i < 50; ++i)
    text += QStringLiteral("#! <FEAT_ATTRIBUTE ATTR_NAME=\"measure_%1\"/>\n").arg(i);
  text += QStringLiteral("#! </FEATURE_TYPE>\n#! </FEATURE_TYPES>\n#! <TRANSFORMERS>\n");
  QString links;
  int linkCount = 0;
  for (int i = 0; i < count; ++i) {
    const bool isLast = i % 10 == 9;
    text += QStringLiteral(
                "#! <TRANSFORMER IDENTIFIER=\"%1\" TYPE=\"GeometryBufferer\" VERSION=\"1\">\n"
                "#! <XFORM_PARM PARM_NAME=\"XFORMER_NAME\" PARM_VALUE=\"Zone_%1\"/>\n"
                "#! <XFORM_PARM PARM_NAME=\"EXTENT\" "
                "PARM_VALUE=\"DISTANCE;@Value(%2);DISTANCE_UNIT;GROUND\"/>\n#! </TRANSFORMER>\n")
                .arg(i + 3)
                .arg(isLast ? QStringLiteral("measrue_49") : QStringLiteral("measure_7"));
    links += i % 10 == 0
                 ? link(++linkCount, 1, QString(), i + 3, QStringLiteral(" INPUT"))
                 : link(++linkCount, i + 2, QStringLiteral(" OUTPUT"), i + 3, QStringLiteral(" INPUT"));
    if (isLast)
      links += link(++linkCount, i + 3, QStringLiteral(" OUTPUT"), 2, QString());
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
              [](const Diagnostic& left, const Diagnostic& right) { return left.line < right.line; })) {
        std::printf("%d findings instead of %d, or not in their order\n", report.count(Severity::Error),
                    count / 10);
        return 1;
      }
      if (!report.findings.back().text.contains(QLatin1String("'measure_49'"))) {
        std::printf("the last finding suggests nothing\n");
        return 1;
      }
      Diagnostics diagnostics(file);
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
