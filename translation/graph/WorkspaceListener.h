// The listener that a workspace sets on its transformers: it knows the workspace's global parameters.
#pragma once

#include <transform/core/CarriedReferences.h>
#include <transform/core/ParameterScopeListener.h>

class GlobalParameters;

class WorkspaceListener : public ParameterScopeListener, public carried_references::ScopeTypes {
 public:
  // `parameters` is not owned and must outlive the listener.
  explicit WorkspaceListener(const GlobalParameters& parameters) : m_parameters(parameters) {}

  GUIType typeOf(const QString& parameter) const override;
  // What a script gives is not known before it has run.
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override;

 protected:
  bool isScopeParameter(const QString& name) const override;
  QString resolve(const QString& value) const override;

 private:
  const GlobalParameters& m_parameters;
};
