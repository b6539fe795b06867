// The names of what stands side by side, in the main document or in a custom transformer, against the names
// under which the insides of the custom transformers among them are written.
#pragma once

#include <translation/graph/JoinedNames.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <functional>
#include <vector>

class TransformerCfg;

namespace orx {
class Findings;
}

class InnerNames {
 public:
  // Why parameters of an instance called `name` cannot be written: what stands as "P" in "O" has the macro
  // "O_P", which may belong to a parameter around the instance. One message per parameter; none where the
  // instance takes that one's value over.
  static QHash<QString, QString> findReplacedParameters(const QString& name, const TransformerCfg& cfg,
                                                        const std::function<bool(const QString&)>& isAround);

  // A transformer that stands here; not owned.
  void add(const QString& name, int line, const TransformerCfg& cfg);
  // A factory of another node here.
  void addFactory(const QString& factory, int line, const QString& node) {
    m_factories.push_back({node, line, factory, nullptr});
  }
  // A name that features flow under here.
  void addFlow(const QString& name) { m_flowNames.append(name); }
  // A parameter that is in force here.
  void addParameter(const QString& name) { m_parameters.append(name); }

  // Reports every name that is needed twice here, or further in as well; `scope` stands before the names of
  // nodes.
  void report(const QString& scope, orx::Findings& diagnostics);

 private:
  struct Member {
    QString node;
    int line;
    QString factory;            // when it is the only one
    const TransformerCfg* cfg;  // else
  };

  void reportFactories(const QString& scope, orx::Findings& diagnostics);
  void reportBeginnings(const QString& scope, orx::Findings& diagnostics);
  void reportTaken(const QString& scope, orx::Findings& diagnostics);
  QStringList factoriesOf(const Member& member);
  QStringList beginningsOf(const Member& member);

  std::vector<Member> m_members;    // transformers
  std::vector<Member> m_factories;  // single ones
  QStringList m_flowNames;
  QStringList m_parameters;
  bool m_hasInsides = false;
  StatementNames m_statements;
  JoinedNames m_insides{JoinedNames::Kind::Factory};
  JoinedNames m_beginnings{JoinedNames::Kind::Beginning};
  JoinedNames m_flows{JoinedNames::Kind::Flow};
  JoinedNames m_macros{JoinedNames::Kind::Macro};
};
