#include <translation/GlobalParameters.h>
#include <translation/graph/WorkspaceListener.h>

bool WorkspaceListener::isScopeParameter(const QString& name) const {
  return m_parameters.find(name) != nullptr;
}

QString WorkspaceListener::resolve(const QString& value) const {
  return m_parameters.resolve(value);
}
