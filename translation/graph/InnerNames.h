// The names of transformers that stand side by side, and those that their insides are written under: what
// stands as "V" inside the custom transformer "O" is written as "O_V".
#pragma once

#include <QHash>
#include <QSet>
#include <QString>

#include <functional>
#include <memory>
#include <set>
#include <utility>

class CompoundTransformerNetwork;
class TransformerCfg;

class InnerNames {
 public:
  // Why parameters of an instance called `name` cannot be written: what stands as "P" in "O" has the macro
  // "O_P", which may belong to a parameter around the instance. One message per parameter; none where the
  // instance takes that one's value over.
  static QHash<QString, QString> findReplacedParameters(const QString& name, const TransformerCfg& cfg,
                                                        const std::function<bool(const QString&)>& isAround);

  struct Holder {
    const CompoundTransformerNetwork* network = nullptr;
    int line = 0;
  };

  void add(const QString& name, int line, const TransformerCfg& cfg);
  // The name of the custom transformer with something inside that is written as `name`, and its line; empty
  // when there is none.
  std::pair<QString, int> findHolder(const QString& name);

 private:
  bool holds(const CompoundTransformerNetwork* network, const QString& rest);
  const InnerNames& inside(const CompoundTransformerNetwork* network);

  QSet<QString> m_names;
  QHash<QString, Holder> m_customTransformers;
  std::set<int> m_lengths;                                                          // of their names
  QHash<const CompoundTransformerNetwork*, std::shared_ptr<InnerNames>> m_insides;  // read once
};
