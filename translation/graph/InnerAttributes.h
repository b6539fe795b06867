// Passes attributes through the inside of a custom transformer, to every transformer in it, also to those
// that lead to no output.
#pragma once

#include <transform/core/AttributeSet.h>

#include <QHash>
#include <QPair>
#include <QString>

#include <vector>

class CompoundTransformerNetwork;
class SubDocNetworkObj;
class SubDocNetworkObjXformer;
class TransformerCfg;

class InnerAttributes {
 public:
  using ByPort = QHash<QString, AttributeSet>;
  struct Member {
    const SubDocNetworkObjXformer* node;
    TransformerCfg* cfg;  // receives the attributes
  };

  // `members` stand behind whatever feeds them, loops aside. Nothing is owned.
  InnerAttributes(const CompoundTransformerNetwork& network, const std::vector<Member>& members)
      : m_network(network), m_members(members) {}

  // `arriving` is what reaches the inputs beside what these declare.
  void pass(const ByPort& arriving);

 private:
  ByPort collect(const SubDocNetworkObj& node);
  const AttributeSet& leaving(const SubDocNetworkObj& node, const QString& port);
  void takeDeclared();
  // False when nothing else arrives at the loop points than in the round before.
  bool takeReturning();

  const CompoundTransformerNetwork& m_network;
  const std::vector<Member>& m_members;
  QHash<const SubDocNetworkObj*, TransformerCfg*> m_cfgs;
  ByPort m_entering;   // by input
  ByPort m_returning;  // by loop point
  QHash<QPair<const SubDocNetworkObj*, QString>, AttributeSet> m_leaving;
};
