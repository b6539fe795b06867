// How severe the findings of each rule count. Rules that are not set keep the severity of their table.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Finding.h>

#include <QHash>
#include <QString>

#include <optional>
#include <vector>

namespace orx {

class ORX_EXPORT RuleSettings {
 public:
  // Takes "NAME=off", "NAME=error", "NAME=warning" or "NAME=hint"; a later setting of a rule stands against
  // an earlier one. False for anything else, and where a rule about what can be written would count less
  // than its table says; `reason` then says why.
  bool set(const QString& setting, QString& reason);

  // What a finding of the rule counts; nothing when the rule is off.
  std::optional<Severity> severity(Rule rule) const;
  // The findings that are left, with their severities.
  std::vector<Finding> apply(std::vector<Finding> findings) const;

 private:
  QHash<int, std::optional<Severity>> m_severities;  // by rule; none: off
};

}  // namespace orx
