// Refuses what no mapping file can hold: names, values, parameters and custom transformers of a workspace
// whose statements would say something else.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>
#include <translation/validation/InnerLevels.h>

#include <QSet>
#include <QString>

class CompoundTransformerNetwork;
class ConfiguredDefinition;

class WritingChecks {
 public:
  // Neither is owned.
  WritingChecks(const Workspace& workspace, orx::Findings& findings)
      : m_workspace(workspace), m_findings(findings) {}

  void check();

 private:
  void checkHeader();
  void checkParameters();
  void checkParameterName(const GlobalParameters::Parameter& parameter);
  void checkPrefixMacros();
  void checkLookupMacros();
  void checkType(const WorkspaceNode& node);
  QString refuseScript(const GlobalParameters::Parameter& parameter) const;
  void checkChoices(const GlobalParameters::Parameter& parameter);
  void checkParameter(const GlobalParameters::Parameter& parameter, const QString& value);
  void checkAttributes(const WorkspaceNode& node);
  void checkTransformer(const WorkspaceNode& node);
  // False when something was reported.
  bool checkText(const QString& text, const QString& what, int line, const QString& node);
  void checkWord(const QString& text, int line, const QString& node);
  void checkNoReference(const QString& name, int line, const QString& node);

  const Workspace& m_workspace;
  orx::Findings& m_findings;
  InnerLevels m_levels;
  QSet<const CompoundTransformerNetwork*> m_checked;
  QSet<QPair<QString, QString>> m_types;      // keyword and name of the writers that were checked
  QSet<const ConfiguredDefinition*> m_sound;  // whose template needs no second look
};
