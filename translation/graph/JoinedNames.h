// What is written inside custom transformers is named after the nodes that it stands in: what is "V" inside
// the node "O" is written as "O_V". So different places can come to one name.
#pragma once

#include <translation/graph/StatementNames.h>

#include <QHash>
#include <QSet>
#include <QString>

#include <map>
#include <memory>
#include <set>
#include <vector>

class CompoundTransformerNetwork;
class TransformerCfg;

class JoinedNames {
 public:
  // The names of nodes and of the factories that they are made of; what such a name begins with where a
  // transformer takes factories along by that; the names of the features between them, ports of the nodes
  // further in included; of the macros that nodes inside set for their parameters. The first two stand
  // decoded.
  enum class Kind { Factory, Beginning, Flow, Macro };

  struct Holder {
    QString name;  // of the custom transformer's node; empty for none
    int line = 0;
  };
  struct Clash {
    Holder holder;
    QString other;
    QString name;
  };

  explicit JoinedNames(Kind kind) : m_kind(kind) {}

  // A custom transformer that stands here.
  void add(const QString& name, int line, CompoundTransformerNetwork* network);
  // The first of them with something inside, at any depth, that is written as `name`.
  Holder findHolder(const QString& name);
  // Those that have inside, each of them, something that is written under the same name: a name for each
  // pair.
  std::vector<Clash> findClashes();

 private:
  struct Inside {
    std::set<QString> names;
    std::map<QString, CompoundTransformerNetwork*> customTransformers;
    std::set<int> lengths;  // of their names
  };
  struct Place {
    CompoundTransformerNetwork* network;
    QString name;
    int line;
  };
  // Whether a name inside `longer` is `ahead` and a name inside `shorter`.
  struct Meeting {
    CompoundTransformerNetwork* longer;
    CompoundTransformerNetwork* shorter;
    QString ahead;
    QString before;  // what both begin with
  };

  const Inside& inside(CompoundTransformerNetwork* network);
  Inside read(CompoundTransformerNetwork& network);
  static void addFlows(CompoundTransformerNetwork& network, Inside& inside);
  void addCollector(const QString& name, Inside& inside) const;
  void addNames(const TransformerCfg& cfg, const QString& name, Inside& inside);
  QString spelt(const QString& name) const;
  bool holds(CompoundTransformerNetwork* network, const QString& name);
  // The name that both come to; empty when there is none.
  QString meet(const Meeting& start);

  const Kind m_kind;
  StatementNames m_statements;
  std::map<QString, Place> m_places;
  std::set<int> m_lengths;
  QHash<const CompoundTransformerNetwork*, std::shared_ptr<const Inside>> m_insides;  // read once
  QSet<QString> m_apart;  // meetings that came to nothing
};
