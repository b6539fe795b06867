// The part of TransformerCfg that takes over instances of earlier versions.
#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/TransformerCfg.h>

namespace {

template <typename Value>
QHash<QString, Value> withRenamedKeys(const QHash<QString, Value>& table,
                                      const QHash<QString, QString>& renamed) {
  QHash<QString, Value> result;
  result.reserve(table.size());
  for (auto at = table.cbegin(); at != table.cend(); ++at) {
    result.insert(renamed.value(at.key(), at.key()), at.value());
  }
  return result;
}

}  // namespace

void TransformerCfg::autoUpgradeTransformer() {}

bool TransformerCfg::autoUpgradeSupported() const {
  return false;
}

QHash<QString, QString> TransformerCfg::renamedInputTags(int fromVersion, TransformerCfg*) const {
  return configured().renamedInputTags.renamedFrom(fromVersion);
}

QHash<QString, QString> TransformerCfg::renamedOutputTags(int fromVersion, TransformerCfg*) const {
  return configured().renamedOutputTags.renamedFrom(fromVersion);
}

bool TransformerCfg::upgradeTransformer(TransformerCfg* older) {
  if (!older || older == this) {
    return older != nullptr;
  }
  const int fromVersion = older->getVersion();
  bool isComplete = true;
  // By value: reactions to a value may add parameters.
  const std::vector<TransformParamCfg> records = older->m_parameters.records();
  for (const TransformParamCfg& record : records) {
    const QString name = configured().renamedParameters.renamed(record.getName(), fromVersion);
    const TransformParamCfg* own = getParameterByMacroName(name);
    const bool isTaken = own && setParameterValue(name, own->settable(record.getValue()), false);
    const bool saysSomething = !record.isUnset() && record.getValue() != record.getDefaultValue();
    isComplete = isComplete && (isTaken || !saysSomething);
  }

  const QHash<QString, QString> inputs = renamedInputTags(fromVersion, older);
  const QHash<QString, QString> outputs = renamedOutputTags(fromVersion, older);
  m_ports.inputFeatureTypes = withRenamedKeys(older->m_ports.inputFeatureTypes, inputs);
  m_ports.inputFilters = withRenamedKeys(older->m_ports.inputFilters, inputs);
  m_ports.outputFeatureTypes = withRenamedKeys(older->m_ports.outputFeatureTypes, outputs);
  m_ports.outputFunctions = withRenamedKeys(older->m_ports.outputFunctions, outputs);
  setInputAttributes(withRenamedKeys(older->getInputAttributes(), inputs));

  m_baseGuid = older->m_baseGuid;
  m_instantiationCounter = older->m_instantiationCounter;
  m_lastParmEditBuild = older->m_lastParmEditBuild;
  m_parameterDirectory = older->m_parameterDirectory ? older->m_parameterDirectory : m_parameterDirectory;
  return isComplete;
}
