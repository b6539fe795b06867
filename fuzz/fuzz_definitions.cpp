// Definition files and their companions: every definition that is read can be configured, changed, written
// and kept.
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/registry/loading/CompanionFileParser.h>
#include <transform/registry/loading/DefinitionFileParser.h>
#include <transform/registry/loading/DefinitionIndex.h>
#include <translation/generation/MFDeviceBuffer.h>

#include <QBuffer>
#include <QTextStream>

#include <fuzz/FuzzTarget.h>
#include <memory>

namespace {

QByteArray statementsOf(TransformerCfg& transformer) {
  QBuffer device;
  device.open(QIODevice::WriteOnly);
  {
    MFDeviceBuffer buffer(device);
    transformer.instantiate(buffer, QStringLiteral("fuzz"));
    require(!buffer.hasFailed(), "memory takes every byte");
  }
  return device.data();
}

// A value of the definition's own making, which may hold tokens and references of its template.
QString valueFor(const TransformerDefinition& definition) {
  if (!definition.templateLines.isEmpty()) {
    return definition.templateLines.last();
  }
  return definition.descriptionLines.isEmpty() ? definition.name : definition.descriptionLines.first();
}

void tryDefinition(TransformerDefinition definition) {
  // Their interpreter has bounds of its own, and an input would mostly wait for them.
  definition.dependencyScripts.clear();
  TransformerCfg transformer;
  QString complaints;
  QTextStream log(&complaints);
  transformer.configure(definition, nullptr, &log);
  transformer.setBaseGuid(QStringLiteral("stem"));
  transformer.setIdentifier(definition.name);

  const QString value = valueFor(definition);
  QStringList tags;
  transformer.getInputTags(tags);
  for (const QString& tag : qAsConst(tags)) {
    transformer.addInputFeatureType(tag, QStringLiteral("roads"));
    transformer.setInputAttributes(tag, {QStringLiteral("id"), QStringLiteral("list{}.name")});
  }
  tags.clear();
  transformer.getOutputTags(tags);
  if (!tags.isEmpty()) {
    transformer.setOutputFeatureType(tags.first(), QStringLiteral("out"));
  }
  statementsOf(transformer);

  bool changesOthers = false;
  for (const QString& name : qAsConst(definition.parameterNames)) {
    QString message;
    transformer.validateParameter(name, message);
    changesOthers = transformer.setParameterValue(name, value, !changesOthers);
    transformer.getParameterDisplayValue(name, UnpackLevel::Stored);
    transformer.validateParameter(name, message);
  }
  for (const QString& tag : qAsConst(tags)) {
    transformer.getOutputAttributes(tag);
  }
  QStringList tooltip;
  transformer.getTooltipLines(tooltip, true);

  const std::unique_ptr<TransformerCfg> copy(transformer.getCopy());
  copy->setBaseGuid(QStringLiteral("stem"));
  require(copy->serialize() == transformer.serialize(), "a copy is kept as its original is");
  if (transformer.findUnwritableValues().isEmpty()) {
    const QByteArray statements = statementsOf(transformer);
    require(statementsOf(transformer) == statements, "writing again writes the same");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<int>(size));
  QBuffer device(&bytes);
  device.open(QIODevice::ReadOnly);
  DefinitionFileParser definitions;
  require(definitions.parse(device, QStringLiteral("fuzz.ort")) || !definitions.errorString().isEmpty(),
          "a refusal says why");
  // A few of them, so that an input of many small ones does not take long.
  for (std::size_t i = 0; i < definitions.definitions().size() && i < 8; ++i) {
    tryDefinition(DefinitionFileParser::interpret(definitions.definitions()[i]));
  }
  tryDefinition(DefinitionFileParser::interpret(definitions.unfinished()));

  DefinitionIndex index;
  index.read(bytes);
  require(index.definitions().size() == definitions.definitions().size(), "the index finds what is there");
  for (std::size_t i = 0; i < definitions.definitions().size() && i < 8; ++i) {
    const TransformerDefinition whole = DefinitionFileParser::interpret(definitions.definitions()[i]);
    const TransformerDefinition alone =
        DefinitionFileParser::definitionAlone(index.definitions()[i].bytes, whole.filePath);
    require(alone.name == whole.name && alone.name == index.definitions()[i].facts.name &&
                alone.version == whole.version && alone.aliases == index.definitions()[i].facts.aliases &&
                alone.parameterNames == whole.parameterNames && alone.templateLines == whole.templateLines,
            "what the index gives is the whole definition");
  }

  device.seek(0);
  CompanionFileParser companions;
  require(companions.parse(device) || !companions.errorString().isEmpty(), "a refusal says why");
  for (const CompanionEntry& entry : companions.entries()) {
    require(entry.line > 0, "an entry has a line");
  }
  return 0;
}
