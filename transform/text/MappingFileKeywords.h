// The beginnings of mapping-file statements that more than one place of the library writes or reads.
#pragma once

#include <QLatin1String>

inline const QLatin1String kMacroStatement("MACRO ");
// Sets a macro that is not set yet.
inline const QLatin1String kDefaultMacroStatement("DEFAULT_MACRO ");
// Only leads features on.
inline const QLatin1String kTeeFactoryStatement("FACTORY_DEF * TeeFactory");
