// Refuses what no mapping file can hold: names, values, parameters and custom transformers of a workspace
// whose statements would say something else.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

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
  void checkParameters();
  void checkParameterName(const GlobalParameters::Parameter& parameter);
  void checkPrefixMacros();
  void checkType(const WorkspaceNode& node, bool isCopying);
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
  QSet<const CompoundTransformerNetwork*> m_checked;
  QSet<QPair<int, QPair<QString, QString>>> m_types;  // kind, keyword and name of those that were checked
  QSet<const ConfiguredDefinition*> m_sound;          // whose template needs no second look
};
