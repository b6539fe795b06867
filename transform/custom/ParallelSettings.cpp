#include <transform/core/Keywords.h>
#include <transform/custom/ParallelSettings.h>

bool ParallelSettings::isEnabled() const {
  return !groupBy.isEmpty() || (!parallelism.isEmpty() && parallelism != kNoParallelism);
}

QString parallelLevel(const QString& setting) {
  const bool isFlag = setting == QLatin1String("yes") || setting == QLatin1String("no");
  return isFlag ? QString(kNoParallelism) : setting;
}

bool isParameterReference(const QString& text) {
  return text.startsWith(kMacroOpen) && text.endsWith(QLatin1Char(')'));
}
