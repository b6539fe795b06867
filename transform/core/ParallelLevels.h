// The levels of parallel processing, as they are stored.
#pragma once

#include <transform/core/Keywords.h>

#include <QStringList>

inline const QStringList& parallelLevels() {
  static const QStringList levels{kNoParallelism, QStringLiteral("MINIMAL"), QStringLiteral("MODERATE"),
                                  QStringLiteral("AGGRESSIVE"), QStringLiteral("EXTREME")};
  return levels;
}
