#include "SpecialisedSetup.h"

#include <platform/session/ORXSession.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/text/MFBuffer.h>

#include <QBuffer>
#include <gtest/gtest.h>

namespace {

class TextBuffer : public MFBuffer {
 public:
  TextBuffer() {
    m_device.open(QIODevice::WriteOnly);
    setDevice(&m_device);
  }
  ~TextBuffer() override { setDevice(nullptr); }
  void write(const QByteArray& bytes) override { m_device.write(bytes); }
  QString text() const { return QString::fromUtf8(m_device.data()); }

 private:
  QBuffer m_device;
};

}  // namespace

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

QString writtenValue(const TransformerCfg& cfg, const char* parameter) {
  TextBuffer buffer;
  const QString name = QString::fromLatin1(parameter);
  return cfg.getParameterValueForMappingFile(name, cfg.getParameterByMacroName(name), buffer);
}

QString refusalOf(const TransformerCfg& cfg, const char* parameter) {
  QString message;
  const bool isAccepted = cfg.validateParameter(QString::fromLatin1(parameter), message);
  EXPECT_TRUE(!isAccepted || message.isEmpty()) << message.toStdString();
  return isAccepted ? QString() : message.isEmpty() ? QStringLiteral("?") : message;
}
