// The listener that a network sets on its inner transformers: it knows the published parameters, with the
// values that they have in the instance that asks.
//
// Whoever sets a listener of his own on an inner transformer passes these questions on to this one.
#pragma once

#include <transform/core/CarriedReferences.h>
#include <transform/core/ParameterScopeListener.h>

class CompoundTransformerNetwork;

class InnerTransformerListener : public ParameterScopeListener, public carried_references::ScopeTypes {
 public:
  // Not owned; outlives the listener.
  explicit InnerTransformerListener(const CompoundTransformerNetwork& network) : m_network(network) {}

  GUIType typeOf(const QString& parameter) const override;

 protected:
  bool isScopeParameter(const QString& name) const override;
  bool isScript(const QString& parameter) const;
  // References to published parameters become the values that these have in the instance that asked last, or
  // their defaults when none did.
  QString resolve(const QString& value) const override;

 private:
  QString valueOf(const QString& parameter) const;

  const CompoundTransformerNetwork& m_network;
};
