#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>

#include <QUuid>

#include <utility>

namespace {

// The bits of the feature-holding mode that make a transformer keep features back.
constexpr int kHoldsGroups = 2;
constexpr int kHoldsAll = 4;

const QLatin1String kVisualizerTransformer("Inspector");
const QLatin1String kPythonTypePart("PYTHON");

void showNames(const TagList& tags, QHash<QString, QString>* shownNames) {
  if (shownNames) {
    *shownNames = tags.shownNames;
  }
}

}  // namespace

const QString TransformerCfg::kAll = QStringLiteral("ALL");
const QString TransformerCfg::kGroup = QStringLiteral("GROUPED");
const QString TransformerCfg::kNone = QStringLiteral("NONE");
int TransformerCfg::floatDivisionBuild = 15179;

TransformerCfg::TransformerCfg() = default;
TransformerCfg::~TransformerCfg() = default;

// --- copies
// ---------------------------------------------------------------------------------------------------

TransformerCfg* TransformerCfg::getCopy() const {
  auto copy = std::make_unique<TransformerCfg>();
  copy->assign(this);
  return copy.release();
}

void TransformerCfg::assign(const TransformerCfg* other) {
  if (!other || other == this) {
    return;
  }
  m_definition = other->m_definition;
  m_preserved = other->m_preserved;
  m_savedName = other->m_savedName;
  m_requestedAlias = other->m_requestedAlias;
  m_bannerImageName = other->m_bannerImageName;
  m_showInNavigator = other->m_showInNavigator;
  m_dynamicParameterNames = other->m_dynamicParameterNames;
  m_replacedByVersion = other->m_replacedByVersion;
  m_parameterDirectory = other->m_parameterDirectory;
  m_definitionDirectory = other->m_definitionDirectory;
  m_session = other->m_session;
  m_insertState = other->m_insertState;
  m_strictParameterValidation = other->m_strictParameterValidation;
  m_autoUpgraded = other->m_autoUpgraded;
  m_lastParmEditBuild = other->m_lastParmEditBuild;
  m_transformerType = other->m_transformerType;
  deepCopyParameterInfo(other);
  deepCopyAttributeInfo(other);
}

void TransformerCfg::copyValues(const TransformerCfg* other) {
  if (!other || other == this) {
    return;
  }
  for (const TransformParamCfg& theirs : other->m_parameters.records()) {
    const int own = m_parameters.indexOf(theirs.getName());
    if (own >= 0) {
      TransformParamCfg& record = m_parameters.records()[static_cast<std::size_t>(own)];
      record.setValue(record.settable(theirs.getValue()));
    }
  }
  m_lastParmEditBuild = other->m_lastParmEditBuild;
  deepCopyAttributeInfo(other);
}

void TransformerCfg::deepCopyParameterInfo(const TransformerCfg* other) {
  m_parameters = other->m_parameters;
}

void TransformerCfg::deepCopyAttributeInfo(const TransformerCfg* other) {
  m_ports = other->m_ports;
}

const ConfiguredDefinition& TransformerCfg::configured() const {
  static const ConfiguredDefinition unconfigured;
  return m_definition ? *m_definition : unconfigured;
}

ConfiguredDefinition& TransformerCfg::detachDefinition() {
  const auto own = std::make_shared<ConfiguredDefinition>(configured());
  m_definition = own;
  return *own;
}

// --- identity
// -------------------------------------------------------------------------------------------------

QString TransformerCfg::getName() const {
  return configured().fields.name;
}

void TransformerCfg::setName(const QString& name) {
  detachDefinition().fields.name = name;
}

QString TransformerCfg::getSavedName() const {
  return m_savedName.isEmpty() ? getName() : m_savedName;
}

int TransformerCfg::getVersion() const {
  return configured().fields.version;
}

void TransformerCfg::setVersion(int version) {
  detachDefinition().fields.version = version;
}

QString TransformerCfg::getFileName() const {
  return configured().fields.filePath;
}

QString TransformerCfg::getIdentifier() const {
  return getParameterValue(kIdentifierParameter);
}

void TransformerCfg::setIdentifier(const QString& identifier) {
  setParameterValue(kIdentifierParameter, identifier, true);
}

void TransformerCfg::ensureBaseGuid() {
  if (m_baseGuid.isEmpty()) {
    m_baseGuid =
        QUuid::createUuid().toString(QUuid::WithoutBraces).replace(QLatin1Char('-'), QLatin1Char('_'));
  }
}

bool TransformerCfg::dependencyMet() const {
  return configured().dependencyMet;
}

QString TransformerCfg::dependencyMsg() const {
  return configured().dependencyMessage;
}

// --- what the definition says
// ---------------------------------------------------------------------------------

const QStringList& TransformerCfg::getTemplateLines() const {
  return configured().fields.templateLines;
}

QString TransformerCfg::category() const {
  return configured().fields.category;
}

QStringList TransformerCfg::tags() const {
  return configured().categoryTags;
}

QStringList TransformerCfg::aliases() const {
  return configured().fields.aliases;
}

int TransformerCfg::featureHolding() const {
  return configured().fields.featureHolding;
}

bool TransformerCfg::isVisible() const {
  return configured().fields.visible && platformSupported();
}

bool TransformerCfg::isDeprecated() const {
  return !isVisible() && !replacedBy().isEmpty();
}

QString TransformerCfg::replacedBy() const {
  return configured().fields.replacedBy;
}

bool TransformerCfg::nukersRequired() const {
  return configured().fields.nukersRequired;
}

QString TransformerCfg::decorationName() const {
  return configured().fields.decorationName;
}

bool TransformerCfg::isDecorationLeft() const {
  return configured().fields.decorationLeft;
}

QStringList TransformerCfg::canvasProperties() const {
  return configured().fields.canvasProperties;
}

QString TransformerCfg::pluginDialog() const {
  return configured().fields.pluginDialog;
}

QStringList TransformerCfg::getDescriptionLines() const {
  return configured().fields.descriptionLines;
}

void TransformerCfg::setDescriptionLines(const QStringList& lines) {
  detachDefinition().fields.descriptionLines = lines;
}

QStringList TransformerCfg::getChangeLog() const {
  return configured().fields.changeLog;
}

void TransformerCfg::setChangeLog(const QStringList& lines) {
  detachDefinition().fields.changeLog = lines;
}

void TransformerCfg::setTooltipLines(const QStringList& lines) {
  detachDefinition().fields.tooltipLines = lines;
}

QString TransformerCfg::getLocalizedName() const {
  const QString& name = configured().localizedName;
  return name.isEmpty() ? getName() : name;
}

void TransformerCfg::setLocalizedName(const QString& name) {
  detachDefinition().localizedName = name;
}

QString TransformerCfg::getTagDescription(const QString& tag) const {
  return configured().fields.tagDescriptions.value(tag);
}

void TransformerCfg::setTagDescription(const QString& tag, const QString& description) {
  detachDefinition().fields.tagDescriptions.insert(tag, description);
}

// --- ports
// ----------------------------------------------------------------------------------------------------

void TransformerCfg::getInputTags(QStringList& tags, QHash<QString, QString>* shownNames) const {
  tags = configured().inputTags.tags;
  showNames(configured().inputTags, shownNames);
}

QStringList TransformerCfg::getDynamicInputTags(QHash<QString, QString>* shownNames) const {
  showNames(configured().dynamicInputTags, shownNames);
  return configured().dynamicInputTags.tags;
}

QString TransformerCfg::getHiddenInputTag() const {
  return configured().fields.hiddenInputTag;
}

QString TransformerCfg::getHiddenOutputTag() const {
  return configured().fields.hiddenOutputTag;
}

void TransformerCfg::getOutputTags(QStringList& tags, QHash<QString, QString>* shownNames) const {
  tags = configured().outputTags.tags;
  showNames(configured().outputTags, shownNames);
}

QStringList TransformerCfg::allInputTags() const {
  QStringList tags;
  getInputTags(tags);
  tags += getDynamicInputTags();
  const QString hidden = getHiddenInputTag();
  if (!hidden.isEmpty()) {
    tags += hidden;
  }
  if (tags.size() > 1) {
    tags.removeDuplicates();
  }
  return tags;
}

QHash<QString, QString> TransformerCfg::getInputTagAliases() const {
  return configured().inputTagAliases;
}

bool TransformerCfg::lookupInputTagAlias(const QString& tag, QString& alias) const {
  const QHash<QString, QString>& aliases = configured().inputTagAliases;
  const auto at = aliases.constFind(tag);
  if (at == aliases.constEnd()) {
    return false;
  }
  alias = *at;
  return true;
}

void TransformerCfg::addInputFeatureType(const QString& featureType) {
  QStringList tags;
  getInputTags(tags);
  if (!tags.isEmpty()) {
    addInputFeatureType(tags.first(), featureType);
  }
}

void TransformerCfg::addInputFeatureType(const QString& tag, const QString& featureType) {
  m_ports.inputFeatureTypes[tag].append(featureType);
}

QStringList TransformerCfg::getInputFeatureTypes(const QString& tag) const {
  return m_ports.inputFeatureTypes.value(tag);
}

void TransformerCfg::clearInputFeatureTypes() {
  m_ports.inputFeatureTypes.clear();
  m_ports.inputFilters.clear();
}

void TransformerCfg::clearInputFeatureType(const QString& tag) {
  m_ports.inputFeatureTypes.remove(tag);
  m_ports.inputFilters.remove(tag);
}

void TransformerCfg::addInputFilter(const QString& filter) {
  QStringList tags;
  getInputTags(tags);
  if (!tags.isEmpty()) {
    addInputFilter(tags.first(), filter);
  }
}

void TransformerCfg::addInputFilter(const QString& tag, const QString& filter) {
  m_ports.inputFilters[tag].append(filter);
}

void TransformerCfg::setOutputFeatureType(const QString& tag, const QString& featureType) {
  m_ports.outputFeatureTypes.insert(tag, featureType);
}

bool TransformerCfg::getOutputFeatureType(const QString& tag, QString& featureType) const {
  const auto at = m_ports.outputFeatureTypes.constFind(tag);
  if (at == m_ports.outputFeatureTypes.constEnd()) {
    return false;
  }
  featureType = *at;
  return true;
}

void TransformerCfg::clearOutputFeatureTypes() {
  m_ports.outputFeatureTypes.clear();
}

void TransformerCfg::setOutputTagFuncs(const QString& tag, const QStringList& functions) {
  m_ports.outputFunctions.insert(tag, functions);
}

QStringList TransformerCfg::getOutputTagFuncs(const QString& tag) const {
  return m_ports.outputFunctions.value(tag);
}

// --- what subclasses say otherwise
// ----------------------------------------------------------------------------

void TransformerCfg::turnOffMultiProcessing() {}

bool TransformerCfg::platformSupported() const {
  return configured().fields.allowed;
}

void TransformerCfg::tooltipCustomizations(QHash<QString, QString>&, QStringList&, QString&) const {}

bool TransformerCfg::getIsAsynchronous() const {
  return false;
}

bool TransformerCfg::getIsBlocking() const {
  return (featureHolding() & (kHoldsGroups | kHoldsAll)) != 0;
}

bool TransformerCfg::getIsEmbeddable() const {
  return false;
}

TransformerCfg* TransformerCfg::getLinkedVersion() const {
  return nullptr;
}

int TransformerCfg::getInsertMode() const {
  return 0;
}

QString TransformerCfg::getTransformerFile() const {
  return QString();
}

bool TransformerCfg::isDefinitionDeletable() const {
  return false;
}

void TransformerCfg::deleteDefinition() {}

QString TransformerCfg::getGUID() const {
  return QString();
}

bool TransformerCfg::getRequiresVisualizerLauncher() const {
  return getName() == kVisualizerTransformer;
}

bool TransformerCfg::getIsSource() const {
  return m_definition && allInputTags().isEmpty();
}

bool TransformerCfg::getIsDefinitionValid() const {
  return true;
}

bool TransformerCfg::getUsesTransformer(const QString& name, QSet<QString>*) const {
  return name == getName();
}

QString TransformerCfg::getVisualName() const {
  return getLocalizedName();
}

void TransformerCfg::getUsedComponents(QStringList&, QStringList&, QStringList& transformers, bool) const {
  transformers.append(getName());
}

int TransformerCfg::attributeConnectionStatus(const QString&, const QString&, bool, IORXSession*) const {
  return 0;
}

void TransformerCfg::getConnectionParameters(QString&, QString&, QString&) const {}

void TransformerCfg::beginEditParms() {}

void TransformerCfg::endEditParms() {}

IORXSession* TransformerCfg::getOrxSession() const {
  return m_session;
}

bool TransformerCfg::supportsInspect(const QString&) const {
  return false;
}

bool TransformerCfg::supportsOpenFolder(const QString&) const {
  return false;
}

QStringList TransformerCfg::openFolderParameters(const QString&) const {
  return QStringList();
}

QStringList TransformerCfg::inspectParameters(const QString&) const {
  return QStringList();
}

bool TransformerCfg::containsPython() const {
  for (const TransformParamCfg& record : m_parameters.records()) {
    if (record.getType().contains(kPythonTypePart) && !record.isUnset()) {
      return true;
    }
  }
  return false;
}
