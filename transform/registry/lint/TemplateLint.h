// Checks the template of a definition: one whole statement per line, tokens that exist, output ports and
// omittable parameters in statements of their own, nothing left unused.
#pragma once

#include <transform/registry/LintReport.h>
#include <transform/registry/lint/LintedDefinition.h>

#include <QSet>
#include <QString>

class TemplateLint {
 public:
  // Neither is owned.
  TemplateLint(const LintedDefinition& definition, LintReport& report);

  void check();

 private:
  struct LineTokens {
    QSet<QString> featureTypes;  // output tags
    QSet<QString> functions;     // output tags
    QSet<QString> parameters;
    bool hasInputs = false;
  };

  void add(orx::Rule rule, long message, int line, const QStringList& arguments = {});
  void collectMacros();
  void checkStatement(const DefinitionLine& line);
  LineTokens takeTokens(const DefinitionLine& line);
  bool takePortToken(const QString& token, int line, LineTokens& tokens);
  void checkOutputs(const LineTokens& tokens, int line);
  void checkOmittables(const LineTokens& tokens, const DefinitionLine& line);
  void checkUse();

  const LintedDefinition& m_definition;
  LintReport& m_report;
  QSet<QString> m_tokens;  // of the parameters; a multi-parameter has only those of its members
  QSet<QString> m_omittables;
  QSet<QString> m_macros;  // that statements of the template define
  QSet<QString> m_used;    // parameters
  QSet<QString> m_usedInputs;
  QSet<QString> m_routedOutputs;
  bool m_usesAllInputs = false;
  bool m_usesAllParameters = false;
};
