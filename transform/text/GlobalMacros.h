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

// Whether the text begins and ends like a reference "$(NAME)".
ORX_EXPORT bool isMacroReference(const QString& text);
// The same between a quote or brace at either end; the two need not match.
ORX_EXPORT bool isWrappedMacroReference(const QString& text);
// The macro that an entry of a list names: by a reference, bare or wrapped, or as a macro that every
// translation knows. Empty when it names none.
ORX_EXPORT QString macroNamedBy(const QString& entry);
