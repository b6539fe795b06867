#include <apps/orxt/commands/TransformersShowCommand.h>
#include <apps/orxt/console/Console.h>
#include <apps/orxt/console/PrintableText.h>
#include <apps/orxt/facts/CatalogueText.h>
#include <apps/orxt/facts/ParameterSchema.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

#include <CLI/CLI.hpp>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <memory>
#include <optional>

namespace messages = orx::messages;

namespace {

constexpr CommandFacts kFacts = {"show", "Show one transformer: its ports, parameters and texts",
                                 "orxt transformers show GeometryBufferer --version 1\n"
                                 "orxt transformers show GeometryBufferer --schema >buffer.schema.json"};

constexpr int kTagColumn = 24;
constexpr int kParameterColumn = 28;
constexpr int kLongestLine = 4000;

// The version that the words of the command line ask for; nothing when they ask for none.
std::optional<int> wantedVersion(const std::string& text) {
  if (text == "newest")
    return ITransformerMgr::NEWEST_VERSION;
  if (text == "oldest")
    return ITransformerMgr::OLDEST_VERSION;
  bool isNumber = false;
  const int number = QString::fromStdString(text).toInt(&isNumber);
  return isNumber && number >= 0 ? std::optional<int>(number) : std::nullopt;
}

std::string checkVersion(const std::string& text) {
  return wantedVersion(text) ? std::string()
                             : "'" + text + "' is neither a version number nor newest or oldest";
}

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
  QStringList choices;
  QStringList members;
  for (const auto& [shown, stored] : parameter.choices().entries())
    choices.append(shown);
  for (const GUIType& member : parameter.members().members())
    members.append(member.getDescription().isEmpty() ? member.getName() : member.getDescription());
  return choices.isEmpty() && members.isEmpty()
             ? parameter.getTypeWithConfig()
             : TransformResString(members.isEmpty() ? messages::kOneOf : messages::kMadeOf,
                                  {parameter.getType(), (choices + members).join(QLatin1String(" | "))});
}

}  // namespace

TransformersShowCommand::TransformersShowCommand() : Command(kFacts) {}

void TransformersShowCommand::declare(CLI::App& app) {
  app.add_option("name", m_name, "Name, alias or shown name of the transformer")
      ->type_name("NAME")
      ->required();
  app.add_option("--version", m_version, "Version number, newest or oldest")
      ->type_name("VERSION")
      ->check(checkVersion)
      ->capture_default_str();
  CLI::Option* json = app.add_flag("--json", m_json, "As JSON");
  app.add_flag("--schema", m_schema, "A JSON Schema of the parameters instead")->excludes(json);
  m_definitions.declare(app);
}

ExitStatus TransformersShowCommand::run(Console& console) {
  TransformerMgr& registry = m_definitions.loadCatalogue(console);
  const QString name = QString::fromStdString(m_name);
  QString error;
  const std::unique_ptr<TransformerCfg> cfg =
      findTransformer(registry, name, *wantedVersion(m_version), error);
  if (!cfg) {
    console.fail(error);
    return kExitRefused;
  }
  if (m_schema)
    console.print(QString::fromUtf8(QJsonDocument(ParameterSchema(*cfg).schema()).toJson()));
  else if (m_json)
    showJson(*cfg, registry, console);
  else
    showText(*cfg, registry, console);
  return kExitDone;
}

void TransformersShowCommand::showText(const TransformerCfg& cfg, const TransformerMgr& registry,
                                       Console& console) const {
  const auto line = [&](const QString& text) { console.print(text + QLatin1Char('\n')); };
  const auto heading = [&](long message) { line(QLatin1Char('\n') + TransformResString(message)); };
  const auto printable = [](const QString& text) { return onOneLine(text, kLongestLine); };
  const auto row = [&](const QString& left, const QString& right, int width) {
    line(QLatin1String("  ") + makeColumnString(printable(left), printable(right), width));
  };
  line(printable(TransformResString(
      messages::kHeadline, {cfg.getLocalizedName(), cfg.getName(), QString::number(cfg.getVersion())})));
  if (isCustomTransformer(&cfg))
    line(printable(TransformResString(messages::kCustomFile, cfg.getFileName())));
  QStringList categories;
  for (const QString& tag : cfg.tags())
    categories << registry.getLocalizedCategoryName(tag);
  if (!categories.isEmpty())
    line(printable(categories.join(QLatin1String(", "))));
  QStringList others;
  for (const int version : registry.transformerVersions(cfg.getName())) {
    if (version != cfg.getVersion())
      others << QString::number(version);
  }
  if (!others.isEmpty())
    line(TransformResString(messages::kOtherVersions, others.join(QLatin1String(", "))));
  if (cfg.isDeprecated())
    line(printable(TransformResString(messages::kReplaced, cfg.replacedBy())));
  if (!cfg.dependencyMet())
    line(printable(TransformResString(messages::kMayNotRun, cfg.dependencyMsg())));
  line(QString());
  for (const QString& text : cfg.getDescriptionLines())
    line(printable(text));

  QStringList inputs;
  QStringList outputs;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(outputs);
  const auto ports = [&](long title, const QStringList& tags) {
    if (tags.isEmpty())
      return;
    heading(title);
    for (const QString& tag : tags)
      row(tag, cfg.getTagDescription(tag), kTagColumn);
  };
  ports(messages::kInputs, inputs);
  ports(messages::kOutputs, outputs);

  heading(messages::kParameters);
  for (const QString& name : cfg.getParameters()) {
    const TransformParamCfg* parameter = cfg.getParameterByMacroName(name);
    row(name, parameter->getDescription(), kParameterColumn);
    QStringList facts{typeAsText(*parameter)};
    if (parameter->getFlag(kGUITypeOptional))
      facts << TransformResString(messages::kOptional);
    if (!parameter->getDefaultValue().isEmpty())
      facts << TransformResString(messages::kDefault,
                                  cfg.formatParamDisplayString(name, parameter->getDefaultValue(), false));
    row(QString(), facts.join(QLatin1String(", ")), kParameterColumn);
  }
  const QStringList changes = cfg.getChangeLog();
  if (!changes.isEmpty()) {
    heading(messages::kChangesTitle);
    for (const QString& text : changes)
      line(QLatin1String("  ") + printable(text));
  }
}

void TransformersShowCommand::showJson(const TransformerCfg& cfg, const TransformerMgr& registry,
                                       Console& console) const {
  QStringList inputs;
  QStringList outputs;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(outputs);
  QJsonArray versions;
  for (const int version : registry.transformerVersions(cfg.getName()))
    versions.append(version);
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
      {QStringLiteral("versions"), versions},
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
