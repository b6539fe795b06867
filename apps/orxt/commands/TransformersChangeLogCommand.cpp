#include <apps/orxt/commands/TransformersChangeLogCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <transform/core/TransformerCfg.h>
#include <transform/files/AtomicFile.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <limits>
#include <memory>

namespace messages = orx::messages;

namespace {

constexpr int kHighestVersion = std::numeric_limits<int>::max();

constexpr CommandFacts kFacts = {"changelog", "Write what changed in a transformer as an HTML page",
                                 "orxt transformers changelog GeometryBufferer --from 1 -o changes.html"};

QByteArray changesAsJson(const std::vector<TransformerMgr::VersionChanges>& versions) {
  QJsonArray list;
  for (const TransformerMgr::VersionChanges& version : versions) {
    list.append(QJsonObject{{QStringLiteral("name"), version.name},
                            {QStringLiteral("localizedName"), version.localizedName},
                            {QStringLiteral("version"), version.version},
                            {QStringLiteral("changes"), QJsonArray::fromStringList(version.entries)}});
  }
  return QJsonDocument(list).toJson();
}

}  // namespace

TransformersChangeLogCommand::TransformersChangeLogCommand() : Command(kFacts) {}

void TransformersChangeLogCommand::declare(CLI::App& app) {
  app.add_option("name", m_name, "Name, alias or shown name of the transformer")
      ->type_name("NAME")
      ->required();
  app.add_option("--from", m_fromVersion, "Only what came after this version; without it all versions")
      ->type_name("VERSION")
      ->check(CLI::Range(0, kHighestVersion));
  app.add_option("--version", m_version, "Only what came up to this version of the transformer itself")
      ->type_name("VERSION")
      ->check(CLI::Range(0, kHighestVersion));
  app.add_flag("--json", m_json, "As JSON: a list of versions, newest first, each with its changes");
  app.add_option("-o,--output", m_output, "File to write; - is standard output, which is the default")
      ->type_name("FILE");
  m_definitions.declare(app);
}

ExitStatus TransformersChangeLogCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.loadCatalogue(console);
  const QString asked = QString::fromStdString(m_name);
  QString error;
  const std::unique_ptr<TransformerCfg> newest =
      findTransformer(registry, asked, ITransformerMgr::NEWEST_VERSION, error);
  if (!newest) {
    console.fail(error);
    return kExitRefused;
  }
  const QString name = newest->getName();
  const int highest = std::max(m_fromVersion, m_version);
  if (highest > newest->getVersion()) {
    console.fail(messages::kNoVersionOf,
                 {name, QString::number(highest), QString::number(newest->getVersion())});
    return kExitRefused;
  }
  // One that is no longer offered leads on to what replaces it.
  const bool isReplaced =
      m_version < 0 && !newest->isVisible() && registry.transformerNames().contains(newest->replacedBy());
  const QString target = isReplaced ? newest->replacedBy() : name;
  const QByteArray text =
      m_json ? changesAsJson(registry.changes(name, m_fromVersion, target, m_version))
             : registry.changeLog(name, m_fromVersion, target, m_version).join(QLatin1Char('\n')).toUtf8() +
                   '\n';

  AtomicFile output(QString::fromStdString(m_output));
  if (output.open()) {
    output.device().write(text);
    if (output.commit())
      return kExitDone;
  }
  console.fail(messages::kNotWritable, {output.errorString()});
  return kExitFile;
}
