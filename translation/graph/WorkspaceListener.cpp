#include <transform/core/ParameterReferences.h>
#include <translation/GlobalParameters.h>
#include <translation/graph/WorkspaceListener.h>

bool WorkspaceListener::isScopeParameter(const QString& name) const {
  return m_parameters.find(name) != nullptr;
}

GUIType WorkspaceListener::typeOf(const QString& parameter) const {
  return m_parameters.typeOf(parameter);
}

bool WorkspaceListener::expandMacros(const TransformerCfg& cfg, QString& text) const {
  if (ParameterScopeListener::expandMacros(cfg, text))
    return true;
  return !anyParameterReference(text, [this](const QString& name) {
    const GlobalParameters::Parameter* parameter = m_parameters.find(name);
    return parameter && !parameter->isComputed();
  });
}

QString WorkspaceListener::resolve(const QString& value) const {
  return m_parameters.resolve(value);
}
