// The flows behind copied attributes. What leaves an output goes to several takers, and each link may bring
// some attributes under other names; none of the other takers sees those. Where all links of an output bring
// the same, its own clause copies them; else each kind of copy has a flow of its own, made by a route.
#pragma once

#include <transform/custom/SubDocNetworkObj.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

class CompoundTransformerNetwork;
class FlowNames;

class CopiedFlows {
 public:
  // A link from the flow. Without a clause of its own at the output, as with readers and ports, each copy has
  // a route.
  void add(const QString& flow, bool hasClause, const AttributeCopies& copies);
  // Call when all links are added. In the order of the flows.
  void nameRoutes(FlowNames& names);

  // All below: valid after that. What the output's own clause does; empty for nothing.
  QString ownFunction(const QString& flow) const;
  // The name under which features arrive along a link from the flow.
  QString behind(const QString& flow, const AttributeCopies& copies) const;

  struct Route {
    QString flow;
    QString function;
  };
  // Those that lead on from the flow.
  std::vector<Route> routes(const QString& flow) const;

 private:
  struct Output {
    bool hasClause = false;
    QStringList functions;          // of its links, each once; empty where nothing is copied
    QHash<QString, QString> names;  // of the flows behind them
    bool copiesItself() const { return hasClause && functions.size() == 1; }
  };

  QStringList m_flows;
  QHash<QString, Output> m_outputs;
};

// What is copied along a link that leads to that port of a node. Links from an input and from a loop point of
// its name bring one flow, so that both bring the same.
AttributeCopies copiesAlong(const SubDocNetworkObj::Link& link, const SubDocNetworkObj& target,
                            const QString& port);
// Adds all links of a network; `flowAt` names the flow of a node and its port.
void addCopiedFlows(const CompoundTransformerNetwork& network,
                    const std::function<QString(const SubDocNetworkObj& node, const QString& port)>& flowAt,
                    CopiedFlows& flows);
