// How the instances of a custom transformer may run in several processes.
#pragma once

#include <QString>

struct ParallelSettings {
  QString parallelism;     // NO_PARALLELISM, a level, or a reference to a parameter of the instance
  QString groupBy;         // attributes, or a reference to a parameter of the instance
  QString processSetting;  // passed on to the transform factory
  int countSetting = 0;    // carried

  // Whether the definition knows of parallel running at all.
  bool isEnabled() const;
};

// The level that a setting gives: "yes" and "no" are none.
QString parallelLevel(const QString& setting);

// "$(" NAME ")" as a whole.
bool isParameterReference(const QString& text);
