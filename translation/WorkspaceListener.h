// The listener that a workspace sets on its transformers: it knows the workspace's global parameters.
#pragma once

#include <platform/Export.h>
#include <transform/core/TransformerCfgListener.h>

class GlobalParameters;

class ORX_EXPORT WorkspaceListener : public TransformerCfgListener {
 public:
  // `parameters` is not owned and must outlive the listener.
  explicit WorkspaceListener(const GlobalParameters& parameters) : m_parameters(parameters) {}

  QString unpackValue(const TransformerCfg& cfg, const QString& value, bool isEncoded,
                      UnpackLevel level) const override;
  // A value that refers to a parameter of the workspace is only known when the mapping file runs.
  bool isRunTimeValue(const TransformerCfg& cfg, const QString& value) const override;
  // A value that refers to a parameter of the same transformer is substituted again.
  bool isDeferredValue(const TransformerCfg& cfg, const QString& value) const override;
  bool acceptsValue(const TransformerCfg& cfg, const QString& parameter, const QString& value) const override;
  QString resolveUserTypedMacro(const TransformerCfg& cfg, const QString& value,
                                UnpackLevel level) const override;
  QString resolveDefaultValue(const TransformerCfg& cfg, const QString& value) const override;
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override;

 private:
  const GlobalParameters& m_parameters;
};
