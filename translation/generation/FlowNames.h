// The names under which features flow through one mapping file: each is given out once, so that no two
// streams of features mix.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

class TransformerCfg;

// The name that is wanted for what leaves an output of a transformer written as `identifier`. The plain names
// of a custom transformer's ports are those that its inside uses, so its outputs are named apart from them.
QString outputFlowName(const TransformerCfg& cfg, const QString& identifier, const QString& tag);

class FlowNames {
 public:
  // `wanted` itself, or with "_2", "_3" and so on behind when it is taken.
  QString claim(const QString& wanted);
  // Claims the names that the ports of a custom transformer have inside; they cannot be others. Those that
  // were taken already are the answer. Does nothing for other transformers.
  QStringList reserve(const TransformerCfg& cfg, const QString& identifier);

 private:
  QHash<QString, int> m_lastSuffix;  // every name given out, with the last suffix tried behind it
};
