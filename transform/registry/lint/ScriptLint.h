// Checks the scripts inside definitions: dependency checks and Tcl procedures of templates, scripts that are
// defaults of parameters. Python scripts are collected and compiled together at the end.
#pragma once

#include <transform/registry/LintReport.h>
#include <transform/registry/lint/LintedDefinition.h>

#include <QString>
#include <QStringList>

#include <vector>

class ScriptLint {
 public:
  void check(const LintedDefinition& definition, LintReport& report);
  // Compiles what was collected since the last call.
  void checkPython(LintReport& report);

 private:
  struct Place {
    QString file;
    int line;
    QString owner;  // what the script belongs to
  };

  void checkTcl(const QString& script, const Place& place, LintReport& report);
  void checkDefault(const LintedParameter& parameter, const Place& place, LintReport& report);

  QStringList m_python;
  std::vector<Place> m_pythonPlaces;
};
