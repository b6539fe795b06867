#include <transform/core/ParallelLevels.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/StoredValue.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerCfgListener.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/validation/InnerLevels.h>

namespace {

// Settings that many nested instances pass on to each other; what goes beyond is not judged.
constexpr int kMostLevels = 1000;
constexpr int kLongestLevel = 4096;

// The setting with the instance's values in the places of its parameters.
QString withValues(const TransformerCfg& instance, const QString& setting) {
  return replaceParameterReferences(MFBuffer::withOrdinaryMacros(setting),
                                    [&](const QString& name, QString& replacement) {
                                      replacement = instance.getParameterValue(name);
                                      return instance.hasParameter(name);
                                    });
}

}  // namespace

const QStringList& InnerLevels::levelsOf(CompoundTransformerNetwork& network) {
  if (m_known.contains(&network))
    return m_known[&network];
  const std::vector<CompoundTransformerNetwork*> networks = nestedNetworks(network);
  // Innermost first, so that mostly one round suffices.
  for (bool isChanged = true; isChanged;) {
    isChanged = false;
    for (auto nested = networks.rbegin(); nested != networks.rend(); ++nested) {
      QStringList levels;
      for (const TransformerCfg* cfg : (*nested)->getTransformers()) {
        // Those of other transformers are judged with their values.
        const CompoundTransformerNetwork* inner = networkOf(cfg);
        if (!inner)
          continue;
        for (const QString& setting :
             m_known.value(inner) + QStringList(inner->getParallelSettings().parallelism)) {
          const QString level = withValues(*cfg, setting);
          if (level.contains(QLatin1Char('$')) && level.size() <= kLongestLevel &&
              levels.size() < kMostLevels)
            levels.append(level);
        }
      }
      levels.removeDuplicates();
      isChanged = isChanged || m_known.value(*nested) != levels;
      m_known.insert(*nested, levels);
    }
  }
  return m_known[&network];
}

QString InnerLevels::refuse(const TransformerCfg& instance) {
  CompoundTransformerNetwork* network = networkOf(&instance);
  for (const QString& setting : network ? levelsOf(*network) : QStringList()) {
    QString level = MFBuffer::withOrdinaryMacros(withValues(instance, setting));
    const TransformerCfgListener* listener = instance.listener();
    const bool isKnown =
        !listener || (listener->expandMacros(instance, level) && !listener->isRunTimeValue(instance, level));
    if (isKnown && !isUnsetValue(level) && !parallelLevels().contains(level))
      return TransformResString(orx::messages::kNoParallelLevel,
                                {level, setting, parallelLevels().join(QLatin1String(", "))});
  }
  return QString();
}
