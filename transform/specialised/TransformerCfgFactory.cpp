#include <transform/core/TransformerCfg.h>
#include <transform/specialised/TransformerCfgFactory.h>

#include <limits>
#include <vector>

namespace {

// Walked from the top; the first rule that fits in name and version decides.
struct Rule {
  QLatin1String name;
  int firstVersion = 0;
  int lastVersion = std::numeric_limits<int>::max();
  TransformerCfg* (*make)() = nullptr;
};

const std::vector<Rule>& rules() {
  static const std::vector<Rule> table = {};
  return table;
}

}  // namespace

TransformerCfg* createTransformerCfg(const QString& name, int version) {
  for (const Rule& rule : rules()) {
    if (name == rule.name && version >= rule.firstVersion && version <= rule.lastVersion)
      return rule.make();
  }
  return new TransformerCfg;
}
