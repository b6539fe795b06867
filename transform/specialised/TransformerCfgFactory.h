// Picks the class of a configuration object by the transformer's name and the version of its definition.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <limits>
#include <typeindex>
#include <vector>

class TransformerCfg;

// One row of the table: the class of the transformers of these names whose version lies in the range.
struct TransformerCfgRule {
  struct Versions {
    int first = std::numeric_limits<int>::min();
    int last = std::numeric_limits<int>::max();

    bool hold(int version) const { return version >= first && version <= last; }
  };

  std::vector<QLatin1String> names;
  Versions versions;
  std::type_index type;
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
