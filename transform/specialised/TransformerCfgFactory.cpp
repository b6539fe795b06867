#include <transform/core/TransformerCfg.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/specialised/attributes/AttributeExpressionRemoverTransformerCfg.h>
#include <transform/specialised/attributes/ParameterFetcherTransformerCfg.h>
#include <transform/specialised/attributes/ValueMapperTransformerCfg.h>
#include <transform/specialised/conditions/ExpressionEvaluatorCfg.h>
#include <transform/specialised/conditions/TesterTransformerCfg.h>
#include <transform/specialised/templates/ChartGeneratorTransformerCfg.h>
#include <transform/specialised/templates/ReportGeneratorTransformerCfg.h>
#include <transform/specialised/templates/XMLTemplaterTransformerCfg.h>
#include <transform/specialised/templates/XMLUpdaterTransformerCfg.h>

#include <algorithm>
#include <initializer_list>

namespace {

// `arguments` go to the constructor.
template <typename Class, auto... arguments>
TransformerCfgRule row(std::initializer_list<const char*> names, TransformerCfgRule::Versions versions = {}) {
  TransformerCfgRule rule = {
      {}, versions, typeid(Class), []() -> TransformerCfg* { return new Class(arguments...); }};
  for (const char* name : names) {
    rule.names.emplace_back(name);
  }
  return rule;
}

template <typename Class, auto... arguments>
TransformerCfgRule row(const char* name, TransformerCfgRule::Versions versions = {}) {
  return row<Class, arguments...>(std::initializer_list<const char*>{name}, versions);
}

}  // namespace

const std::vector<TransformerCfgRule>& transformerCfgRules() {
  static const std::vector<TransformerCfgRule> rules = {
      row<AttributeExpressionRemoverTransformerCfg>("BulkAttributeRemover"),
      row<ValueMapperTransformerCfg>("AttributeValueMapper"),
      row<ExpressionEvaluatorCfg>("ExpressionEvaluator"),
      row<TesterTransformerCfg>("Tester"),
      row<ParameterFetcherTransformerCfg>("ParameterFetcher"),
      row<XMLTemplaterTransformerCfg, false>("XMLTemplater"),
      row<XMLTemplaterTransformerCfg, true>("JSONTemplater"),
      row<XMLUpdaterTransformerCfg, false>("XMLUpdater"),
      row<XMLUpdaterTransformerCfg, true>("JSONUpdater"),
      row<ChartGeneratorTransformerCfg>("ChartGenerator"),
      row<ReportGeneratorTransformerCfg>("HTMLReportGenerator"),
  };
  return rules;
}

const TransformerCfgRule* findTransformerCfgRule(const QString& name, int version) {
  return findTransformerCfgRule(transformerCfgRules(), name, version);
}

const TransformerCfgRule* findTransformerCfgRule(const std::vector<TransformerCfgRule>& rules,
                                                 const QString& name, int version) {
  for (const TransformerCfgRule& rule : rules) {
    const auto bears = [&name](QLatin1String candidate) { return name == candidate; };
    if (rule.versions.hold(version) && std::any_of(rule.names.begin(), rule.names.end(), bears)) {
      return &rule;
    }
  }
  return nullptr;
}

TransformerCfg* createTransformerCfg(const QString& name, int version) {
  const TransformerCfgRule* rule = findTransformerCfgRule(name, version);
  return rule ? rule->make() : new TransformerCfg;
}
