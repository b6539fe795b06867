#include <transform/core/Keywords.h>
#include <transform/custom/ParallelSettings.h>

bool ParallelSettings::isEnabled() const {
  return !groupBy.isEmpty() || (!parallelism.isEmpty() && parallelism != kNoParallelism);
}

bool isParameterReference(const QString& text) {
  return text.startsWith(kMacroOpen) && text.endsWith(QLatin1Char(')'));
}
