// The macros that every translation knows without declaring them, with the names shown to people.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <vector>

struct GlobalMacro {
  QLatin1String name;
  QLatin1String displayName;
};

ORX_EXPORT const std::vector<GlobalMacro>& globalMacros();
ORX_EXPORT bool isGlobalMacro(const QString& name);
// The macro of a display name or of its own name; empty when there is none.
ORX_EXPORT QString globalMacroName(const QString& nameOrDisplayName);
