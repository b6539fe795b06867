#include <transform/custom/ExternalDocNetwork.h>
#include <translation/NetworkDiagnostics.h>

namespace {

Rule ruleOf(NetworkProblem::Kind kind) {
  switch (kind) {
    case NetworkProblem::Kind::Upgraded:
      return Rule::Upgraded;
    case NetworkProblem::Kind::UnmetDependency:
      return Rule::UnmetDependency;
    default:
      return Rule::CustomTransformerFault;
  }
}

}  // namespace

void reportNetworkProblems(const ExternalDocNetwork& network, const QString& file, Diagnostics& diagnostics) {
  for (const NetworkProblem& problem : network.problems()) {
    const QString node =
        problem.node.isEmpty() ? network.getName() : network.getName() + QLatin1Char('/') + problem.node;
    diagnostics.reportIn(file, ruleOf(problem.kind), problem.line, node, problem.text);
  }
}
