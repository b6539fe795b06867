// What a custom transformer answers as a whole.
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/instance/InstancePrototype.h>
#include <transform/custom/network/AttributeMemo.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

// The walk loads bodies; an answer that only asks has to have them too.
std::vector<CompoundTransformerNetwork*> allNetworks(const CompoundTransformerNetwork& root) {
  return nestedNetworks(const_cast<CompoundTransformerNetwork&>(root));
}

// Asks each inner transformer of each network that is no custom transformer itself.
template <class Predicate>
bool anyTransformer(const CompoundTransformerNetwork& root, const Predicate& predicate) {
  for (const CompoundTransformerNetwork* network : allNetworks(root)) {
    for (const TransformerCfg* cfg : network->getTransformers()) {
      if (!networkOf(cfg) && predicate(*cfg))
        return true;
    }
  }
  return false;
}

QString visitedName(const CompoundTransformerNetwork& network) {
  return network.getName() + QLatin1Char(':') + QString::number(network.getVersion());
}

void appendNew(QStringList& list, QSet<QString>& seen, const QStringList& added) {
  for (const QString& name : added) {
    if (!seen.contains(name)) {
      seen.insert(name);
      list.append(name);
    }
  }
}

}  // namespace

QString CompoundTransformerNetwork::getName() const {
  return m_name;
}

int CompoundTransformerNetwork::getVersion() const {
  return m_version;
}

QString CompoundTransformerNetwork::getCategory() const {
  return m_category;
}

QStringList CompoundTransformerNetwork::getInputs() const {
  return m_inputs;
}

QStringList CompoundTransformerNetwork::getOutputs() const {
  return m_outputs;
}

QStringList CompoundTransformerNetwork::getLoops() const {
  return m_loops;
}

const std::list<TransformerCfg*>& CompoundTransformerNetwork::getTransformers() const {
  return m_transformers;
}

QString CompoundTransformerNetwork::getFileName() const {
  return QString();
}

QStringList CompoundTransformerNetwork::getParameters() const {
  return m_parameterNames;
}

bool CompoundTransformerNetwork::hasParameter(const QString& name) const {
  return m_parameters.contains(name);
}

const CompoundTransformerParm* CompoundTransformerNetwork::getParameterInfo(const QString& name) const {
  const auto at = m_parameters.constFind(name);
  return at == m_parameters.constEnd() ? nullptr : &*at;
}

IncomingAttributePropogationMode CompoundTransformerNetwork::getIncomingAttributePropogationMode() const {
  return kIncomingDeclared;
}

bool CompoundTransformerNetwork::isDeprecated() const {
  return false;
}

QHash<QString, QString> CompoundTransformerNetwork::getProperties() const {
  return m_properties;
}

QStringList CompoundTransformerNetwork::getDescriptionLines() const {
  return QStringList();
}

bool CompoundTransformerNetwork::getIsAsynchronous() const {
  return !anyTransformer(*this, [](const TransformerCfg& cfg) { return !cfg.getIsAsynchronous(); });
}

bool CompoundTransformerNetwork::getIsBlocking() const {
  return anyTransformer(*this, [](const TransformerCfg& cfg) { return cfg.getIsBlocking(); });
}

bool CompoundTransformerNetwork::extractToFile(const QString&) {
  setExtractError(TransformResString(messages::kNoFileOfItsOwn, m_name));
  return false;
}

int CompoundTransformerNetwork::getStartLine() const {
  return 0;
}

bool CompoundTransformerNetwork::getIsEmbeddable() const {
  return false;
}

int CompoundTransformerNetwork::getInsertMode() const {
  return 0;
}

QString CompoundTransformerNetwork::getGUID() const {
  return QString();
}

bool CompoundTransformerNetwork::getIsDefinitionValid() const {
  return true;
}

bool CompoundTransformerNetwork::getUsesTransformer(const QString& name, QSet<QString>* visited) const {
  QSet<QString> ownVisited;
  QSet<QString>& done = visited ? *visited : ownVisited;
  if (done.contains(visitedName(*this)))
    return false;
  for (const CompoundTransformerNetwork* network : allNetworks(*this)) {
    if (network != this && network->getName() == name)
      return true;
    const int before = done.size();
    done.insert(visitedName(*network));
    if (done.size() == before)
      continue;
    for (const TransformerCfg* cfg : network->getTransformers()) {
      if (!networkOf(cfg) && cfg->getUsesTransformer(name, &done))
        return true;
    }
  }
  return false;
}

void CompoundTransformerNetwork::getUsedComponents(QStringList& readers, QStringList& writers,
                                                   QStringList& transformers, bool recursive) const {
  QSet<QString> seenReaders(readers.begin(), readers.end());
  QSet<QString> seenWriters(writers.begin(), writers.end());
  QSet<QString> seenTransformers(transformers.begin(), transformers.end());
  const std::vector<CompoundTransformerNetwork*> networks =
      recursive ? allNetworks(*this)
                : std::vector<CompoundTransformerNetwork*>{const_cast<CompoundTransformerNetwork*>(this)};
  for (const CompoundTransformerNetwork* network : networks) {
    for (const TransformerCfg* cfg : network->getTransformers()) {
      QStringList ownReaders;
      QStringList ownWriters;
      QStringList ownTransformers;
      if (networkOf(cfg))
        ownTransformers.append(cfg->getName());
      else
        cfg->getUsedComponents(ownReaders, ownWriters, ownTransformers, recursive);
      appendNew(readers, seenReaders, ownReaders);
      appendNew(writers, seenWriters, ownWriters);
      appendNew(transformers, seenTransformers, ownTransformers);
    }
  }
}

bool CompoundTransformerNetwork::blockedLooping() const {
  return false;
}

void CompoundTransformerNetwork::setBlockedLooping(bool) {}

void CompoundTransformerNetwork::forceLoad() {}

void CompoundTransformerNetwork::turnOffMultiProcessing() {}

void CompoundTransformerNetwork::saveSubdocPrefixMacro(const QString&, const QString&) {}

QString CompoundTransformerNetwork::subdocPrefixMacro(const QString&) const {
  return QString();
}

bool CompoundTransformerNetwork::containsPythonTransformer() const {
  return anyTransformer(*this, [](const TransformerCfg& cfg) { return cfg.containsPython(); });
}

QString CompoundTransformerNetwork::getPythonVersion() const {
  return QString();
}

ParallelSettings CompoundTransformerNetwork::getParallelSettings() const {
  return ParallelSettings();
}

bool CompoundTransformerNetwork::isDefinitionDeletable() const {
  return false;
}

bool CompoundTransformerNetwork::deleteDefinition() {
  return false;
}

bool CompoundTransformerNetwork::getUseMarkdown() const {
  return false;
}

bool CompoundTransformerNetwork::isBodyLoaded() const {
  return true;
}

QString CompoundTransformerNetwork::getLoopTo() const {
  const QStringList loops = getLoops();
  return loops.isEmpty() ? QString() : loops.first();
}

QString CompoundTransformerNetwork::createExposedParmName(const QString& transformerName,
                                                          const QString& parameterName) {
  return transformerName + QLatin1Char('_') + parameterName;
}

const TransformerCfg& CompoundTransformerNetwork::instancePrototype() const {
  if (!m_prototype)
    m_prototype = makeInstancePrototype(*this);
  return *m_prototype;
}
