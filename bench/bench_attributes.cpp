// Attributes on their way: chains in which every transformer adds one, plain and placed as custom
// transformers, and joins of many inputs. The time and the memory per transformer must not grow with the
// length of a chain. It is the time of the processor, so that neither the disk nor other programs take part.
#include <platform/session/session.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/registry/TransformerMgr.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/WorkspaceValidation.h>

#include <QFile>
#include <QTemporaryDir>

#include <algorithm>
#include <bench/PeakMemory.h>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <functional>

namespace {

void addNumberer(SmallWorkspace& workspace, int id, const QString& attribute) {
  workspace.transformer(id, "SequenceNumberer",
                        {"XFORMER_NAME", QStringLiteral("Number_%1").arg(id), "NUMBER_ATTRIBUTE", attribute},
                        {"VERSION", "1"});
}

QByteArray makeChain(int count) {
  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id"}).writer(2, "Result");
  for (int id = 3; id < count + 3; ++id) {
    addNumberer(workspace, id, QStringLiteral("number_%1").arg(id));
    workspace.link(id == 3 ? 1 : id - 1, id == 3 ? "fo 0" : "fo 0 OUTPUT", id, "fi 0 INPUT");
  }
  workspace.link(count + 2, "fo 0 OUTPUT", 2, "fi 0");
  return workspace.text().toUtf8();
}

QByteArray makeCustomChain(int count) {
  SmallWorkspace workspace;
  workspace.reader(1, "Parcels", {"id"}).writer(2, "Result");
  workspace.beginCustom("Numbering", {"VERSION", "1"})
      .parameter("GUI TEXT_ENCODED NAME Name", "number")
      .port(1, "IN", "true")
      .port(2, "OUT", "false");
  addNumberer(workspace, 3, "$(NAME)");
  workspace.link(1, "fo 0", 3, "fi 0 INPUT").link(3, "fo 0 OUTPUT", 2, "fi 0").endCustom();
  for (int id = 3; id < count + 3; ++id) {
    workspace.transformer(id, "SubDocumentTransformer",
                          {"XFORMER_NAME", QStringLiteral("Numbering_%1").arg(id), "SUB_DOC_NAME",
                           "Numbering", "NAME", QStringLiteral("number_%1").arg(id)},
                          {"VERSION", "1"}, "<OUTPUT_FEAT NAME=\"OUT\"/>");
    workspace.link(id == 3 ? 1 : id - 1, id == 3 ? "fo 0" : "fo 0 OUT", id, "fi 0 IN");
  }
  workspace.link(count + 2, "fo 0 OUT", 2, "fi 0");
  return workspace.text().toUtf8();
}

// As many readers as it says, each with a thousand attributes of its own, all into one transformer.
QByteArray makeJoin(int count) {
  SmallWorkspace workspace;
  workspace.writer(1, "Result");
  for (int reader = 0; reader < count; ++reader) {
    QStringList attributes;
    for (int i = 0; i < 1000; ++i)
      attributes << QStringLiteral("a_%1_%2").arg(reader).arg(i);
    workspace.reader(reader + 3, QStringLiteral("Parcels_%1").arg(reader), attributes)
        .link(reader + 3, "fo 0", 2, "fi 0 INPUT");
  }
  addNumberer(workspace, 2, "number");
  workspace.link(2, "fo 0 OUTPUT", 1, "fi 0");
  return workspace.text().toUtf8();
}

double microsecondsOf(const std::function<void()>& work) {
  const std::clock_t start = std::clock();
  work();
  return static_cast<double>(std::clock() - start) * 1e6 / CLOCKS_PER_SEC;
}

}  // namespace

int main() {
  ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  registry.loadTransformers(&session);
  QTemporaryDir folder;
  const QString file = folder.filePath(QStringLiteral("w.orw"));
  const QString written = folder.filePath(QStringLiteral("w.mf"));
  const struct {
    const char* what;
    QByteArray (*make)(int count);
    std::vector<int> counts;
  } cases[] = {{"chain", makeChain, {1000, 4000, 16000}},
               {"custom chain", makeCustomChain, {500, 2000}},
               {"join, per input", makeJoin, {100, 1000}}};
  std::printf(
      "                       count   us each validated   generated   ratio to the first   KiB each\n");
  for (const auto& each : cases) {
    double first = 0;
    for (const int count : each.counts) {
      QFile input(file);
      if (!input.open(QIODevice::WriteOnly) || input.write(each.make(count)) < 0)
        return 1;
      input.close();
      const auto validate = [&] {
        const ValidationReport report = validateWorkspace(file, registry);
        if (report.isReadable() && report.count(orx::Severity::Error) == 0)
          return;
        std::printf("%s\n", report.isReadable() ? qUtf8Printable(orx::formatFinding(report.findings.front()))
                                                : qUtf8Printable(report.readError));
        std::exit(1);
      };
      const auto generate = [&] {
        orx::Findings findings(file);
        QString error;
        if (translateWorkspace({file, written, {}}, registry, findings, error) != TranslationResult::Done)
          std::exit(1);
      };
      validate();
      double validated = 1e18;
      double generated = 1e18;
      for (int run = 0; run < (count <= 1000 ? 5 : 2); ++run) {
        validated = std::min(validated, microsecondsOf(validate) / count);
        generated = std::min(generated, microsecondsOf(generate) / count);
      }
      first = first == 0 ? generated : first;
      std::printf("%-20s %7d %19.1f %11.1f %20.2f %10.1f\n", each.what, count, validated, generated,
                  generated / first, peakMemory(generate) / 1024 / count);
      std::fflush(stdout);
    }
  }
  return 0;
}
