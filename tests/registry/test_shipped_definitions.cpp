#include <platform/qorxcore/qorxcore.h>
#include <platform/session/session.h>
#include <tests/support/LanguageGuard.h>
#include <tests/support/QtPrinters.h>
#include <tests/support/TextBuffer.h>
#include <transform/core/TransformerCfg.h>
#include <transform/registry/DefinitionLint.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/TransformerCfgFactory.h>

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <memory>
#include <random>

namespace {

const QString kResources = QStringLiteral(ORX_SOURCE_DIR "/resources");

QStringList inputsOf(const TransformerCfg& cfg) {
  QStringList tags;
  cfg.getInputTags(tags);
  return tags;
}

QStringList outputsOf(const TransformerCfg& cfg) {
  QStringList tags;
  cfg.getOutputTags(tags);
  return tags;
}

// The registry as it is installed, in one language.
class ShippedDefinitions : public testing::TestWithParam<const char*> {
 protected:
  void SetUp() override {
    qputenv("ORX_HOME", kResources.toUtf8());
    qputenv("XDG_DATA_HOME", QByteArray(ORX_BINARY_DIR "/nothing"));
    qputenv("ORX_TRANSFORMER_PATH", QByteArray());
    registry().loadTransformers(&m_session);
  }
  static TransformerMgr& registry() { return TransformerMgr::getTransformerMgr(); }

  // A copy of every version of every definition.
  static void forEach(const std::function<void(TransformerCfg&)>& ask) {
    for (const QString& name : registry().transformerNames()) {
      for (const int version : registry().transformerVersions(name)) {
        SCOPED_TRACE(name.toStdString() + " version " + std::to_string(version));
        const std::unique_ptr<TransformerCfg> cfg(registry().getTransformer(name, version));
        ASSERT_TRUE(cfg);
        ask(*cfg);
      }
    }
  }

  const LanguageGuard m_language{GetParam()};
  ORXSession m_session;
};

using ShippedInEnglish = ShippedDefinitions;

// Pieces of text that mean something to one of the packed forms, put together at random.
QString nastyText(std::mt19937& random) {
  static const QStringList pieces =
      QString(
          u8",|\"|\"\"|\n|\r| "
          u8"|\t|&|@Value(|a|{|}|\\|$(A)|$[|%|;|<comma>|=|'|NAME|<Unused>|\u00e4\U0001d11e|<|"
          "a,\"b\"|\v")
          .split('|') +
      QStringList{QChar(0), QChar(0xd800)};
  // Marks count at the beginning alone.
  QString text(static_cast<int>(random() % 4), QLatin1Char(random() % 2 == 0 ? '&' : ' '));
  for (std::size_t count = random() % 7; count > 0; --count)
    text += pieces.at(static_cast<int>(random() % static_cast<unsigned>(pieces.size())));
  return text;
}

}  // namespace

INSTANTIATE_TEST_SUITE_P(Language, ShippedInEnglish, testing::Values("en"));

// Whatever is set, a restored object and every kind of copy hold the same.
TEST_P(ShippedInEnglish, HostileValuesSurviveEveryCopy) {
  std::mt19937 random(20);
  int values = 0;
  forEach([&](TransformerCfg& cfg) {
    const QStringList inputs = inputsOf(cfg);
    const QStringList outputs = outputsOf(cfg);
    for (int round = 0; round < 8; ++round) {
      for (const QString& name : QStringList(cfg.getParameters())) {
        // Also through a member, whose value the whole packs once more.
        const TransformParamCfg* record = cfg.getParameterByMacroName(name);
        const QStringList macros = record ? record->getMacroNames() : QStringList();
        const bool isWhole = macros.isEmpty() || random() % 2 == 0;
        cfg.setParameterValue(isWhole ? name : macros.at(static_cast<int>(random() % macros.size())),
                              nastyText(random), false);
        ++values;
      }
      for (const QString& tag : inputs) {
        cfg.addInputFeatureType(tag, nastyText(random));
        cfg.addInputFilter(tag, nastyText(random));
        cfg.setInputAttributes(tag, {nastyText(random), nastyText(random)});
      }
      for (const QString& tag : outputs) {
        cfg.setOutputFeatureType(tag, nastyText(random));
        cfg.setOutputTagFuncs(tag, {nastyText(random), nastyText(random)});
      }
      const QString text = cfg.serialize();
      const std::unique_ptr<TransformerCfg> restored(registry().deserialize(text));
      const std::unique_ptr<TransformerCfg> copied(cfg.getCopy());
      const std::unique_ptr<TransformerCfg> assigned(registry().getTransformer(cfg.getName(), -2));
      const std::unique_ptr<TransformerCfg> filled(
          registry().getTransformer(cfg.getName(), cfg.getVersion()));
      ASSERT_TRUE(restored && copied && assigned && filled);
      assigned->assign(&cfg);
      filled->copyValues(&cfg);
      for (const TransformerCfg* other : {restored.get(), copied.get(), assigned.get(), filled.get()}) {
        ASSERT_EQ(other->getParameters(), cfg.getParameters());
        for (const QString& name : cfg.getParameters())
          ASSERT_EQ(other->getParameterValue(name), cfg.getParameterValue(name)) << name.toStdString();
        ASSERT_EQ(other->getInputAttributes(), cfg.getInputAttributes());
        ASSERT_EQ(other->serialize(), text) << "round " << round;
      }
    }
  });
  EXPECT_GT(values, 1000);
}

// The face for callers without the string library, and what depends on the version alone.
TEST_P(ShippedInEnglish, OperationsAgree) {
  forEach([&](TransformerCfg& cfg) {
    ITransformerCfg& face = cfg;
    ORXString text;
    ORXStringArray list;
    const QStringList inputs = inputsOf(cfg);
    const QStringList outputs = outputsOf(cfg);
    face.getName(text);
    EXPECT_EQ(ORXToQString(text), cfg.getName());
    face.getFileName(text);
    EXPECT_EQ(ORXToQString(text), cfg.getFileName());
    face.getInputTags(list);
    EXPECT_EQ(ORXToQStringList(list), inputs);
    face.getOutputTags(list);
    EXPECT_EQ(ORXToQStringList(list), outputs);
    face.getParameters(list);
    EXPECT_EQ(ORXToQStringList(list), cfg.getParameters());
    for (const QString& tag : inputs) {
      EXPECT_EQ(face.lookupInputTagAlias(ORXString(tag), text), cfg.getInputTagAliases().contains(tag));
      face.addInputFeatureType(ORXString(tag), ORXString("type"));
      face.getInputFeatureTypes(ORXString(tag), list);
      EXPECT_EQ(ORXToQStringList(list), QStringList("type"));
      cfg.clearInputFeatureType(tag);
      EXPECT_EQ(cfg.getInputFeatureTypes(tag), QStringList());
    }
    face.addInputFeatureType(ORXString("everywhere"));
    EXPECT_EQ(cfg.getTransformFactoryInputLines().isEmpty(), inputs.isEmpty());
    face.clearInputFeatureTypes();
    for (const QString& tag : inputs)
      EXPECT_EQ(cfg.getInputFeatureTypes(tag), QStringList());
    for (const QString& tag : outputs) {
      face.setOutputFeatureType(ORXString(tag), ORXString("type"));
      face.setOutputTagFuncs(ORXString(tag), ORXStringArray(QStringList("function")));
      EXPECT_TRUE(face.getOutputFeatureType(ORXString(tag), text));
      EXPECT_EQ(ORXToQString(text), "type");
      EXPECT_EQ(cfg.getOutputTagFuncs(tag), QStringList("function"));
    }
    EXPECT_FALSE(face.setParameterValue(ORXString("NO_SUCH"), ORXString("x"), true));
    EXPECT_TRUE(face.setParameterValue(ORXString("XFORMER_NAME"), ORXString("other"), true));
    EXPECT_EQ(cfg.getIdentifier(), "other");
    ORXStringArray readers;
    ORXStringArray writers;
    face.getUsedComponents(readers, writers, list, true);
    EXPECT_EQ(ORXToQStringList(list), QStringList(cfg.getName()));
    EXPECT_EQ(readers.entries() + writers.entries(), 0u);
    TextBuffer buffer;
    EXPECT_TRUE(face.instantiate(&buffer, ORXString("document"), true));
    EXPECT_EQ(cfg.getRequiresVisualizerLauncher(), cfg.getName() == "Inspector");
    EXPECT_TRUE(cfg.getIsDefinitionValid() && !cfg.getIsEmbeddable() && !cfg.isDefinitionDeletable());
    EXPECT_TRUE(cfg.getUsesTransformer(cfg.getName(), nullptr));
    EXPECT_EQ(cfg.getIsBlocking(), cfg.featureHolding() > 1);
    EXPECT_FALSE(cfg.getIsAsynchronous() && inputs.isEmpty());
    EXPECT_FALSE(inputs.contains(cfg.getHiddenInputTag()) || outputs.contains(cfg.getHiddenOutputTag()));
  });
}

// Every older version leads to the newest one without loss.
TEST_P(ShippedInEnglish, OlderVersionsUpgrade) {
  int upgrades = 0;
  forEach([&](TransformerCfg& older) {
    const std::unique_ptr<TransformerCfg> newest(
        registry().getTransformer(older.getName(), ITransformerMgr::NEWEST_VERSION));
    if (newest->getVersion() == older.getVersion())
      return;
    ++upgrades;
    const QStringList before = outputsOf(older);
    const QStringList after = outputsOf(*newest);
    for (const QString& tag : before)
      older.setOutputFeatureType(tag, "type of " + tag);
    const QHash<QString, QString> renamed = newest->renamedOutputTags(older.getVersion(), &older);
    const QHash<QString, QString> renamedInputs = newest->renamedInputTags(older.getVersion(), &older);
    for (const QString& tag : inputsOf(older))
      EXPECT_TRUE(inputsOf(*newest).contains(renamedInputs.value(tag, tag))) << tag.toStdString();
    EXPECT_TRUE(newest->upgradeTransformer(&older));
    for (const QString& tag : before) {
      EXPECT_TRUE(after.contains(renamed.value(tag, tag))) << tag.toStdString();
      QString featureType;
      newest->getOutputFeatureType(renamed.value(tag, tag), featureType);
      EXPECT_EQ(featureType, "type of " + tag);
    }
  });
  EXPECT_GT(upgrades, 0);
}

// Each class that the factory knows has definitions to serve.
TEST_P(ShippedInEnglish, DefineWhatTheFactoryNames) {
  for (const TransformerCfgRule& rule : transformerCfgRules()) {
    for (const QLatin1String name : rule.names) {
      const QList<int> versions = registry().transformerVersions(name);
      EXPECT_TRUE(std::any_of(versions.begin(), versions.end(), [&](int v) { return rule.versions.hold(v); }))
          << name.data() << " from version " << rule.versions.first;
    }
  }
}

// Every operation that asks something, and one instantiation, of every shipped definition.
TEST_P(ShippedDefinitions, AnswerEveryQuestion) {
  TransformerMgr& manager = registry();
  EXPECT_EQ(manager.lastError(), "");
  ASSERT_GT(manager.transformerNames().size(), 20);
  forEach([&](TransformerCfg& cfg) {
    EXPECT_EQ(cfg.transformerType(), TransformerCfg::kBuiltIn);
    EXPECT_EQ(cfg.getIdentifier(), cfg.getLocalizedName());
    EXPECT_FALSE(manager.changeLog(&cfg).isEmpty());
    const QStringList inputs = inputsOf(cfg);
    const QStringList outputs = outputsOf(cfg);
    EXPECT_EQ(inputs.isEmpty(), cfg.getIsSource());
    EXPECT_FALSE(inputs.isEmpty() && outputs.isEmpty());
    for (const QString& tag : inputs) {
      cfg.addInputFeatureType(tag, QStringLiteral("in_") + tag);
      cfg.setInputAttributes(tag, {QStringLiteral("id"), QStringLiteral("part{}.name")});
    }
    for (const QString& tag : outputs) {
      cfg.setOutputFeatureType(tag, QStringLiteral("out_") + tag);
      EXPECT_EQ(cfg.getOutputAttributes(tag).removeDuplicates(), 0);
    }
    for (const QString& parameter : cfg.getParameters()) {
      EXPECT_TRUE(cfg.getParameterGUIType(parameter).isKnown()) << parameter.toStdString();
      EXPECT_FALSE(cfg.getSupportedValueTypes(parameter).isEmpty() && cfg.canEditParm(parameter));
      cfg.getParameterDisplayValue(parameter);
      cfg.getAttributeNamesInValue(parameter);
      cfg.getShowParameter(parameter);
      cfg.getGuiLine(parameter);
      cfg.getDefaultMacroLine(parameter);
    }
    EXPECT_TRUE(cfg.findUnwritableValues().isEmpty());
    TextBuffer buffer;
    EXPECT_TRUE(cfg.instantiate(buffer, QString()));
    buffer.flush();
    const QString text = buffer.text();
    EXPECT_FALSE(text.isEmpty());
    for (const QString& tag : outputs) {
      EXPECT_TRUE(text.contains(QStringLiteral("out_") + tag)) << tag.toStdString();
    }
    for (const QString& tag : inputs) {
      EXPECT_TRUE(text.contains(QStringLiteral("in_") + tag)) << tag.toStdString();
    }
  });
  ORXStringArray categories;
  manager.getCategories(categories);
  EXPECT_EQ(ORXToQStringList(categories), manager.getCategories());
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
  for (const orx::Finding& finding : lint.findings()) {
    ADD_FAILURE() << finding.file.toStdString() << ":" << finding.line << ": " << finding.text.toStdString()
                  << " [" << orx::ruleRow(finding.rule).name.data() << "]";
  }
}
