// The session of a caller: settings by name.
#pragma once

#include <platform/Export.h>

#include <QString>

class ORX_EXPORT IORXSession {
 public:
  virtual ~IORXSession();

  // Fills `value` and answers true when the setting exists; leaves `value` alone otherwise.
  virtual bool getSetting(const QString& name, QString& value) const = 0;
  virtual void setSetting(const QString& name, const QString& value) = 0;
};
