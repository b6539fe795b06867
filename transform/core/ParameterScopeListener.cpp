#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParameterReferences.h>
#include <transform/core/ParameterScopeListener.h>
#include <transform/core/TransformerCfg.h>
#include <transform/text/MFBuffer.h>

QString ParameterScopeListener::unpackValue(const TransformerCfg&, const QString& value, bool isEncoded,
                                            UnpackLevel level) const {
  if (level == UnpackLevel::Stored)
    return value;
  QString resolved = resolve(value);
  return level == UnpackLevel::Decoded && isEncoded ? QORXWwjdDecode(resolved) : resolved;
}

bool ParameterScopeListener::isRunTimeValue(const TransformerCfg&, const QString& value) const {
  // Deferred references are ordinary ones as soon as the value is written.
  const QString written = value.contains(kDeferredOpen) ? MFBuffer::withOrdinaryMacros(value) : value;
  return anyParameterReference(written, [this](const QString& name) { return isScopeParameter(name); });
}

bool ParameterScopeListener::isDeferredValue(const TransformerCfg& cfg, const QString& value) const {
  return anyParameterReference(
      value, [&cfg](const QString& name) { return cfg.getParameterByMacroName(name) != nullptr; });
}

bool ParameterScopeListener::acceptsValue(const TransformerCfg& cfg, const QString&,
                                          const QString& value) const {
  return isRunTimeValue(cfg, value);
}

QString ParameterScopeListener::resolveUserTypedMacro(const TransformerCfg&, const QString& value,
                                                      UnpackLevel) const {
  return resolve(value);
}

QString ParameterScopeListener::resolveDefaultValue(const TransformerCfg&, const QString& value) const {
  return resolve(value);
}

bool ParameterScopeListener::expandMacros(const TransformerCfg& cfg, QString& text) const {
  return expandByUnpacking(cfg, text);
}
