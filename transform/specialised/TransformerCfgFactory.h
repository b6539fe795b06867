// Picks the class of a configuration object by the transformer's name and the version of its definition.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

class TransformerCfg;

// A new, unconfigured object; owned by the caller. Never fails: what no rule names gets the plain class.
ORX_EXPORT TransformerCfg* createTransformerCfg(const QString& name, int version);
