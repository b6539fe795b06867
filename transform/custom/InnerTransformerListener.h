// The listener that a network sets on its inner transformers: it knows the published parameters, with the
// values that they have in the instance that asks.
//
// Whoever sets a listener of his own on an inner transformer passes these questions on to this one.
#pragma once

#include <transform/core/TransformerCfgListener.h>

class CompoundTransformerNetwork;

class ORX_EXPORT InnerTransformerListener : public TransformerCfgListener {
 public:
  // Not owned; outlives the listener.
  explicit InnerTransformerListener(const CompoundTransformerNetwork& network) : m_network(network) {}

  // References to published parameters become the values that these have in the instance that asked last,
  // or their defaults when none did.
  QString unpackValue(const TransformerCfg& cfg, const QString& value, bool isEncoded,
                      UnpackLevel level) const override;
  // A value that refers to a published parameter is only known when the mapping file runs.
  bool isRunTimeValue(const TransformerCfg& cfg, const QString& value) const override;
  // A value that refers to a parameter of the same transformer is substituted again.
  bool isDeferredValue(const TransformerCfg& cfg, const QString& value) const override;
  bool acceptsValue(const TransformerCfg& cfg, const QString& parameter, const QString& value) const override;
  QString resolveUserTypedMacro(const TransformerCfg& cfg, const QString& value,
                                UnpackLevel level) const override;
  QString resolveDefaultValue(const TransformerCfg& cfg, const QString& value) const override;
  bool expandMacros(const TransformerCfg& cfg, QString& text) const override;

 private:
  QString resolve(const QString& value) const;
  QString valueOf(const QString& parameter) const;

  const CompoundTransformerNetwork& m_network;
};
