// The levels of parallel processing inside custom transformers that refer to parameters of the whole: the
// definition stands once, so only an instance tells what they come to.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

class CompoundTransformerNetwork;
class TransformerCfg;

class InnerLevels {
 public:
  // Why the instance, which stands in the main document, gives something inside it no level; empty when it
  // gives all of them one, and for other transformers.
  QString refuse(const TransformerCfg& instance);

 private:
  using Levels = QHash<const CompoundTransformerNetwork*, QStringList>;

  const QStringList& levelsOf(CompoundTransformerNetwork& network);

  Levels m_known;  // in terms of the parameters of the network
};
