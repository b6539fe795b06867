// The names under which features flow through one mapping file: each is given out once, so that no two
// streams of features mix.
#pragma once

#include <translation/graph/StatementNames.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

class TransformerCfg;

namespace orx {
class Findings;
}

// The name that is wanted for what leaves an output of a transformer written as `identifier`. The plain names
// of a custom transformer's ports are those that its inside uses, so its outputs are named apart from them.
QString outputFlowName(const TransformerCfg& cfg, const QString& identifier, const QString& tag);

// Reports a name that reserve() found taken.
void reportTakenFlow(const TransformerCfg& cfg, const QString& name, int line, const QString& node,
                     orx::Findings& findings);

class FlowNames {
 public:
  // `wanted` itself, or with "_2", "_3" and so on behind when it is taken.
  QString claim(const QString& wanted);
  // The names that cannot be others: those that the ports of a custom transformer have inside, and those of
  // the features between the statements of another one.
  QStringList fixedNames(const TransformerCfg& cfg, const QString& identifier);
  // Claims them. Those that were taken already are the answer.
  QStringList reserve(const TransformerCfg& cfg, const QString& identifier);

 private:
  StatementNames m_statements;
  QSet<QString> m_reserved;          // identifiers
  QHash<QString, int> m_lastSuffix;  // every name given out, with the last suffix tried behind it
};
