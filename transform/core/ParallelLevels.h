// The levels of parallel processing, as they are stored.
#pragma once

#include <platform/Export.h>
#include <transform/core/Keywords.h>

#include <QStringList>

class TransformerCfg;

// Whether the work of an ordinary transformer is divided among processes, as far as that is known before the
// mapping file runs.
ORX_EXPORT bool mayBeDivided(const TransformerCfg& cfg);

inline const QStringList& parallelLevels() {
  static const QStringList levels{kNoParallelism, QStringLiteral("MINIMAL"), QStringLiteral("MODERATE"),
                                  QStringLiteral("AGGRESSIVE"), QStringLiteral("EXTREME")};
  return levels;
}
