#include <platform/qorxcore/qorxcore.h>
#include <transform/core/Keywords.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/NestedNetworks.h>
#include <transform/findings/Findings.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <translation/graph/InnerNames.h>

#include <QSet>

#include <algorithm>

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
  m_members.push_back({name, line, QString(), &cfg});
  CompoundTransformerNetwork* network = networkOf(&cfg);
  if (!network)
    return;
  m_hasInsides = true;
  for (JoinedNames* names : {&m_insides, &m_beginnings, &m_flows, &m_macros})
    names->add(name, line, network);
  for (const QString& port : network->getInputs() + network->getOutputs())
    addFlow(name + QLatin1Char('_') + port);
}

QStringList InnerNames::factoriesOf(const Member& member) {
  return member.cfg ? m_statements.factories(*member.cfg, member.node)
                    : QStringList(QORXWwjdDecode(member.factory));
}

QStringList InnerNames::beginningsOf(const Member& member) {
  return member.cfg ? m_statements.beginnings(*member.cfg, member.node)
                    : StatementNames::beginnings(member.factory);
}

// Those of ordinary transformers differ as the names of the transformers do, unless one of these looks like
// what is made of names.
void InnerNames::reportFactories(const QString& scope, orx::Findings& diagnostics) {
  const bool isAny = std::any_of(m_members.begin(), m_members.end(),
                                 [](const Member& member) { return StatementNames::isUnusual(member.node); });
  QHash<QString, QString> owners;
  const auto report = [&](const Member& member) {
    for (const QString& factory : factoriesOf(member)) {
      const auto owner = owners.constFind(factory);
      if (owner == owners.constEnd()) {
        owners.insert(factory, member.node);
        continue;
      }
      diagnostics.reportAs(Rule::TakenName, messages::kFactoryTaken, member.line, scope + member.node,
                           {factory, owner.value()});
      return;
    }
  };
  for (const Member& member : m_factories)
    report(member);
  for (const Member& member : m_members) {
    if (isAny || isCustomTransformer(member.cfg))
      report(member);
  }
}

void InnerNames::reportBeginnings(const QString& scope, orx::Findings& diagnostics) {
  std::vector<std::pair<const Member*, QStringList>> found;
  for (const std::vector<Member>* members : {&m_members, &m_factories}) {
    for (const Member& member : *members) {
      const QStringList beginnings = beginningsOf(member);
      if (!beginnings.isEmpty())
        found.emplace_back(&member, beginnings);
    }
  }
  if (found.empty())
    return;
  QHash<QString, QString> claims;
  for (const Member& member : m_members) {
    for (const QString& beginning : StatementNames::claimedBeginnings(*member.cfg, member.node))
      claims.insert(beginning, member.node);
  }
  for (const auto& [member, beginnings] : found) {
    for (const QString& beginning : beginnings) {
      if (claims.contains(beginning))
        diagnostics.reportAs(Rule::TakenName, messages::kTakenAlong, member->line, scope + member->node,
                             {beginning, claims.value(beginning)});
    }
  }
}

// Of several names of one node the first is told.
void InnerNames::reportTaken(const QString& scope, orx::Findings& diagnostics) {
  const auto isTaken = [&](JoinedNames& inner, const QStringList& names) {
    return std::any_of(names.begin(), names.end(), [&](const QString& name) {
      const JoinedNames::Holder holder = inner.findHolder(name);
      if (!holder.name.isEmpty())
        diagnostics.report(Rule::TakenName, holder.line, scope + holder.name, {name});
      return !holder.name.isEmpty();
    });
  };
  for (const std::vector<Member>* members : {&m_members, &m_factories}) {
    for (const Member& member : *members) {
      QStringList beginnings = beginningsOf(member);
      QStringList flows;
      if (member.cfg) {
        beginnings += StatementNames::claimedBeginnings(*member.cfg, member.node);
        flows = m_statements.flows(*member.cfg, member.node);
      }
      if (!isTaken(m_insides, factoriesOf(member)) && !isTaken(m_beginnings, beginnings))
        isTaken(m_flows, flows);
    }
  }
  m_flowNames.removeDuplicates();
  for (const QString& flow : qAsConst(m_flowNames))
    isTaken(m_flows, QStringList(flow));
}

void InnerNames::report(const QString& scope, orx::Findings& diagnostics) {
  reportFactories(scope, diagnostics);
  reportBeginnings(scope, diagnostics);
  if (!m_hasInsides)
    return;
  reportTaken(scope, diagnostics);
  for (const QString& parameter : m_parameters) {
    const JoinedNames::Holder holder = m_macros.findHolder(parameter);
    if (!holder.name.isEmpty())
      diagnostics.reportAs(Rule::TakenName, messages::kInnerParameter, holder.line, scope + holder.name,
                           {holder.name, parameter});
  }
  QSet<QString> told;
  for (JoinedNames* names : {&m_insides, &m_beginnings, &m_flows}) {
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
