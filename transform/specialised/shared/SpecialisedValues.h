// What can be said about a stored value.
#pragma once

#include <transform/core/Keywords.h>
#include <transform/core/ValueReferences.h>

#include <QString>

inline bool refersToMacros(const QString& value) {
  return value.contains(kMacroOpen) || value.contains(kDeferredOpen);
}

// Whether only the running mapping file, or the feature, tells what it is.
inline bool isOpenValue(const QString& value) {
  return refersToMacros(value) || beginsValueReference(value) || value.startsWith(kConditionalPrefix);
}
