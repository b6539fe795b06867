#include <platform/session/ORXSession.h>

IORXSession::~IORXSession() = default;

bool ORXSession::getSetting(const QString& name, QString& value) const {
  const auto found = m_settings.constFind(name);
  if (found == m_settings.constEnd()) {
    return false;
  }
  value = found.value();
  return true;
}

void ORXSession::setSetting(const QString& name, const QString& value) {
  m_settings.insert(name, value);
}
