#include <transform/custom/CompoundTransformerNetwork.h>
#include <translation/generation/CopiedFlows.h>
#include <translation/generation/FlowNames.h>
#include <translation/generation/RouteStatement.h>

void CopiedFlows::add(const QString& flow, bool hasClause, const AttributeCopies& copies) {
  if (!m_outputs.contains(flow))
    m_flows.append(flow);
  Output& output = m_outputs[flow];
  output.hasClause = hasClause;
  const QString function = copyAttributesFunction(copies);
  if (!output.names.contains(function)) {
    output.functions.append(function);
    output.names.insert(function, flow);
  }
}

void CopiedFlows::nameRoutes(FlowNames& names) {
  for (const QString& flow : qAsConst(m_flows)) {
    Output& output = m_outputs[flow];
    if (output.copiesItself())
      continue;
    for (const QString& function : qAsConst(output.functions)) {
      if (!function.isEmpty())
        output.names[function] = names.claim(flow);
    }
  }
}

QString CopiedFlows::ownFunction(const QString& flow) const {
  const auto output = m_outputs.constFind(flow);
  return output != m_outputs.constEnd() && output->copiesItself() ? output->functions.first() : QString();
}

QString CopiedFlows::behind(const QString& flow, const AttributeCopies& copies) const {
  return copies.isEmpty() ? flow : m_outputs.value(flow).names.value(copyAttributesFunction(copies), flow);
}

std::vector<CopiedFlows::Route> CopiedFlows::routes(const QString& flow) const {
  std::vector<Route> routes;
  const Output output = m_outputs.value(flow);
  for (const QString& function : output.functions) {
    if (!function.isEmpty() && !output.copiesItself())
      routes.push_back({output.names.value(function), function});
  }
  return routes;
}

AttributeCopies copiesAlong(const SubDocNetworkObj::Link& link, const SubDocNetworkObj& target,
                            const QString& port) {
  if (link.node->kind() == SubDocNetworkObj::Kind::Transformer)
    return link.node->attributeCopies(link.port, target, port);
  AttributeCopies all;
  for (const SubDocNetworkObj::Link& other : target.feeders().at(port)) {
    if (other.node->kind() == SubDocNetworkObj::Kind::Transformer || other.node->name() != link.node->name())
      continue;
    for (const auto& [to, from] : other.node->attributeCopies(other.port, target, port).sources())
      all.add(from, to);
  }
  return all;
}

void addCopiedFlows(const CompoundTransformerNetwork& network,
                    const std::function<QString(const SubDocNetworkObj& node, const QString& port)>& flowAt,
                    CopiedFlows& flows) {
  for (const SubDocNetworkObj* target : network.nodes()) {
    for (const auto& [port, links] : target->feeders()) {
      for (const SubDocNetworkObj::Link& link : links)
        flows.add(flowAt(*link.node, link.port), link.node->kind() == SubDocNetworkObj::Kind::Transformer,
                  copiesAlong(link, *target, port));
    }
  }
}
