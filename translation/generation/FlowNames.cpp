#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <translation/generation/FlowNames.h>

QString outputFlowName(const TransformerCfg& cfg, const QString& identifier, const QString& tag) {
  const QString name = identifier + QLatin1Char('_') + tag;
  return isCustomTransformer(&cfg) ? name + QLatin1String("_OUT") : name;
}

QStringList FlowNames::reserve(const TransformerCfg& cfg, const QString& identifier) {
  QStringList taken;
  if (!isCustomTransformer(&cfg))
    return taken;
  QStringList inputs;
  QStringList outputs;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(outputs);
  for (const QString& tag : inputs + outputs) {
    const QString wanted = identifier + QLatin1Char('_') + tag;
    if (claim(wanted) != wanted)
      taken.append(wanted);
  }
  return taken;
}

QString FlowNames::claim(const QString& wanted) {
  auto taken = m_lastSuffix.find(wanted);
  if (taken == m_lastSuffix.end()) {
    m_lastSuffix.insert(wanted, 1);
    return wanted;
  }
  int suffix = taken.value();
  QString name;
  do {
    name = wanted + QLatin1Char('_') + QString::number(++suffix);
  } while (m_lastSuffix.contains(name));
  taken.value() = suffix;
  m_lastSuffix.insert(name, 1);
  return name;
}
