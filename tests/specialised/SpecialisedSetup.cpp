#include "SpecialisedSetup.h"

#include <platform/session/ORXSession.h>
#include <tests/support/TextBuffer.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/text/MacroText.h>

#include <gtest/gtest.h>

std::unique_ptr<TransformerCfg> makeSpecialised(const char* name, int version,
                                                const std::vector<SpecialisedParameter>& parameters) {
  TransformerDefinition definition;
  definition.name = QString::fromLatin1(name);
  definition.version = version;
  definition.inputTags = QStringList("INPUT");
  definition.outputTags = QStringList("OUTPUT");
  definition.preservesAttributes = QStringList("<ALL>");
  for (const SpecialisedParameter& parameter : parameters) {
    definition.parameterNames << parameter.name;
    definition.parameterTypes << parameter.type;
    definition.parameterPrompts << parameter.prompt;
    definition.parameterDefaults << QString();
    definition.templateLines << QStringLiteral("%1 $(%1)").arg(QLatin1String(parameter.name));
  }
  std::unique_ptr<TransformerCfg> cfg(createTransformerCfg(definition.name, version));
  cfg->configure(definition);
  cfg->setInputAttributes(QStringLiteral("INPUT"), {"id", "name"});
  return cfg;
}

std::unique_ptr<TransformerCfg> makeShipped(const char* name, int version) {
  static ORXSession session;
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  if (registry.transformerNames().isEmpty()) {
    registry.loadTransformers(&session);
  }
  std::unique_ptr<TransformerCfg> cfg(registry.getTransformer(QString::fromLatin1(name), version));
  EXPECT_TRUE(cfg) << name << " " << version;
  return cfg;
}

QString storedForm(const TransformerCfg& cfg, const QString& parameter, const QString& text) {
  const TransformParamCfg* record = cfg.getParameterByMacroName(parameter);
  const auto stored = [](const GUIType& type, const QString& part) {
    const bool isAsItStands = part == "\"\"" || part == "<Unused>" || part.startsWith('&');
    return part.startsWith('`')                     ? part.mid(1)
           : type.valueIsEncoded() && !isAsItStands ? encodeAroundReferences(part)
                                                    : part;
  };
  if (!record || text.startsWith("ORX_") || !record->isTable()) {
    return record && !text.startsWith("ORX_") ? stored(*record, text) : text;
  }
  QStringList cells = text.split(';');
  const std::vector<GUIType>& columns = record->members().members();
  for (int i = 0; i < cells.size(); ++i) {
    cells[i] = stored(columns[static_cast<std::size_t>(i) % columns.size()], cells[i]);
  }
  return cells.join(';');
}

QString applySettings(TransformerCfg& cfg, const char* settings) {
  QString parameter;
  for (const QString& setting : QString::fromUtf8(settings).split(" | ")) {
    parameter = setting.section('=', 0, 0);
    EXPECT_TRUE(cfg.setParameterValue(parameter, storedForm(cfg, parameter, setting.section('=', 1)), false));
  }
  return parameter;
}

std::unique_ptr<TransformerCfg> makeShippedWith(const char* name, const char* settings, QString* last) {
  auto cfg = makeShipped(name);
  QStringList inputs;
  cfg->getInputTags(inputs);
  cfg->setInputAttributes(inputs.value(0), {"a", "b", "id", "name"});
  const QString parameter = applySettings(*cfg, settings);
  if (last) {
    *last = parameter;
  }
  return cfg;
}

QStringList statementsOf(TransformerCfg& cfg) {
  TextBuffer buffer;
  EXPECT_TRUE(cfg.instantiate(buffer, QString()));
  QStringList statements;
  for (const QString& statement : buffer.text().replace("\\\n", " ").split('\n', Qt::SkipEmptyParts)) {
    statements << statement.simplified();
  }
  return statements;
}

bool isWritten(TransformerCfg& cfg) {
  TextBuffer buffer;
  return cfg.instantiate(buffer, QString());
}

QString writtenValue(const TransformerCfg& cfg, const QString& parameter) {
  TextBuffer buffer;
  return cfg.getParameterValueForMappingFile(parameter, cfg.getParameterByMacroName(parameter), buffer);
}

QString refusalOf(const TransformerCfg& cfg, const QString& parameter) {
  QString message;
  const bool isAccepted = cfg.validateParameter(parameter, message);
  EXPECT_TRUE(!isAccepted || message.isEmpty()) << message.toStdString();
  return isAccepted ? QString() : message.isEmpty() ? QStringLiteral("?") : message;
}
