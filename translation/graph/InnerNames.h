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

  void add(const QString& name, int line, const TransformerCfg& cfg);
  // A name that features flow under here.
  void addFlow(const QString& name) { m_flowNames.append(name); }
  // A parameter that is in force here.
  void addParameter(const QString& name) { m_parameters.append(name); }

  // Reports every name that is needed further in as well; `scope` stands before the names of nodes.
  void report(const QString& scope, orx::Findings& diagnostics);

 private:
  QStringList m_names;
  QStringList m_flowNames;
  QStringList m_parameters;
  JoinedNames m_nodes{JoinedNames::Kind::Node};
  JoinedNames m_flows{JoinedNames::Kind::Flow};
  JoinedNames m_macros{JoinedNames::Kind::Macro};
};
