// One definition under check: its fields, with the lines that they stand in.
#pragma once

#include <platform/orxparameter/GUIType.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/registry/loading/DefinitionText.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <vector>

struct DefinitionKeyword;

struct LintedParameter {
  QString name;
  GUIType type;
  QString prompt;
  QString defaultValue;
  int line = 0;         // of its name
  int typeLine = 0;     // of its type, else of its name
  int defaultLine = 0;  // of its default, else of its name
};

class LintedDefinition {
 public:
  struct HeaderLine {
    const DefinitionKeyword* keyword;  // null when the line begins with none
    QString value;
    DefinitionLine line;
  };

  explicit LintedDefinition(DefinitionText text);

  const DefinitionText& text() const { return m_text; }
  const TransformerDefinition& fields() const { return m_fields; }
  const QString& file() const { return m_text.filePath; }
  // Where the definition begins.
  int line() const;
  // Of its TRANSFORMER_NAME line, else where the definition begins.
  int nameLine() const;
  const std::vector<HeaderLine>& header() const { return m_header; }
  const std::vector<LintedParameter>& parameters() const { return m_parameters; }
  // Of the parameters and the members of multi-parameters, and those that the system adds.
  const QSet<QString>& parameterNames() const { return m_parameterNames; }
  // Without the hidden ones.
  const QStringList& inputs() const { return m_inputs; }
  const QStringList& outputs() const { return m_outputs; }
  // With the hidden ones.
  bool isInput(const QString& tag) const { return m_inputSet.contains(tag); }
  bool isOutput(const QString& tag) const { return m_outputSet.contains(tag); }
  // Whether a class of its own serves the transformer, which may use parameters and ports by itself.
  bool hasOwnClass() const { return m_hasOwnClass; }

 private:
  void collectParameters();

  DefinitionText m_text;
  TransformerDefinition m_fields;
  std::vector<HeaderLine> m_header;
  std::vector<LintedParameter> m_parameters;
  QSet<QString> m_parameterNames;
  QStringList m_inputs;
  QStringList m_outputs;
  QSet<QString> m_inputSet;
  QSet<QString> m_outputSet;
  bool m_hasOwnClass;
};
