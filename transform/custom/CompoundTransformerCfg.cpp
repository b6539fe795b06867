// Everything but the mapping file, which is written in CompoundTransformerCfgGeneration.cpp.
#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/ParameterReferences.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/ScriptParameters.h>
#include <transform/custom/instance/InstancePrototype.h>
#include <transform/findings/Refusal.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>
#include <transform/text/TextPlaces.h>

#include <QSet>

#include <utility>

namespace messages = orx::messages;

namespace {

const QLatin1String kHistoryProperty("HISTORY");

template <class Value>
void renameKey(QHash<QString, Value>& table, const QString& oldName, const QString& newName) {
  const auto at = table.find(oldName);
  if (at == table.end())
    return;
  const Value value = *at;
  table.erase(at);
  table.insert(newName, value);
}

template <class Value>
void keepOnly(QHash<QString, Value>& table, const QStringList& names) {
  const QSet<QString> kept(names.begin(), names.end());
  for (auto at = table.begin(); at != table.end();)
    at = kept.contains(at.key()) ? std::next(at) : table.erase(at);
}

}  // namespace

CompoundTransformerCfg::CompoundTransformerCfg(CompoundTransformerNetwork* network, Body body)
    : m_network(network) {
  if (!m_network)
    return;
  if (body == Body::Now)
    m_network->forceLoad();
  if (m_network->isBodyLoaded())
    TransformerCfg::assign(&m_network->instancePrototype());
  else
    configureWithoutBody(*this, *m_network);
  m_network->addListener(this);
}

CompoundTransformerCfg::~CompoundTransformerCfg() {
  if (!m_network)
    return;
  if (m_network->attributeOwner() == this)
    m_network->setAttributeOwner(nullptr);
  m_network->removeListener(this);
}

TransformerCfg* CompoundTransformerCfg::getCopy() const {
  auto copy = std::make_unique<CompoundTransformerCfg>(m_network);
  copy->assign(this);
  return copy.release();
}

void CompoundTransformerCfg::assign(const TransformerCfg* other) {
  if (!other || other == this)
    return;
  const auto* custom = dynamic_cast<const CompoundTransformerCfg*>(other);
  if (custom && custom->m_network == m_network) {
    // A network that was loaded for this copy alone has told the other already.
    TransformerCfg::assign(other);
  } else {
    copyValues(other);
  }
}

// --- ports -------------------------------------------------------------------------------------------------

void CompoundTransformerCfg::getInputTags(QStringList& tags, QHash<QString, QString>* shownNames) const {
  tags = m_network ? m_network->getInputs() : QStringList();
  if (shownNames)
    shownNames->clear();
}

void CompoundTransformerCfg::getOutputTags(QStringList& tags, QHash<QString, QString>* shownNames) const {
  tags = m_network ? m_network->getOutputs() : QStringList();
  if (shownNames)
    shownNames->clear();
}

void CompoundTransformerCfg::setInputAttributes(const QString& tag, const QStringList& attributes) {
  TransformerCfg::setInputAttributes(tag, attributes);
  if (!m_network)
    return;
  // The other inputs may still hold what another instance put there.
  if (m_network->attributeOwner() != this)
    m_network->setInputAttributes(getInputAttributes());
  else
    m_network->setInputAttributes(tag, attributes);
  m_network->setAttributeOwner(this);
}

void CompoundTransformerCfg::setInputAttributes(const QHash<QString, QStringList>& attributes) {
  TransformerCfg::setInputAttributes(attributes);
  if (!m_network)
    return;
  m_network->setInputAttributes(getInputAttributes());
  m_network->setAttributeOwner(this);
}

void CompoundTransformerCfg::putInputAttributes() const {
  if (m_network->attributeOwner() == this)
    return;
  m_network->getInputs();  // loads what is not loaded yet
  if (m_network->answersWithSets())
    m_network->setArrivingAttributes(arrivingAttributes());
  else
    m_network->setInputAttributes(getInputAttributes());
  m_network->setAttributeOwner(this);
}

void CompoundTransformerCfg::setArrivingAttributes(const QHash<QString, AttributeSet>& attributes) {
  ports().inputAttributes = attributes;
  if (!m_network)
    return;
  m_network->setAttributeOwner(nullptr);
  putInputAttributes();
}

QStringList CompoundTransformerCfg::getOutputAttributes(const QString& tag) const {
  return leavingAttributes(tag).names();
}

AttributeSet CompoundTransformerCfg::leavingAttributes(const QString& tag) const {
  if (!m_network)
    return AttributeSet();
  putInputAttributes();
  QHash<QString, QString> origins;
  AttributeSet leaving = resolvedAttributes(m_network->answersWithSets()
                                                ? m_network->leavingAttributes(tag)
                                                : AttributeSet(m_network->getOutputAttributes(tag, origins)));
  if (m_network->blockedLooping())
    leaving.add(attributesListedBy(kIterationCountParameter));
  return leaving;
}

AttributeSet CompoundTransformerCfg::resolvedAttributes(AttributeSet attributes) const {
  for (const QString& attribute : attributes.withReferences()) {
    bool isUnset = false;
    const QString name = replaceParameterReferences(attribute, [&](const QString& parameter, QString& value) {
      if (!hasParameter(parameter))
        return false;
      value = getParameterValue(parameter, UnpackLevel::Resolved);
      isUnset = isUnset || isUnsetValue(value);
      if (isValueEncoded(parameter))
        value = QORXWwjdDecode(value);
      return true;
    });
    attributes.rename(attribute, isUnset ? QString() : name);
  }
  return attributes;
}

// --- parameters ------------------------------------------------------------------------------------------

bool CompoundTransformerCfg::parmValueAffectsOutputAttrs(const QString& parameter) const {
  if (!m_network)
    return false;
  // Which parameters inside take the value over, directly or by way of nested custom transformers.
  using Followed = QPair<CompoundTransformerNetwork*, QString>;
  std::vector<Followed> open{{m_network, parameter}};
  QSet<Followed> seen{open.front()};
  while (!open.empty()) {
    const auto [network, name] = open.back();
    open.pop_back();
    const QString reference = kMacroOpen + name + QLatin1Char(')');
    for (TransformerCfg* cfg : network->getTransformers()) {
      CompoundTransformerNetwork* inner = networkOf(cfg);
      for (const QString& innerName : cfg->getParameters()) {
        const TransformParamCfg* record = std::as_const(*cfg).getParameterByMacroName(innerName);
        if (!record->getValue().contains(reference))
          continue;
        if (!inner) {
          if (cfg->parmValueAffectsOutputAttrs(innerName))
            return true;
          continue;
        }
        const Followed next(inner, innerName);
        if (!seen.contains(next)) {
          seen.insert(next);
          open.push_back(next);
        }
      }
    }
  }
  return false;
}

bool CompoundTransformerCfg::validateParameter(const QString& parameter, QString& message) const {
  const QString value = getParameterValue(parameter);
  // Whether it may be empty, or is never asked for, is the same question for scripts as for all others.
  const bool isScript = !isUnsetValue(value) && !getParameterPrompt(parameter).isEmpty();
  switch (isScript ? scriptLanguage(getParameterGUIType(parameter)) : ScriptLanguage::None) {
    case ScriptLanguage::Python:
      return canWritePythonParameter(QString(), parameter, value, message);
    case ScriptLanguage::Tcl:
      return canWriteTclParameter(QString(), parameter, value, message);
    case ScriptLanguage::None:
      break;
  }
  return TransformerCfg::validateParameter(parameter, message);
}

QSet<QString> CompoundTransformerCfg::attributeSetterDestinations() const {
  static const QString setter = QStringLiteral("AttributeSetter");
  static const QString destination = QStringLiteral("DEST_ATTR");
  QSet<QString> destinations;
  if (!m_network)
    return destinations;
  for (const CompoundTransformerNetwork* network : nestedNetworks(*m_network)) {
    for (const TransformerCfg* cfg : network->getTransformers()) {
      if (!networkOf(cfg) && cfg->getName() == setter)
        destinations.insert(cfg->getParameterValue(destination));
    }
  }
  return destinations;
}

bool CompoundTransformerCfg::isParmUsedAsAttributeSetterAttribute(const QString& parameter) const {
  return attributeSetterDestinations().contains(kMacroOpen + parameter + QLatin1Char(')'));
}

// --- answers of the network --------------------------------------------------------------------------------

QString CompoundTransformerCfg::getFileName() const {
  return m_network ? m_network->getFileName() : QString();
}

QString CompoundTransformerCfg::getTransformerFile() const {
  return getFileName();
}

QString CompoundTransformerCfg::getGUID() const {
  return m_network ? m_network->getGUID() : QString();
}

QStringList CompoundTransformerCfg::getDescriptionLines() const {
  return m_network ? m_network->getDescriptionLines() : QStringList();
}

QStringList CompoundTransformerCfg::getChangeLog() const {
  const QString history = m_network ? m_network->getProperties().value(kHistoryProperty) : QString();
  return history.isEmpty() ? QStringList() : history.split(QLatin1Char('\n'));
}

int CompoundTransformerCfg::getInsertMode() const {
  return m_network ? m_network->getInsertMode() : 0;
}

bool CompoundTransformerCfg::getIsAsynchronous() const {
  return m_network && m_network->getIsAsynchronous();
}

bool CompoundTransformerCfg::getIsBlocking() const {
  return m_network && m_network->getIsBlocking();
}

bool CompoundTransformerCfg::getIsEmbeddable() const {
  return m_network && m_network->getIsEmbeddable();
}

bool CompoundTransformerCfg::getIsDefinitionValid() const {
  return m_network && m_network->getIsDefinitionValid();
}

bool CompoundTransformerCfg::isDefinitionDeletable() const {
  return m_network && m_network->isDefinitionDeletable();
}

void CompoundTransformerCfg::deleteDefinition() {
  if (m_network)
    m_network->deleteDefinition();
}

namespace {

template <class Predicate>
bool anyInside(CompoundTransformerNetwork* root, const Predicate& predicate) {
  if (!root)
    return false;
  for (const CompoundTransformerNetwork* network : nestedNetworks(*root)) {
    for (const TransformerCfg* cfg : network->getTransformers()) {
      if (!networkOf(cfg) && predicate(*cfg))
        return true;
    }
  }
  return false;
}

}  // namespace

bool CompoundTransformerCfg::getIsSource() const {
  return anyInside(m_network, [](const TransformerCfg& cfg) { return cfg.getIsSource(); });
}

bool CompoundTransformerCfg::getRequiresVisualizerLauncher() const {
  return anyInside(m_network, [](const TransformerCfg& cfg) { return cfg.getRequiresVisualizerLauncher(); });
}

bool CompoundTransformerCfg::getUseMarkdown() const {
  if (!m_network)
    return false;
  for (const CompoundTransformerNetwork* network : nestedNetworks(*m_network)) {
    if (network->getUseMarkdown())
      return true;
  }
  return false;
}

QString CompoundTransformerCfg::pythonVersion() const {
  if (!m_network)
    return QString();
  for (const CompoundTransformerNetwork* network : nestedNetworks(*m_network)) {
    const QString version = network->getPythonVersion();
    if (!version.isEmpty())
      return version;
  }
  return QString();
}

bool CompoundTransformerCfg::containsPython() const {
  return TransformerCfg::containsPython() || (m_network && m_network->containsPythonTransformer());
}

bool CompoundTransformerCfg::getUsesTransformer(const QString& name, QSet<QString>* visited) const {
  return name == getName() || (m_network && m_network->getUsesTransformer(name, visited));
}

void CompoundTransformerCfg::getUsedComponents(QStringList& readers, QStringList& writers,
                                               QStringList& transformers, bool recursive) const {
  transformers.append(getName());
  if (recursive && m_network)
    m_network->getUsedComponents(readers, writers, transformers, true);
}

void CompoundTransformerCfg::turnOffMultiProcessing() {
  if (m_network)
    m_network->turnOffMultiProcessing();
}

QString CompoundTransformerCfg::instantiationFault() const {
  QString fault;
  if (!m_network) {
    orx::refuse(fault, {orx::Rule::Nesting, messages::kNoInstance}, {getName()});
    return fault;
  }
  fault = findNameFault(getName());
  if (fault.isEmpty() && TextPlaces::refuse(TextPlace::MacroName, makePrefixMacro(getVisualName())) != 0)
    fault = findNameFault(getVisualName());
  return fault.isEmpty() ? findNestingFault(*m_network) : fault;
}

// --- listening ---------------------------------------------------------------------------------------------

void CompoundTransformerCfg::networkChanged(bool parametersChanged) {
  networkChanged(parametersChanged, true);
}

void CompoundTransformerCfg::networkChanged(bool parametersChanged, bool portsChanged) {
  if (!m_network)
    return;
  if (portsChanged) {
    const QStringList inputs = m_network->getInputs();
    keepOnly(ports().inputFeatureTypes, inputs);
    keepOnly(ports().inputFilters, inputs);
    QHash<QString, QStringList> attributes = getInputAttributes();
    keepOnly(attributes, inputs);
    TransformerCfg::setInputAttributes(attributes);
    const QStringList outputs = m_network->getOutputs();
    keepOnly(ports().outputFeatureTypes, outputs);
    keepOnly(ports().outputFunctions, outputs);
  }
  if (parametersChanged)
    takeParameters();
}

void CompoundTransformerCfg::takeParameters() {
  QHash<QString, QString> values;
  for (const TransformParamCfg& parameter : std::as_const(*this).parameters().records()) {
    if (parameter.getValue() != parameter.getDefaultValue())
      values.insert(parameter.getName(), parameter.getValue());
  }
  const TransformerCfg& prototype = m_network->instancePrototype();
  deepCopyParameterInfo(&prototype);
  for (TransformParamCfg& parameter : parameters().records()) {
    const auto value = values.constFind(parameter.getName());
    if (value != values.constEnd())
      parameter.setValue(parameter.settable(*value));
  }
  if (getName() != prototype.getName())
    setName(prototype.getName());
  if (getVersion() != prototype.getVersion())
    setVersion(prototype.getVersion());
}

void CompoundTransformerCfg::networkDeleted() {
  m_network = nullptr;
}

void CompoundTransformerCfg::renameIONode(bool isInput, const QString& oldName, const QString& newName) {
  if (!isInput) {
    renameKey(ports().outputFeatureTypes, oldName, newName);
    renameKey(ports().outputFunctions, oldName, newName);
    return;
  }
  renameKey(ports().inputFeatureTypes, oldName, newName);
  renameKey(ports().inputFilters, oldName, newName);
  QHash<QString, QStringList> attributes = getInputAttributes();
  renameKey(attributes, oldName, newName);
  TransformerCfg::setInputAttributes(attributes);
}
