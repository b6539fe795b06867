#include <platform/qorxcore/qorxcore.h>
#include <platform/session/ORXSession.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/DefinitionLint.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>
#include <transform/text/MFBuffer.h>

#include <QBuffer>
#include <gtest/gtest.h>

#include <memory>

namespace {

const QString kResources = QStringLiteral(ORX_SOURCE_DIR "/resources");

class MemoryBuffer : public MFBuffer {
 public:
  MemoryBuffer() {
    m_device.open(QIODevice::WriteOnly);
    setDevice(&m_device);
  }
  ~MemoryBuffer() override { setDevice(nullptr); }
  void write(const QByteArray& bytes) override { m_device.write(bytes); }

  QString text() { return QString::fromUtf8(m_device.data()); }

 private:
  QBuffer m_device;
};

// The registry as it is installed, in one language.
class ShippedDefinitions : public testing::TestWithParam<const char*> {
 protected:
  void SetUp() override {
    qputenv("ORX_HOME", kResources.toUtf8());
    qputenv("XDG_DATA_HOME", QByteArray(ORX_BINARY_DIR "/nothing"));
    qputenv("ORX_TRANSFORMER_PATH", QByteArray());
    m_language = QORXLanguage();
    QORXSetLanguage(QString::fromLatin1(GetParam()));
    registry().loadTransformers(&m_session);
  }
  void TearDown() override { QORXSetLanguage(m_language); }
  static TransformerMgr& registry() { return TransformerMgr::getTransformerMgr(); }

  QString m_language;
  ORXSession m_session;
};

}  // namespace

// Every operation that asks something, and one instantiation, of every shipped definition.
TEST_P(ShippedDefinitions, AnswerEveryQuestion) {
  TransformerMgr& manager = registry();
  EXPECT_EQ(manager.lastError(), "");
  ASSERT_GT(manager.transformerNames().size(), 20);
  for (const QString& name : manager.transformerNames()) {
    for (const int version : manager.transformerVersions(name)) {
      SCOPED_TRACE(name.toStdString() + " version " + std::to_string(version));
      const std::unique_ptr<TransformerCfg> cfg(manager.getTransformer(name, version));
      ASSERT_TRUE(cfg);
      EXPECT_EQ(cfg->getName(), name);
      EXPECT_EQ(cfg->getVersion(), version);
      EXPECT_EQ(cfg->transformerType(), TransformerCfg::kBuiltIn);
      EXPECT_EQ(cfg->getIdentifier(), cfg->getLocalizedName());
      EXPECT_FALSE(cfg->tags().isEmpty());
      EXPECT_FALSE(cfg->getDescriptionLines().isEmpty());
      EXPECT_FALSE(cfg->getChangeLog().isEmpty());
      EXPECT_FALSE(manager.changeLog(cfg.get()).isEmpty());
      QStringList inputs;
      QStringList outputs;
      cfg->getInputTags(inputs);
      cfg->getOutputTags(outputs);
      EXPECT_EQ(inputs.isEmpty(), cfg->getIsSource());
      EXPECT_FALSE(inputs.isEmpty() && outputs.isEmpty());
      for (const QString& tag : inputs) {
        EXPECT_FALSE(cfg->getTagDescription(tag).isEmpty()) << tag.toStdString();
        cfg->addInputFeatureType(tag, QStringLiteral("in_") + tag);
        cfg->setInputAttributes(tag, {QStringLiteral("id"), QStringLiteral("part{}.name")});
      }
      for (const QString& tag : outputs) {
        EXPECT_FALSE(cfg->getTagDescription(tag).isEmpty()) << tag.toStdString();
        cfg->setOutputFeatureType(tag, QStringLiteral("out_") + tag);
        EXPECT_EQ(cfg->getOutputAttributes(tag).removeDuplicates(), 0);
      }
      for (const QString& parameter : cfg->getParameters()) {
        EXPECT_TRUE(cfg->getParameterGUIType(parameter).isKnown()) << parameter.toStdString();
        EXPECT_FALSE(cfg->getSupportedValueTypes(parameter).isEmpty() && cfg->canEditParm(parameter));
        cfg->getParameterDisplayValue(parameter);
        cfg->getAttributeNamesInValue(parameter);
        cfg->getShowParameter(parameter);
        cfg->getGuiLine(parameter);
        cfg->getDefaultMacroLine(parameter);
      }
      QStringList tooltip;
      cfg->getTooltipLines(tooltip, true);
      EXPECT_FALSE(tooltip.isEmpty());
      EXPECT_TRUE(cfg->findUnwritableValues().isEmpty());
      // What was written is restored.
      const std::unique_ptr<TransformerCfg> restored(manager.deserialize(cfg->serialize()));
      ASSERT_TRUE(restored);
      for (const QString& parameter : cfg->getParameters()) {
        EXPECT_EQ(restored->getParameterValue(parameter), cfg->getParameterValue(parameter))
            << parameter.toStdString();
      }
      MemoryBuffer buffer;
      EXPECT_TRUE(cfg->instantiate(buffer, QString()));
      buffer.flush();
      const QString text = buffer.text();
      EXPECT_FALSE(text.isEmpty());
      for (const QString& tag : outputs) {
        EXPECT_TRUE(text.contains(QStringLiteral("out_") + tag)) << tag.toStdString();
      }
      for (const QString& tag : inputs) {
        EXPECT_TRUE(text.contains(QStringLiteral("in_") + tag)) << tag.toStdString();
      }
    }
  }
  for (const QString& category : manager.getCategories()) {
    QStringList lines;
    EXPECT_TRUE(manager.getCategoryDesc(category, lines)) << category.toStdString();
    EXPECT_EQ(manager.getCategoryTransformers(manager.getLocalizedCategoryName(category)),
              manager.getCategoryTransformers(category));
  }
}

INSTANTIATE_TEST_SUITE_P(Languages, ShippedDefinitions, testing::Values("en", "de", "fr"));

TEST(ShippedResources, PassTheirChecks) {
  qputenv("ORX_HOME", kResources.toUtf8());
  DefinitionLint lint;
  lint.checkPath(kResources);
  for (const LintFinding& finding : lint.findings()) {
    ADD_FAILURE() << finding.file.toStdString() << ":" << finding.line << ": " << finding.text.toStdString()
                  << " [" << finding.rule.toStdString() << "]";
  }
}

// Each class that the factory knows has definitions to serve.
TEST(ShippedResources, DefineWhatTheFactoryNames) {
  qputenv("ORX_HOME", kResources.toUtf8());
  TransformerMgr& manager = TransformerMgr::getTransformerMgr();
  ORXSession session;
  manager.loadTransformers(&session);
  for (const TransformerCfgRule& rule : transformerCfgRules()) {
    bool isServed = false;
    for (const int version : manager.transformerVersions(rule.name)) {
      isServed = isServed || (version >= rule.firstVersion && version <= rule.lastVersion);
    }
    EXPECT_TRUE(isServed) << rule.name.data() << " from version " << rule.firstVersion;
  }
}
