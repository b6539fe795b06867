#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/instance/CustomTransformerStatement.h>

namespace {

const QLatin1String kCategory("CATEGORY");
const QLatin1String kDescription("DESCRIPTION");

QString withoutBraces(QString guid) {
  return guid.remove(QLatin1Char('{')).remove(QLatin1Char('}'));
}

bool isYes(const QString& text) {
  return text.compare(QLatin1String("yes"), Qt::CaseInsensitive) == 0 ||
         text.compare(QLatin1String("true"), Qt::CaseInsensitive) == 0;
}

// What the document tells about the custom transformer beside what it does.
QHash<QString, QString> descriptiveSettings(const QHash<QString, QString>& settings) {
  static const QStringList names{QStringLiteral("CATEGORY"),       QStringLiteral("DESCRIPTION"),
                                 QStringLiteral("HISTORY"),        QStringLiteral("LAST_SAVE_BUILD"),
                                 QStringLiteral("LAST_SAVE_DATE"), QStringLiteral("LEGAL_TERMS_CONDITIONS"),
                                 QStringLiteral("REQUIREMENTS"),   QStringLiteral("REQUIREMENTS_KEYWORD"),
                                 QStringLiteral("TITLE"),          QStringLiteral("USAGE")};
  QHash<QString, QString> properties;
  for (const QString& name : names) {
    const auto at = settings.constFind(name);
    if (at != settings.constEnd())
      properties.insert(name, *at);
  }
  return properties;
}

}  // namespace

ExternalDocNetwork::ExternalDocNetwork() {
  setAnswersWithSets(typeid(ExternalDocNetwork));
}
ExternalDocNetwork::~ExternalDocNetwork() = default;

void ExternalDocNetwork::takeSettings(const QHash<QString, QString>& settings) {
  setProperties(descriptiveSettings(settings));
  m_incomingMode = settings.value(QStringLiteral("ORT_ATTRIBUTE_PROPOGATION_MODE")) == TransformerCfg::kAll
                       ? kIncomingAll
                       : kIncomingDeclared;
  m_useMarkdown = isYes(settings.value(QStringLiteral("USE_MARKDOWN")));
  takeIdentity(settings);
}

void ExternalDocNetwork::takeIdentity(const QHash<QString, QString>& settings) {
  setName(settings.value(QStringLiteral("NAME")));
  const int version = settings.value(QStringLiteral("VERSION")).toInt();
  setVersion(version == 0 ? 1 : version);
  setCategory(settings.value(kCategory));
  m_guid = withoutBraces(settings.value(QStringLiteral("GUID")));
  m_isDeprecated = isYes(settings.value(QStringLiteral("DEPRECATED")));
  m_parallel = ParallelSettings();
  m_parallel.parallelism = parallelLevel(settings.value(QStringLiteral("PARALLELISM"), kNoParallelism));
  m_parallel.groupBy = settings.value(QStringLiteral("PARALLEL_GROUP_BY"));
  m_parallel.processSetting = settings.value(QStringLiteral("PARALLEL_PROCESS_SETTING"));
  m_parallel.countSetting = settings.value(QStringLiteral("PARALLEL_COUNT_SETTING")).toInt();
  m_isBlockedLooping = false;
  m_pythonVersion.clear();
  takeRunSettings(settings);
}

void ExternalDocNetwork::takeRunSettings(const QHash<QString, QString>& settings) {
  const auto looping = settings.constFind(QStringLiteral("BLOCKED_LOOPING"));
  if (looping != settings.constEnd())
    m_isBlockedLooping = isYes(*looping);
  const auto python = settings.constFind(QStringLiteral("PYTHON_COMPATIBILITY"));
  if (python != settings.constEnd())
    m_pythonVersion = *python;
}

void ExternalDocNetwork::addProblem(orx::Rule rule, long message, int line, const QString& node,
                                    const QString& text) {
  orx::Finding problem;
  problem.rule = rule;
  problem.line = line;
  problem.node = node;
  problem.text = text;
  problem.message = message;
  addProblem(problem);
}

bool ExternalDocNetwork::hasTransformerNamed(const QString& identifier) const {
  return m_transformerNames.contains(identifier);
}

IncomingAttributePropogationMode ExternalDocNetwork::getIncomingAttributePropogationMode() const {
  return m_incomingMode;
}

bool ExternalDocNetwork::isDeprecated() const {
  return m_isDeprecated;
}

QStringList ExternalDocNetwork::getDescriptionLines() const {
  const QString description = getProperties().value(kDescription);
  return description.isEmpty() ? QStringList() : description.split(QLatin1Char('\n'));
}

bool ExternalDocNetwork::instantiate(MFBuffer& buffer, TransformerCfg* instance, bool inlineFlag) {
  if (!instance)
    return false;
  writeCustomTransformerStatement(buffer, *this, *instance, inlineFlag);
  return true;
}

QString ExternalDocNetwork::getGUID() const {
  return m_guid;
}

bool ExternalDocNetwork::blockedLooping() const {
  return m_isBlockedLooping;
}

void ExternalDocNetwork::setBlockedLooping(bool blocked) {
  if (m_isBlockedLooping == blocked)
    return;
  m_isBlockedLooping = blocked;
  onNetworkChanged(true);
}

void ExternalDocNetwork::turnOffMultiProcessing() {
  m_parallel.parallelism = kNoParallelism;
  m_parallel.groupBy.clear();
}

void ExternalDocNetwork::saveSubdocPrefixMacro(const QString& prefixMacro, const QString& instance) {
  m_prefixMacros.insert(instance, prefixMacro);
}

QString ExternalDocNetwork::subdocPrefixMacro(const QString& instance) const {
  return m_prefixMacros.value(instance);
}

QString ExternalDocNetwork::getPythonVersion() const {
  return m_pythonVersion;
}

ParallelSettings ExternalDocNetwork::getParallelSettings() const {
  return m_parallel;
}

bool ExternalDocNetwork::getUseMarkdown() const {
  return m_useMarkdown;
}
