// Plain session: settings in a table.
#pragma once

#include <platform/session/IORXSession.h>

#include <QHash>

class ORX_EXPORT ORXSession : public IORXSession {
 public:
  bool getSetting(const QString& name, QString& value) const override;
  void setSetting(const QString& name, const QString& value) override;

 private:
  QHash<QString, QString> m_settings;
};
