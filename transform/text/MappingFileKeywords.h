// The beginnings of mapping-file statements that more than one place of the library writes or reads.
#pragma once

#include <QLatin1String>

inline const QLatin1String kMacroStatement("MACRO ");
// Sets a macro that is not set yet.
inline const QLatin1String kDefaultMacroStatement("DEFAULT_MACRO ");
// Only leads features on.
inline const QLatin1String kTeeFactoryStatement("FACTORY_DEF * TeeFactory");
// Runs a transformer as a whole; its version and name follow.
inline const QLatin1String kTransformFactoryStatement("FACTORY_DEF * TransformFact:");

inline const QLatin1String kFactoryStatement("FACTORY_DEF");
inline const QLatin1String kFactoryOptionStatement("FACTORY_OPTION");
inline const QLatin1String kTclStatement("Tcl2");
inline const QLatin1String kReaderTypeStatement("READER_FEATURE_TYPE");
inline const QLatin1String kWriterTypeStatement("WRITER_FEATURE_TYPE");
inline const QLatin1String kIncludeStatement("INCLUDE");
inline const QLatin1String kIncludeCustomStatement("INCLUDE_CUSTOM_TRANSFORMER_VER");
inline const QLatin1String kIncludeBuiltInStatement("INCLUDE_BUILTIN_CUSTOM_TRANSFORMER_VER");

// The clauses of a factory.
inline const QLatin1String kInputKeyword("INPUT");
inline const QLatin1String kOutputKeyword("OUTPUT");
inline const QLatin1String kFeatureTypeKeyword("FEATURE_TYPE");
inline const QLatin1String kFactoryNameKeyword("FACTORY_NAME");

// Blocks of script lines.
inline const QLatin1String kIncludePython("INCLUDE PYTHON");
inline const QLatin1String kIncludeTcl("INCLUDE TCL");
inline const QLatin1String kIncludeEnd("END_INCLUDE");

// What the names of factories that only lead features on end in.
inline const QLatin1String kInputCollectorName(" Input Collector");
inline const QLatin1String kCollectorName(" Collector");
inline const QLatin1String kOutputRenamerName(" Output Renamer/Nuker");
inline const QLatin1String kAttributeCopierName(" Attribute Copier");
