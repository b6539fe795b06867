// Observer of one configuration object: may rewrite values as they are set, is told of every change, and
// answers what only the surrounding workspace knows. Every operation has a harmless default.
#pragma once

#include <platform/Export.h>
#include <transform/core/UnpackLevel.h>

#include <QString>

class TransformerCfg;

class ORX_EXPORT TransformerCfgListener {
 public:
  virtual ~TransformerCfgListener();

  // The value to store in place of `value`. Default: `value`.
  virtual QString rewriteValue(const TransformerCfg& cfg, const QString& parameter, const QString& value);
  virtual void parameterChanged(TransformerCfg& cfg, const QString& parameter, const QString& oldValue,
                                const QString& newValue);
  // A stored value unpacked. Default: as it is at level Stored and Resolved, word-decoded at level Decoded
  // when `isEncoded`.
  virtual QString unpackValue(const TransformerCfg& cfg, const QString& value, bool isEncoded,
                              UnpackLevel level) const;
  // Whether the value is only known when the mapping file runs. Default: no.
  virtual bool isRunTimeValue(const TransformerCfg& cfg, const QString& value) const;
  // Whether the value holds tokens of the same transformer and is substituted again after all others.
  // Default: no.
  virtual bool isDeferredValue(const TransformerCfg& cfg, const QString& value) const;
  // Whether validation takes the value without looking further. Default: no.
  virtual bool acceptsValue(const TransformerCfg& cfg, const QString& parameter, const QString& value) const;
  // References to macros that users type in ("$(..._USERTYPED)") replaced. Default: `value`.
  virtual QString resolveUserTypedMacro(const TransformerCfg& cfg, const QString& value,
                                        UnpackLevel level) const;
  // A parameter's default value, for its default macro line. Default: `value`.
  virtual QString resolveDefaultValue(const TransformerCfg& cfg, const QString& value) const;
  // Puts the values of macros in the places of their references, as the engine does before it reads a
  // statement; references to macros that only the engine knows stay. False when the references do not come to
  // an end. Default: nothing is known.
  virtual bool expandMacros(const TransformerCfg& cfg, QString& text) const;

 protected:
  // expandMacros() for a listener that unpacks every value that it calls a run-time value.
  bool expandByUnpacking(const TransformerCfg& cfg, QString& text) const;
};
