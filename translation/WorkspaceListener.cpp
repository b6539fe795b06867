#include <platform/qorxcore/qorxcore.h>
#include <transform/core/TransformerCfg.h>
#include <transform/text/MFBuffer.h>
#include <translation/GlobalParameters.h>
#include <translation/MacroReferences.h>
#include <translation/WorkspaceListener.h>

QString WorkspaceListener::unpackValue(const TransformerCfg&, const QString& value, bool isEncoded,
                                       UnpackLevel level) const {
  if (level == UnpackLevel::Stored)
    return value;
  const QString resolved = m_parameters.resolve(value);
  return level == UnpackLevel::Decoded && isEncoded ? QORXWwjdDecode(resolved) : resolved;
}

bool WorkspaceListener::isRunTimeValue(const TransformerCfg&, const QString& value) const {
  // Deferred references are ordinary ones as soon as the value is written.
  return m_parameters.holdsReference(value.contains(QLatin1String("$[")) ? MFBuffer::withOrdinaryMacros(value)
                                                                         : value);
}

bool WorkspaceListener::isDeferredValue(const TransformerCfg& cfg, const QString& value) const {
  MacroReferences references(value);
  while (references.next()) {
    if (cfg.getParameterByMacroName(references.name()))
      return true;
  }
  return false;
}

bool WorkspaceListener::acceptsValue(const TransformerCfg& cfg, const QString&, const QString& value) const {
  return isRunTimeValue(cfg, value);
}

QString WorkspaceListener::resolveUserTypedMacro(const TransformerCfg&, const QString& value,
                                                 UnpackLevel) const {
  return m_parameters.resolve(value);
}

QString WorkspaceListener::resolveDefaultValue(const TransformerCfg&, const QString& value) const {
  return m_parameters.resolve(value);
}

bool WorkspaceListener::expandMacros(const TransformerCfg& cfg, QString& text) const {
  return expandByUnpacking(cfg, text);
}
