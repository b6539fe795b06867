#include <transform/custom/ExternalDocNetwork.h>
#include <translation/graph/NetworkDiagnostics.h>

namespace {

Rule ruleOf(NetworkProblem::Kind kind) {
  switch (kind) {
    case NetworkProblem::Kind::UnknownTransformer:
      return Rule::UnknownTransformer;
    case NetworkProblem::Kind::UnknownVersion:
      return Rule::UnknownVersion;
    case NetworkProblem::Kind::UnknownParameter:
      return Rule::UnknownParameter;
    case NetworkProblem::Kind::UnknownInput:
      return Rule::UnknownInput;
    case NetworkProblem::Kind::UnknownOutput:
      return Rule::UnknownOutput;
    case NetworkProblem::Kind::DanglingLink:
      return Rule::DanglingLink;
    case NetworkProblem::Kind::BadPort:
      return Rule::BadPort;
    case NetworkProblem::Kind::DuplicateNumber:
      return Rule::DuplicateNumber;
    case NetworkProblem::Kind::DuplicateName:
      return Rule::DuplicateName;
    case NetworkProblem::Kind::BadPromptLine:
      return Rule::BadPromptLine;
    case NetworkProblem::Kind::UnmetDependency:
      return Rule::UnmetDependency;
    case NetworkProblem::Kind::Upgraded:
      return Rule::Upgraded;
    case NetworkProblem::Kind::Nesting:
      return Rule::Nesting;
    case NetworkProblem::Kind::NoBody:
    case NetworkProblem::Kind::NoLoop:
      break;
  }
  return Rule::CustomTransformerFault;
}

}  // namespace

void reportNetworkProblems(const ExternalDocNetwork& network, const QString& file, Diagnostics& diagnostics) {
  for (const NetworkProblem& problem : network.problems()) {
    const QString node =
        problem.node.isEmpty() ? network.getName() : network.getName() + QLatin1Char('/') + problem.node;
    diagnostics.reportIn(file, ruleOf(problem.kind), problem.line, node, problem.text);
  }
}
