// Every field of a definition, so that two can be compared.
#pragma once

#include <transform/core/TransformerDefinition.h>

#include <tuple>

inline auto definitionFields(const TransformerDefinition& d) {
  return std::tie(d.filePath, d.name, d.version, d.category, d.pluginDialog, d.featureHolding, d.inputTags,
                  d.dynamicInputTags, d.hiddenInputTag, d.hiddenOutputTag, d.outputTags,
                  d.preservesAttributes, d.attributesAdded, d.aliases, d.parameterNames, d.parameterTypes,
                  d.parameterPrompts, d.parameterDefaults, d.parameterLookups, d.multiProcess, d.listActions,
                  d.nukersRequired, d.visible, d.allowed, d.replacedBy, d.parameterMapping, d.tagMapping,
                  d.decorationName, d.decorationLeft, d.canvasProperties, d.tagDescriptions,
                  d.dependencyScripts, d.templateLines, d.descriptionLines, d.tooltipLines, d.changeLog);
}
