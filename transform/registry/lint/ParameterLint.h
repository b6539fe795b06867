// Checks the parameters of a definition: that their lines belong together, their types and defaults.
#pragma once

#include <transform/registry/LintReport.h>
#include <transform/registry/lint/LintedDefinition.h>

class ParameterLint {
 public:
  // Neither is owned.
  ParameterLint(const LintedDefinition& definition, LintReport& report)
      : m_definition(definition), m_report(report) {}

  // False when lines are missing, so that types and defaults belong to the wrong parameters: nothing else is
  // told of them then.
  bool check();

 private:
  void add(orx::Rule rule, long message, int line, const QStringList& arguments = {});
  bool checkLines();
  void checkType(const LintedParameter& parameter, const GUIType& type);
  void checkGroup(const LintedParameter& parameter);
  void checkDefault(const LintedParameter& parameter);
  void checkDefault(const LintedParameter& parameter, const GUIType& type, const QString& value);

  const LintedDefinition& m_definition;
  LintReport& m_report;
};
