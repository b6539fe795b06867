// How severe the findings of each rule count. Rules that are not set keep the severity of their table.
#pragma once

#include <platform/Export.h>
#include <translation/Diagnostics.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <optional>
#include <vector>

class ORX_EXPORT RuleSettings {
 public:
  // Takes "NAME=off", "NAME=error", "NAME=warning" or "NAME=hint"; a later setting of a rule stands against
  // an earlier one. `furtherRules` are known beside those of workspaces and mapping files. False for anything
  // else; `reason` then says why.
  bool set(const QString& setting, QString& reason, const QStringList& furtherRules = {});

  // What a finding of the rule counts, `severity` being the table's; nothing when the rule is off.
  std::optional<Severity> severity(const QString& rule, Severity severity) const;
  // The findings that are left, with their severities.
  std::vector<Diagnostic> apply(const std::vector<Diagnostic>& findings) const;

 private:
  QHash<QString, std::optional<Severity>> m_severities;  // by rule; none: off
};
