// The plain words inside a custom transformer, at any depth, in which its published parameters stand: what an
// instance gives them may make a function call of such a word.
#pragma once

#include <transform/core/ParameterReferences.h>

#include <QHash>
#include <QSet>
#include <QString>

#include <vector>

class CompoundTransformerNetwork;
class TransformerCfg;

class WordsInside {
 public:
  // `networks` are the custom transformer's own, first, and those inside it.
  explicit WordsInside(const std::vector<CompoundTransformerNetwork*>& networks);

  // Whether the parameter helps to bring a call into a word. `expand` puts the values of the instance's
  // parameters in the places of references to them.
  bool bringCall(const QString& parameter, const ExpandReferences& expand) const;

 private:
  struct Words {
    QSet<QString> texts;
    bool areTooMany = false;  // some are left out
  };
  using WordsByNetwork = QHash<const CompoundTransformerNetwork*, Words>;

  static void addValues(const TransformerCfg& cfg, const CompoundTransformerNetwork& network, Words& words);
  // False when there was nothing new.
  static bool addFromWithin(const CompoundTransformerNetwork& network, WordsByNetwork& words);
  static bool add(const QString& text, const CompoundTransformerNetwork& network, Words& words);

  Words m_words;  // of the custom transformer itself
};
