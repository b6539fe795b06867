// A JSON Schema (draft 2020-12) of a transformer's parameters: an object with a property for each.
//
// Values stand as a person would write them: numbers and whole numbers as such, texts without the word
// encoding, choices by their stored side, attribute lists and list boxes as arrays, a multi-parameter as an
// object of its members, a table as an array of rows. Frames, dividers and messages have no value and no
// property. Where a reference to a parameter or attribute, an expression or a conditional value may take the
// place of a value that is no text, the schema has both.
//
// A parameter has to be given when it is not optional and its definition gives no default.
#pragma once

#include <QJsonObject>
#include <QString>

class GUIType;
class TransformerCfg;
class TransformParamCfg;

class ParameterSchema {
 public:
  // `transformer` is as the registry hands it out and outlives this object.
  explicit ParameterSchema(const TransformerCfg& transformer) : m_transformer(transformer) {}

  QJsonObject schema() const;

 private:
  bool hasValue(const TransformParamCfg& parameter) const;
  bool isRequired(const TransformParamCfg& parameter) const;
  QJsonObject property(const TransformParamCfg& parameter) const;

  const TransformerCfg& m_transformer;
};
