#include <transform/core/TransformerCfg.h>
#include <transform/specialised/AttributeExpressionRemoverTransformerCfg.h>
#include <transform/specialised/ChartGeneratorTransformerCfg.h>
#include <transform/specialised/ExpressionEvaluatorCfg.h>
#include <transform/specialised/ParameterFetcherTransformerCfg.h>
#include <transform/specialised/ReportGeneratorTransformerCfg.h>
#include <transform/specialised/TesterTransformerCfg.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/specialised/ValueMapperTransformerCfg.h>
#include <transform/specialised/XMLTemplaterTransformerCfg.h>
#include <transform/specialised/XMLUpdaterTransformerCfg.h>

namespace {

constexpr int kLowest = TransformerCfgRule::kLowestVersion;
constexpr int kHighest = TransformerCfgRule::kHighestVersion;

template <typename Class>
TransformerCfg* make() {
  return new Class;
}

// Of the classes that serve both languages.
template <typename Class>
TransformerCfg* makeXml() {
  return new Class(false);
}

template <typename Class>
TransformerCfg* makeJson() {
  return new Class(true);
}

}  // namespace

const std::vector<TransformerCfgRule>& transformerCfgRules() {
  static const std::vector<TransformerCfgRule> rules = {
      {QLatin1String("BulkAttributeRemover"), kLowest, kHighest,
       QLatin1String("AttributeExpressionRemoverTransformerCfg"),
       make<AttributeExpressionRemoverTransformerCfg>},
      {QLatin1String("AttributeValueMapper"), kLowest, kHighest, QLatin1String("ValueMapperTransformerCfg"),
       make<ValueMapperTransformerCfg>},
      {QLatin1String("ExpressionEvaluator"), kLowest, kHighest, QLatin1String("ExpressionEvaluatorCfg"),
       make<ExpressionEvaluatorCfg>},
      {QLatin1String("Tester"), kLowest, kHighest, QLatin1String("TesterTransformerCfg"),
       make<TesterTransformerCfg>},
      {QLatin1String("ParameterFetcher"), kLowest, kHighest, QLatin1String("ParameterFetcherTransformerCfg"),
       make<ParameterFetcherTransformerCfg>},
      {QLatin1String("XMLTemplater"), kLowest, kHighest, QLatin1String("XMLTemplaterTransformerCfg"),
       makeXml<XMLTemplaterTransformerCfg>},
      {QLatin1String("JSONTemplater"), kLowest, kHighest, QLatin1String("XMLTemplaterTransformerCfg"),
       makeJson<XMLTemplaterTransformerCfg>},
      {QLatin1String("XMLUpdater"), kLowest, kHighest, QLatin1String("XMLUpdaterTransformerCfg"),
       makeXml<XMLUpdaterTransformerCfg>},
      {QLatin1String("JSONUpdater"), kLowest, kHighest, QLatin1String("XMLUpdaterTransformerCfg"),
       makeJson<XMLUpdaterTransformerCfg>},
      {QLatin1String("ChartGenerator"), kLowest, kHighest, QLatin1String("ChartGeneratorTransformerCfg"),
       make<ChartGeneratorTransformerCfg>},
      {QLatin1String("HTMLReportGenerator"), kLowest, kHighest,
       QLatin1String("ReportGeneratorTransformerCfg"), make<ReportGeneratorTransformerCfg>},
  };
  return rules;
}

const TransformerCfgRule* findTransformerCfgRule(const QString& name, int version) {
  return findTransformerCfgRule(transformerCfgRules(), name, version);
}

const TransformerCfgRule* findTransformerCfgRule(const std::vector<TransformerCfgRule>& rules,
                                                 const QString& name, int version) {
  for (const TransformerCfgRule& rule : rules) {
    if (name == rule.name && version >= rule.firstVersion && version <= rule.lastVersion) {
      return &rule;
    }
  }
  return nullptr;
}

TransformerCfg* createTransformerCfg(const QString& name, int version) {
  const TransformerCfgRule* rule = findTransformerCfgRule(name, version);
  return rule ? rule->make() : new TransformerCfg;
}
