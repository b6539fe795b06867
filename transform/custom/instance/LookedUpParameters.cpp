#include <transform/core/ParameterReferences.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/custom/instance/LookedUpParameters.h>
#include <transform/text/MFBuffer.h>

#include <QHash>

namespace {

using NamesByNetwork = QHash<const CompoundTransformerNetwork*, QSet<QString>>;

// The parameters of the network that the value refers to.
void addReferences(const QString& value, const CompoundTransformerNetwork& network, QSet<QString>& names) {
  anyParameterReference(MFBuffer::withOrdinaryMacros(value), [&](const QString& name) {
    if (network.hasParameter(name))
      names.insert(name);
    return false;
  });
}

void addFragments(const TransformerCfg& cfg, const CompoundTransformerNetwork& network,
                  QSet<QString>& names) {
  for (const QString& parameter : cfg.getParameters()) {
    const TransformParamCfg* record = cfg.getParameterByMacroName(parameter);
    if (record && record->choices().hasLookup())
      addReferences(record->getValue(), network, names);
  }
}

// A parameter of a custom transformer further in is looked up there: so are those that its value refers to.
bool addFromWithin(const CompoundTransformerNetwork& network, NamesByNetwork& names) {
  QSet<QString> found = names.value(&network);
  const int before = found.size();
  for (const TransformerCfg* cfg : network.getTransformers()) {
    const CompoundTransformerNetwork* inner = networkOf(cfg);
    if (!inner)
      continue;
    for (const QString& parameter : names.value(inner))
      addReferences(cfg->getParameterValue(parameter), network, found);
  }
  if (found.size() == before)
    return false;
  names.insert(&network, found);
  return true;
}

}  // namespace

LookedUpParameters::LookedUpParameters(CompoundTransformerNetwork& network) {
  const std::vector<CompoundTransformerNetwork*> networks = nestedNetworks(network);
  NamesByNetwork names;
  for (const CompoundTransformerNetwork* nested : networks) {
    for (const TransformerCfg* cfg : nested->getTransformers()) {
      if (!isCustomTransformer(cfg))
        addFragments(*cfg, *nested, names[nested]);
    }
    m_hasFragment = m_hasFragment || !names.value(nested).isEmpty();
  }
  // Innermost first, so that mostly one round suffices.
  for (bool isChanged = true; isChanged;) {
    isChanged = false;
    for (auto nested = networks.rbegin(); nested != networks.rend(); ++nested)
      isChanged = addFromWithin(**nested, names) || isChanged;
  }
  m_names = names.value(&network);
}
