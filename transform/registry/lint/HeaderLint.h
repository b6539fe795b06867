// Checks the header of a definition: keywords and their values, ports, attributes, texts.
#pragma once

#include <transform/registry/LintReport.h>
#include <transform/registry/lint/LintedDefinition.h>

class HeaderLint {
 public:
  // Neither is owned.
  HeaderLint(const LintedDefinition& definition, LintReport& report)
      : m_definition(definition), m_report(report) {}

  void check();

 private:
  void add(orx::Rule rule, long message, int line, const QStringList& arguments = {});
  void checkValue(const LintedDefinition::HeaderLine& line);
  void checkReferences(const LintedDefinition::HeaderLine& line);
  void checkPreserved(const QString& token, int line);
  void checkAdded(const QString& token, int line);
  void checkListAction(const QString& action, int line);
  void checkParameterMapping(const QString& token, int line);
  void checkTagMapping(const QString& token, int line);
  void checkMappedVersion(const QString& token, int line);
  void checkInput(const QString& tag, int line);
  void checkOutput(const QString& tag, int line);
  void checkParametersOf(const QString& text, int line);
  void checkTexts();

  const LintedDefinition& m_definition;
  LintReport& m_report;
};
