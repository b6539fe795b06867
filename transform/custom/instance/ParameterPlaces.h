// Where the values of a custom transformer's published parameters come to stand inside, at any depth: what is
// written there once for all instances must carry the values of each.
#pragma once

#include <transform/custom/instance/WordsInside.h>

#include <QChar>
#include <QHash>
#include <QSet>
#include <QString>

class CompoundTransformerNetwork;
class TransformerCfg;

class ParameterPlaces {
 public:
  // Visits the transformers inside, at any depth.
  explicit ParameterPlaces(CompoundTransformerNetwork& network);

  // Whether some fragment anywhere inside looks a value up: messages in it name the instance.
  bool hasFragment() const { return m_hasFragment; }
  // The number of the message that says why a place inside cannot carry the value of the parameter; 0 when
  // all can.
  long refuse(const QString& parameter, const QString& value) const;
  // Whether the parameter helps to bring a function call into a place inside.
  bool bringsCall(const QString& parameter, const ExpandReferences& expand) const {
    return m_words.bringCall(parameter, expand);
  }
  // Whether any place at all can carry the value.
  static bool fitsEverywhere(const QString& value);

 private:
  enum Place : unsigned {
    ChoiceFragment = 1,
    ListFragment = 2,
    Fragment = ChoiceFragment | ListFragment,
    Expression = 4,
    Reencoded = 8,  // read as word-encoded though the parameter is not, or the other way round
    Cell = 16,
  };
  struct Use {
    unsigned places = 0;
    QSet<QChar> separators;  // of the tables
  };
  using Uses = QHash<QString, Use>;  // by parameter
  using UsesByNetwork = QHash<const CompoundTransformerNetwork*, Uses>;

  static bool fits(const Use& use, const QString& value);
  static bool add(const QString& value, bool isReadDecoded, const CompoundTransformerNetwork& network,
                  const Use& use, Uses& uses);
  static void addPart(const TransformerCfg& cfg, const GUIType& type, const QString& part,
                      const CompoundTransformerNetwork& network, Use use, Uses& uses);
  static void addStatements(const TransformerCfg& cfg, const CompoundTransformerNetwork& network, Uses& uses);
  static bool addFromWithin(const CompoundTransformerNetwork& network, UsesByNetwork& uses);

  Uses m_uses;
  bool m_hasFragment = false;
  WordsInside m_words;
};
