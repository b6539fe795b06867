#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/instance/InstancePrototype.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

namespace messages = orx::messages;

namespace {

void add(TransformerCfg& cfg, const GUIType& type, const QString& value) {
  TransformParamCfg parameter(type);
  parameter.setDefaultValue(value);
  parameter.setValue(value);
  cfg.addParameter(parameter);
}

void addOwn(TransformerCfg& cfg, QLatin1String name, const char* type, long prompt, const QString& value) {
  if (!cfg.hasParameter(name)) {
    add(cfg, GUIType::fromTransformerTypeString(QLatin1String(type), name, TransformResString(prompt)),
        value);
  }
}

}  // namespace

void configureWithoutBody(TransformerCfg& cfg, const CompoundTransformerNetwork& network) {
  TransformerDefinition definition;
  definition.filePath = network.getFileName();
  definition.name = network.getName();
  definition.version = network.getVersion();
  definition.category = network.getCategory();
  definition.visible = !network.isDeprecated();
  definition.tooltipLines = QStringList(
      definition.filePath.isEmpty()
          ? TransformResString(messages::kEmbeddedTransformer, definition.name)
          : TransformResString(messages::kLinkedTransformer, {definition.name, definition.filePath}));
  cfg.configure(definition);
}

std::shared_ptr<const TransformerCfg> makeInstancePrototype(const CompoundTransformerNetwork& network) {
  const auto prototype = std::make_shared<TransformerCfg>();
  configureWithoutBody(*prototype, network);
  for (const QString& name : network.getParameters()) {
    const CompoundTransformerParm& parameter = *network.getParameterInfo(name);
    // A parameter of which no type is known is a text that may stay empty.
    add(*prototype,
        parameter.type.isNull()
            ? GUIType::fromTransformerTypeString(QStringLiteral("OPTIONAL TEXT"), name, name)
            : parameter.type,
        parameter.defaultValue);
  }
  if (network.blockedLooping()) {
    addOwn(*prototype, kMaxLoopIterationsParameter, "OPTIONAL INTEGER", messages::kPromptMaxIterations,
           QString());
    addOwn(*prototype, kIterationCountParameter, "OPTIONAL NEW_ATTR", messages::kPromptIterationCount,
           QString());
  }
  const ParallelSettings parallel = network.getParallelSettings();
  if (parallel.isEnabled() && !isParameterReference(parallel.groupBy)) {
    addOwn(*prototype, kProcessGroupByParameter, "OPTIONAL ATTR_LIST", messages::kPromptGroupBy,
           parallel.groupBy);
  }
  return prototype;
}
