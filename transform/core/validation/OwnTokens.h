// Values that hold the tokens of parameters of the same transformer: what they are when the values of those
// have come in.
#pragma once

#include <transform/core/CarriedReferences.h>

#include <QHash>
#include <QString>
#include <QStringList>

class ParameterSubstitution;
class TransformerCfg;

class OwnTokens {
 public:
  // Not owned. The values are collected.
  OwnTokens(const TransformerCfg& cfg, const ParameterSubstitution& values);

  // Puts the values in the places of their tokens. False when they lead back to themselves or do not come to
  // an end. The one value that may be its own token refers to the parameter of that name around the
  // transformer.
  bool carryOut(QString& text) const;
  // Of the text that a token brings; Unknown for what is no token here.
  carried_references::Spelling spellingOf(const QString& token) const;

 private:
  struct Value {
    QString text;
    carried_references::Spelling spelling = carried_references::Spelling::Unknown;
    bool isCarriedOut = false;
    bool ends = true;
  };

  bool carryOut(QString& text, QStringList& open) const;
  bool leadsAround(const QString& token, const QString& value) const;

  const TransformerCfg& m_cfg;
  mutable QHash<QString, Value> m_values;  // by token; each is carried out once
};
