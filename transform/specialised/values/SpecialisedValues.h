// What the specialised classes have in common: copies of their own kind, and what can be said about a stored
// value.
#pragma once

#include <transform/core/ExpressionWriter.h>
#include <transform/core/Keywords.h>

#include <QString>

#include <memory>

class TransformerCfg;

// A copy of the class; `arguments` go to its constructor.
template <typename Class, typename... Arguments>
TransformerCfg* copyAs(const Class& cfg, Arguments... arguments) {
  auto copy = std::make_unique<Class>(arguments...);
  copy->assign(&cfg);
  return copy.release();
}

inline bool isUnsetValue(const QString& value) {
  return value.isEmpty() || value == kUnusedValue;
}

inline bool refersToMacros(const QString& value) {
  return value.contains(kMacroOpen) || value.contains(kDeferredOpen);
}

// Whether only the running mapping file, or the feature, tells what it is.
inline bool isOpenValue(const QString& value) {
  return refersToMacros(value) || ExpressionWriter::holdsReference(value) ||
         value.startsWith(kConditionalPrefix);
}
