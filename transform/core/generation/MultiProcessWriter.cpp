#include <transform/core/ConfiguredDefinition.h>
#include <transform/core/Keywords.h>
#include <transform/core/ParallelLevels.h>
#include <transform/core/SingleChoices.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/generation/MultiProcessWriter.h>
#include <transform/text/MFBuffer.h>
#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/TextHelpers.h>

#include <algorithm>

namespace {

// What also turns parallelism off.
const QLatin1String kNo("NO");

}  // namespace

bool mayBeDivided(const TransformerCfg& cfg) {
  const ConfiguredDefinition* definition = cfg.definition();
  return definition && !definition->fields.multiProcess.isEmpty() &&
         (beginsMacroReference(cfg.getParameterValue(kProcessCountParameter)) ||
          multi_process_writer::settingsOf(cfg).isEnabled);
}

namespace multi_process_writer {

Settings settingsOf(const TransformerCfg& cfg) {
  Settings settings;
  const ConfiguredDefinition* definition = cfg.definition();
  if (!definition || definition->fields.multiProcess.isEmpty()) {
    return settings;
  }
  const auto stored = [&cfg](const QString& name, UnpackLevel level) {
    const TransformParamCfg* record = cfg.getParameterByMacroName(name);
    return record ? single_choices::toStored(*record, cfg.getParameterValue(name, level)) : QString();
  };
  settings.groupBy = cfg.getParameterValue(definition->fields.multiProcess);
  settings.parallelism = stored(kProcessCountParameter, UnpackLevel::Stored);
  settings.processSetting = stored(kGroupsOrderedParameter, UnpackLevel::Stored);
  const QString level = stored(kProcessCountParameter, UnpackLevel::Resolved);
  settings.isEnabled = level != kNoParallelism && level != kNo && settings.groupBy != kUnusedGroupBy;
  return settings;
}

bool write(MFBuffer& buffer, const TransformerCfg& cfg, const QString& groupBy, const QString& parallelism,
           const QString& processSetting) {
  const QString identifier = cfg.getIdentifier();
  // A transformer without a template of its own is a custom one, whose definition stands elsewhere.
  const bool hasStatements = !cfg.getTemplateLines().isEmpty();
  QStringList lines;
  lines << kTransformFactoryStatement + QString::number(cfg.getVersion()) + QLatin1Char(':') +
               quotifyStringForMF(cfg.getName())
        << QLatin1String("   FACTORY_NAME ") + quotifyStringForMF(identifier)
        << QStringLiteral("   FACTORY_META_PARAMS")
        << QLatin1String("   TRANSFORMER_NAME:") + quotifyStringForMF(identifier)
        << QLatin1String("   TRANSFORMER_PARAMS:") + cfg.getTransformerParams()
        << QLatin1String(hasStatements ? "   RUN:STATEMENTS" : "   RUN:DEFINITION");
  const auto addSetting = [&lines](const char* key, const QString& value) {
    if (!isUnsetSetting(value)) {
      lines << QLatin1String("   ") + QLatin1String(key) + QLatin1Char(':') + quotifyStringForMF(value);
    }
  };
  addSetting("GROUP_BY", groupBy);
  addSetting("PARALLELISM", parallelism);
  addSetting("PROCESS_SETTING", processSetting);
  lines << cfg.getTransformFactoryInputLines();
  QStringList tags;
  cfg.getOutputTags(tags);
  for (const QString& tag : std::as_const(tags)) {
    QString featureType = identifier + QLatin1Char('_') + tag;
    if (hasStatements && !cfg.getOutputFeatureType(tag, featureType)) {
      continue;
    }
    lines << QLatin1String("   OUTPUT ") + tag + QLatin1String(" FEATURE_TYPE ") +
                 quotifyStringForMF(featureType);
  }
  if (!std::all_of(lines.cbegin(), lines.cend(), &MFBuffer::closesDeferredMacros)) {
    return false;
  }
  buffer.addLines(lines);
  buffer.flush();
  return true;
}

}  // namespace multi_process_writer
