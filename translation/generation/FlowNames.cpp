#include <transform/core/TransformerCfg.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Findings.h>
#include <transform/text/MessageNumbers.h>
#include <translation/generation/FlowNames.h>

QString outputFlowName(const TransformerCfg& cfg, const QString& identifier, const QString& tag) {
  const QString name = identifier + QLatin1Char('_') + tag;
  return isCustomTransformer(&cfg) ? name + QLatin1String("_OUT") : name;
}

void reportTakenFlow(const TransformerCfg& cfg, const QString& name, int line, const QString& node,
                     orx::Findings& findings) {
  findings.reportAs(
      orx::Rule::TakenName,
      isCustomTransformer(&cfg) ? orx::messages::kTakenName : orx::messages::kStatementNameTaken, line, node,
      {name});
}

QStringList FlowNames::fixedNames(const TransformerCfg& cfg, const QString& identifier) {
  if (!isCustomTransformer(&cfg))
    return m_statements.flows(cfg, identifier);
  QStringList inputs;
  QStringList names;
  cfg.getInputTags(inputs);
  cfg.getOutputTags(names);
  names = inputs + names;
  for (QString& name : names)
    name.prepend(identifier + QLatin1Char('_'));
  return names;
}

QStringList FlowNames::reserve(const TransformerCfg& cfg, const QString& identifier) {
  QStringList taken;
  // Two nodes of one name are told as that.
  const bool isKnown = m_reserved.contains(identifier);
  m_reserved.insert(identifier);
  if (isKnown && !isCustomTransformer(&cfg))
    return taken;
  for (const QString& name : fixedNames(cfg, identifier)) {
    if (claim(name) != name)
      taken.append(name);
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
