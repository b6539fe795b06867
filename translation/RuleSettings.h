// How severe the findings of each rule count. Rules that are not set keep the severity of the table.
#pragma once

#include <platform/Export.h>
#include <translation/Diagnostics.h>

#include <QHash>
#include <QString>

#include <optional>
#include <vector>

class ORX_EXPORT RuleSettings {
 public:
  // Takes "NAME=off", "NAME=error", "NAME=warning" or "NAME=hint"; a later setting of a rule stands against
  // an earlier one. False for anything else; `reason` then says why.
  bool set(const QString& setting, QString& reason);

  // The findings that are left, with their severities.
  std::vector<Diagnostic> apply(std::vector<Diagnostic> findings) const;

 private:
  QHash<int, std::optional<Severity>> m_severities;  // by rule; none: off
};
