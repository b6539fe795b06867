#include <apps/orxt/Console.h>
#include <apps/orxt/ParameterSchema.h>
#include <apps/orxt/TransformersShowCommand.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/TextHelpers.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <memory>

namespace {

constexpr CommandFacts kFacts = {"show", "Show one transformer: its ports, parameters and texts",
                                 "orxt transformers show GeometryBufferer --version 1\n"
                                 "orxt transformers show GeometryBufferer --schema >buffer.schema.json"};

constexpr int kTagColumn = 24;
constexpr int kParameterColumn = 28;

QJsonArray portsAsJson(const TransformerCfg& cfg, const QStringList& tags) {
  QJsonArray ports;
  for (const QString& tag : tags) {
    ports.append(QJsonObject{{QStringLiteral("tag"), tag},
                             {QStringLiteral("description"), cfg.getTagDescription(tag)}});
  }
  return ports;
}

// The type, and what its configuration says in words a person reads.
QString typeAsText(const TransformParamCfg& parameter) {
  QStringList parts;
  for (const auto& [shown, stored] : parameter.choices().entries())
    parts.append(shown);
  for (const GUIType& member : parameter.members().members())
    parts.append(member.getName());
  if (parts.isEmpty())
    return parameter.getTypeWithConfig();
  return parameter.getType() + QLatin1String(" of ") + parts.join(QLatin1String(" | "));
}

}  // namespace

TransformersShowCommand::TransformersShowCommand() : Command(kFacts) {}

void TransformersShowCommand::declare(CLI::App& app) {
  app.add_option("name", m_name, "Name or alias of the transformer")->type_name("NAME")->required();
  app.add_option("--version", m_version, "Version number, newest or oldest")
      ->type_name("VERSION")
      ->check(CLI::IsMember({"newest", "oldest"}) | CLI::NonNegativeNumber)
      ->capture_default_str();
  CLI::Option* json = app.add_flag("--json", m_json, "As JSON");
  app.add_flag("--schema", m_schema, "A JSON Schema of the parameters instead")->excludes(json);
  m_definitions.declare(app);
}

ExitStatus TransformersShowCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.load(console);
  const QString name = QString::fromStdString(m_name);
  const QString version = QString::fromStdString(m_version);
  const int number = version == QLatin1String("newest")   ? ITransformerMgr::NEWEST_VERSION
                     : version == QLatin1String("oldest") ? ITransformerMgr::OLDEST_VERSION
                                                          : version.toInt();
  const std::unique_ptr<TransformerCfg> cfg(registry.getTransformer(name, number));
  if (!cfg) {
    const int newest = registry.currentTransformerVersion(name);
    console.fail(
        newest < 0
            ? QStringLiteral("there is no transformer '%1'; `orxt transformers list` names them all")
                  .arg(name)
            : QStringLiteral("'%1' has no version %2; the newest is %3").arg(name, version).arg(newest));
    return kExitRefused;
  }
  if (m_schema)
    console.print(QString::fromUtf8(QJsonDocument(ParameterSchema(*cfg).schema()).toJson()));
  else if (m_json)
    showJson(*cfg, console);
  else
    showText(*cfg, console);
  return kExitDone;
}

void TransformersShowCommand::showText(const TransformerCfg& cfg, Console& console) const {
  const auto line = [&](const QString& text) { console.print(text + QLatin1Char('\n')); };
  const auto heading = [&](const char* text) { line(QLatin1Char('\n') + QLatin1String(text)); };
  line(
      QStringLiteral("%1 (%2, version %3)").arg(cfg.getLocalizedName(), cfg.getName()).arg(cfg.getVersion()));
  if (isCustomTransformer(&cfg))
    line(QStringLiteral("Custom transformer from %1").arg(cfg.getFileName()));
  if (!cfg.tags().isEmpty())
    line(cfg.tags().join(QLatin1String(", ")));
  if (cfg.isDeprecated())
    line(QStringLiteral("No longer offered; use %1 instead.").arg(cfg.replacedBy()));
  if (!cfg.dependencyMet())
    line(QStringLiteral("May not run here: %1").arg(cfg.dependencyMsg()));
  line(QString());
  for (const QString& text : cfg.getDescriptionLines())
    line(text);

  QStringList inputs;
  QStringList outputs;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(outputs);
  const auto ports = [&](const char* title, const QStringList& tags) {
    if (tags.isEmpty())
      return;
    heading(title);
    for (const QString& tag : tags)
      line(QLatin1String("  ") + makeColumnString(tag, cfg.getTagDescription(tag), kTagColumn));
  };
  ports("Inputs", inputs);
  ports("Outputs", outputs);

  heading("Parameters");
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    line(QLatin1String("  ") + makeColumnString(name, parameter->getDescription(), kParameterColumn));
    QString facts = typeAsText(*parameter);
    if (parameter->getFlag(kGUITypeOptional))
      facts += QLatin1String(", optional");
    if (!parameter->getDefaultValue().isEmpty())
      facts += QLatin1String(", default ") + cfg.getParameterDisplayValue(name);
    line(QLatin1String("  ") + makeColumnString(QString(), facts, kParameterColumn));
  }
  const QStringList changes = cfg.getChangeLog();
  if (!changes.isEmpty()) {
    heading("Changes");
    for (const QString& text : changes)
      line(QLatin1String("  ") + text);
  }
}

void TransformersShowCommand::showJson(const TransformerCfg& cfg, Console& console) const {
  QStringList inputs;
  QStringList outputs;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(outputs);
  QJsonArray parameters;
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    parameters.append(QJsonObject{{QStringLiteral("name"), name},
                                  {QStringLiteral("type"), parameter->getTypeText()},
                                  {QStringLiteral("prompt"), parameter->getDescription()},
                                  {QStringLiteral("default"), parameter->getDefaultValue()},
                                  {QStringLiteral("optional"), parameter->getFlag(kGUITypeOptional)}});
  }
  const QJsonObject object{
      {QStringLiteral("name"), cfg.getName()},
      {QStringLiteral("version"), cfg.getVersion()},
      {QStringLiteral("localizedName"), cfg.getLocalizedName()},
      {QStringLiteral("categories"), QJsonArray::fromStringList(cfg.tags())},
      {QStringLiteral("aliases"), QJsonArray::fromStringList(cfg.aliases())},
      {QStringLiteral("visible"), cfg.isVisible()},
      {QStringLiteral("replacedBy"), cfg.replacedBy()},
      {QStringLiteral("file"), cfg.getFileName()},
      {QStringLiteral("description"), cfg.getDescriptionLines().join(QLatin1Char('\n'))},
      {QStringLiteral("inputs"), portsAsJson(cfg, inputs)},
      {QStringLiteral("outputs"), portsAsJson(cfg, outputs)},
      {QStringLiteral("parameters"), parameters},
      {QStringLiteral("changeLog"), QJsonArray::fromStringList(cfg.getChangeLog())},
  };
  console.print(QString::fromUtf8(QJsonDocument(object).toJson()));
}
