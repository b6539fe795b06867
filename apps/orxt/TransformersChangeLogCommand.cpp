#include <apps/orxt/Console.h>
#include <apps/orxt/TransformersChangeLogCommand.h>
#include <transform/core/TransformerCfg.h>
#include <transform/files/AtomicFile.h>
#include <transform/registry/TransformerMgr.h>

#include <CLI/CLI.hpp>

#include <limits>
#include <memory>

namespace {

constexpr CommandFacts kFacts = {"changelog", "Write what changed in a transformer as an HTML page",
                                 "orxt transformers changelog GeometryBufferer --from 1 -o changes.html"};

}  // namespace

TransformersChangeLogCommand::TransformersChangeLogCommand() : Command(kFacts) {}

void TransformersChangeLogCommand::declare(CLI::App& app) {
  app.add_option("name", m_name, "Name or alias of the transformer")->type_name("NAME")->required();
  app.add_option("--from", m_fromVersion, "Only what came after this version; without it all versions")
      ->type_name("VERSION")
      ->check(CLI::Range(0, std::numeric_limits<int>::max()));
  app.add_option("-o,--output", m_output, "Page to write; - is standard output, which is the default")
      ->type_name("FILE");
  m_definitions.declare(app);
}

ExitStatus TransformersChangeLogCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.load(console);
  const QString asked = QString::fromStdString(m_name);
  const std::unique_ptr<TransformerCfg> newest(
      registry.getTransformer(asked, ITransformerMgr::NEWEST_VERSION));
  if (!newest) {
    console.fail(
        QStringLiteral("there is no transformer '%1'; `orxt transformers list` names them all").arg(asked));
    return kExitRefused;
  }
  const QString name = newest->getName();
  if (m_fromVersion > newest->getVersion()) {
    console.fail(QStringLiteral("'%1' has no version %2; the newest is %3")
                     .arg(name)
                     .arg(m_fromVersion)
                     .arg(newest->getVersion()));
    return kExitRefused;
  }
  // One that is no longer offered leads on to what replaces it.
  const QString target = !newest->isVisible() && registry.transformerNames().contains(newest->replacedBy())
                             ? newest->replacedBy()
                             : name;
  const QStringList page = registry.changeLog(name, m_fromVersion, target, ITransformerMgr::NEWEST_VERSION);

  AtomicFile output(QString::fromStdString(m_output));
  if (output.open()) {
    output.device().write((page.join(QLatin1Char('\n')) + QLatin1Char('\n')).toUtf8());
    if (output.commit())
      return kExitDone;
  }
  console.fail(output.errorString());
  return kExitFile;
}
