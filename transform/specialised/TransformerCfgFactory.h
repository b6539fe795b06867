// Picks the class of a configuration object by the transformer's name and the version of its definition.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <limits>
#include <vector>

class TransformerCfg;

// One row of the table: the class of the transformers of that name whose version lies in the range.
struct TransformerCfgRule {
  static constexpr int kLowestVersion = std::numeric_limits<int>::min();
  static constexpr int kHighestVersion = std::numeric_limits<int>::max();

  QLatin1String name;
  int firstVersion;
  int lastVersion;
  QLatin1String className;
  TransformerCfg* (*make)();  // a new object
};

// Walked from the first on; the first rule that fits decides.
ORX_EXPORT const std::vector<TransformerCfgRule>& transformerCfgRules();

// The rule that name, letter by letter, and version fall under; null for those that get the plain class.
ORX_EXPORT const TransformerCfgRule* findTransformerCfgRule(const QString& name, int version);
ORX_EXPORT const TransformerCfgRule* findTransformerCfgRule(const std::vector<TransformerCfgRule>& rules,
                                                            const QString& name, int version);

// A new, unconfigured object; owned by the caller. Never fails: what no rule names gets the plain class.
ORX_EXPORT TransformerCfg* createTransformerCfg(const QString& name, int version);
