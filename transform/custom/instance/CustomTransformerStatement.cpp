#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/custom/instance/CustomTransformerStatement.h>
#include <transform/custom/instance/InstancePrototype.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>

namespace {

// A reference to a parameter of the instance gives its value, the stored side of a choice, as plain text; a
// parameter without a value is no setting.
QString resolve(const QString& setting, const TransformerCfg& instance) {
  if (!isParameterReference(setting))
    return setting;
  const QString name = setting.mid(kMacroOpen.size(), setting.size() - kMacroOpen.size() - 1);
  const TransformParamCfg* record = instance.getParameterByMacroName(name);
  if (!record)
    return setting;
  const QString value = record->choices().toStored(instance.getParameterValue(name));
  if (isUnsetValue(value))
    return QString();
  return record->valueIsEncoded() ? QORXWwjdDecode(value) : value;
}

QString resolveGroupBy(const QString& groupBy, const TransformerCfg& instance) {
  QString resolved = resolve(groupBy, instance);
  if (!isParameterReference(groupBy) && instance.hasParameter(kProcessGroupByParameter))
    resolved = instance.getParameterValue(kProcessGroupByParameter);
  return isUnsetSetting(resolved) ? QString() : resolved;
}

void writeLoopFactory(MFBuffer& buffer, const CompoundTransformerNetwork& network,
                      const TransformerCfg& instance) {
  const QString id = instance.getIdentifier();
  const QString quotedId = quotifyStringForMF(id);
  const QString loopTo = network.getLoopTo();
  QStringList inputs;
  QStringList outputs;
  instance.getInputTags(inputs);
  instance.getOutputTags(outputs);
  QStringList recurring;
  for (const QString& input : qAsConst(inputs)) {
    if (input != loopTo)
      recurring.append(QORXWwjdEncode(input));
  }
  buffer.add(kTransformFactoryStatement + QString::number(network.getVersion()) + QLatin1Char(':') +
             quotifyStringForMF(instance.getVisualName()));
  buffer.add(QLatin1String("   FACTORY_NAME ") + quotedId);
  buffer.add(QStringLiteral("   FACTORY_META_PARAMS"));
  buffer.add(QLatin1String("   TRANSFORMER_NAME:") + quotedId);
  buffer.add(QLatin1String("   TRANSFORMER_PARAMS:") + instance.getTransformerParams());
  buffer.add(QLatin1String("   LOOPBACK_INPUT_TAG:") + quotifyStringForMF(loopTo));
  buffer.add(QLatin1String("   LOOPBACK_OUTPUT_TAG:") + network.getLoopOutput());
  buffer.add(QLatin1String("   RECURRING_INPUT_TAG:") + recurring.join(QLatin1Char(',')));
  const auto setting = [&instance](const QString& parameter) {
    const QString value = instance.getParameterValue(parameter, UnpackLevel::Decoded);
    return value == kUnusedValue ? QString() : value;
  };
  buffer.add(QLatin1String("   MAX_LOOP_ITERATIONS:") + setting(kMaxLoopIterationsParameter));
  buffer.add(QLatin1String("   ITERATION_COUNT_ATTR:") + setting(kIterationCountParameter));
  const auto addPorts = [&](const char* keyword, const QStringList& tags) {
    for (const QString& tag : tags) {
      buffer.add(QLatin1String(keyword) + tag + QLatin1String(" FEATURE_TYPE ") +
                 quotifyStringForMF(id + QLatin1Char('_') + tag));
    }
  };
  addPorts("   INPUT ", inputs);
  addPorts("   OUTPUT ", outputs);
}

}  // namespace

ParallelSettings parallelSettingsOf(const CompoundTransformerNetwork& network,
                                    const TransformerCfg& instance) {
  ParallelSettings settings = network.getParallelSettings();
  settings.groupBy = resolveGroupBy(settings.groupBy, instance);
  settings.parallelism = resolve(settings.parallelism, instance);
  settings.processSetting = resolve(settings.processSetting, instance);
  return settings;
}

bool isRunApart(const CompoundTransformerNetwork& network, const TransformerCfg& instance) {
  return network.blockedLooping() || parallelSettingsOf(network, instance).isEnabled();
}

void writeCustomTransformerStatement(MFBuffer& buffer, const CompoundTransformerNetwork& network,
                                     const TransformerCfg& instance, bool inlineFlag) {
  const ParallelSettings resolved = parallelSettingsOf(network, instance);
  if (resolved.isEnabled()) {
    instance.writeMultiProcessTransformFact(buffer, resolved.groupBy, resolved.parallelism,
                                            resolved.processSetting);
    return;
  }
  if (inlineFlag && network.blockedLooping()) {
    writeLoopFactory(buffer, network, instance);
  } else {
    const bool isBuiltIn = instance.transformerType() == TransformerCfg::kBuiltIn;
    buffer.add((isBuiltIn ? kIncludeBuiltInStatement : kIncludeCustomStatement) + QLatin1Char(' ') +
               network.getName() + QLatin1Char(':') + QString::number(network.getVersion()));
  }
  buffer.flush();
}
