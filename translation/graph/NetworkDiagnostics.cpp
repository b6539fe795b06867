#include <transform/custom/ExternalDocNetwork.h>
#include <translation/graph/NetworkDiagnostics.h>

void reportNetworkProblems(const ExternalDocNetwork& network, const QString& file, orx::Findings& findings) {
  for (orx::Finding problem : network.problems()) {
    problem.file = file;
    problem.node =
        problem.node.isEmpty() ? network.getName() : network.getName() + QLatin1Char('/') + problem.node;
    findings.add(std::move(problem));
  }
}
