#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Findings.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/graph/InnerNames.h>

using orx::Rule;

namespace messages = orx::messages;

QHash<QString, QString> InnerNames::findReplacedParameters(
    const QString& name, const TransformerCfg& cfg, const std::function<bool(const QString&)>& isAround) {
  QHash<QString, QString> messages;
  const CompoundTransformerNetwork* network = networkOf(&cfg);
  // A loop hands the values over without macros.
  if (!network || network->blockedLooping())
    return messages;
  for (const QString& parameter : cfg.getParameters()) {
    const QString around = name + QLatin1Char('_') + parameter;
    if (isAround(around) && MFBuffer::withOrdinaryMacros(cfg.getParameterValue(parameter)) !=
                                kMacroOpen + around + QLatin1Char(')'))
      messages.insert(parameter, TransformResString(messages::kReplacesParameter, around));
  }
  return messages;
}

void InnerNames::add(const QString& name, int line, const TransformerCfg& cfg) {
  m_names.append(name);
  CompoundTransformerNetwork* network = networkOf(&cfg);
  if (!network)
    return;
  for (JoinedNames* names : {&m_nodes, &m_flows, &m_macros})
    names->add(name, line, network);
  for (const QString& port : network->getInputs() + network->getOutputs())
    addFlow(name + QLatin1Char('_') + port);
}

void InnerNames::report(const QString& scope, orx::Findings& diagnostics) {
  const auto reportTaken = [&](JoinedNames& inner, const QStringList& names) {
    for (const QString& name : names) {
      const JoinedNames::Holder holder = inner.findHolder(name);
      if (!holder.name.isEmpty())
        diagnostics.report(Rule::TakenName, holder.line, scope + holder.name, {name});
    }
  };
  m_flowNames.removeDuplicates();
  reportTaken(m_nodes, m_names);
  reportTaken(m_flows, m_flowNames);
  for (const QString& parameter : m_parameters) {
    const JoinedNames::Holder holder = m_macros.findHolder(parameter);
    if (!holder.name.isEmpty())
      diagnostics.reportAs(Rule::TakenName, messages::kInnerParameter, holder.line, scope + holder.name,
                           {holder.name, parameter});
  }
  QSet<QString> told;
  for (JoinedNames* names : {&m_nodes, &m_flows}) {
    for (const JoinedNames::Clash& clash : names->findClashes()) {
      const QString pair = clash.holder.name + QLatin1Char('\n') + clash.other;
      if (told.contains(pair))
        continue;
      told.insert(pair);
      diagnostics.reportText(
          Rule::TakenName, clash.holder.line, scope + clash.holder.name,
          TransformResString(messages::kSameInnerName, {clash.holder.name, clash.other, clash.name}));
    }
  }
}
