// The listener for transformers that stand inside something with parameters of its own: a workspace, or a
// custom transformer. Values may refer to these parameters, which have their values only when the mapping
// file runs.
#pragma once

#include <transform/core/TransformerCfgListener.h>

class ORX_EXPORT ParameterScopeListener : public TransformerCfgListener {
 public:
  // References to the scope's parameters become their values.
  QString unpackValue(const TransformerCfg& cfg, const QString& value, bool isEncoded,
                      UnpackLevel level) const override;
  // A value that refers to a parameter of the scope is only known when the mapping file runs.
  bool isRunTimeValue(const TransformerCfg& cfg, const QString& value) const override;
  // A value that refers to a parameter of the same transformer is substituted again.
  bool isDeferredValue(const TransformerCfg& cfg, const QString& value) const override;
  // Exactly the run-time values.
  bool acceptsValue(const TransformerCfg& cfg, const QString& parameter, const QString& value) const override;
  QString resolveUserTypedMacro(const TransformerCfg& cfg, const QString& value,
                                UnpackLevel level) const override;
  QString resolveDefaultValue(const TransformerCfg& cfg, const QString& value) const override;
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override;

 protected:
  virtual bool isScopeParameter(const QString& name) const = 0;
  // The value with its references to the scope's parameters resolved as far as they are known.
  virtual QString resolve(const QString& value) const = 0;
};
