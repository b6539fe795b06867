// The clauses of an instance's inputs and outputs.
#pragma once

#include <QString>
#include <QStringList>

#include <algorithm>
#include <vector>

class Substitution;
class TransformParamCfg;
class TransformerCfg;
struct PortTables;

namespace port_texts {

// "INPUT NAME FEATURE_TYPE type[ filter]" for each feature type that is connected to the tag.
QStringList inputLines(const TransformerCfg& cfg, const PortTables& ports, const QString& tag);

}  // namespace port_texts

// What the tokens of inputs and outputs stand for, each in the order in which it is put in.
class PortTexts {
 public:
  void addInputs(const TransformerCfg& cfg, const PortTables& ports);
  void addOutputs(const TransformerCfg& cfg);

  void putInto(Substitution& lines) const;
  template <class Holds>
  bool allOf(Holds holds) const {
    return std::all_of(m_texts.begin(), m_texts.end(), [&](const Text& text) { return holds(text.text); });
  }

 private:
  struct Text {
    QString token;  // of an output that leaves no trace, its tag
    QString text;
    bool isRemoved = false;
  };

  std::vector<Text> m_texts;
};
