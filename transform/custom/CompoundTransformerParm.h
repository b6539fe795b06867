// A published parameter of a custom transformer.
#pragma once

#include <platform/orxparameter/orxparameter.h>

#include <QString>

struct CompoundTransformerParm {
  GUIType type;          // null for a parameter of which only name and value are known
  QString defaultValue;  // as stored
};
