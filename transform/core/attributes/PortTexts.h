// The clauses of an instance's inputs and outputs.
#pragma once

#include <QString>
#include <QStringList>

class TransformParamCfg;
class TransformerCfg;
struct PortTables;

namespace port_texts {

// "INPUT NAME FEATURE_TYPE type[ filter]" for each feature type that is connected to the tag.
QStringList inputLines(const TransformerCfg& cfg, const PortTables& ports, const QString& tag);

// What the input tokens stand for: the text of each tag, and of all that were added.
class InputTexts {
 public:
  QString add(const TransformerCfg& cfg, const PortTables& ports, const QString& tag);
  const QString& text() const { return m_text; }

 private:
  QString m_text;
};

// False when the output leaves no trace.
bool isOutputWritten(const TransformerCfg& cfg, const QString& tag, QString& featureType);
QString outputFunctions(const TransformerCfg& cfg, const QString& tag);

}  // namespace port_texts
