#include "SpecialisedSetup.h"
#include <platform/qorxcore/Language.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/ParameterFetcherTransformerCfg.h>
#include <transform/text/MessageStrings.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/WorkspaceValidation.h>

#include <QScopeGuard>
#include <gtest/gtest.h>

namespace {

std::unique_ptr<TransformerCfg> makeFetcher(int version) {
  return makeSpecialised("ParameterFetcher", version,
                         {{"ATTR_LIST", "OPTIONAL PUBLISHED_PARAMETER_LIST"},
                          {"FETCHED", "PUBLISHED_PARAMETER"},
                          {"OTHER", "STRING"}});
}

const ParameterFetcherTransformerCfg& asFetcher(const TransformerCfg& cfg) {
  return dynamic_cast<const ParameterFetcherTransformerCfg&>(cfg);
}

}  // namespace

TEST(ParameterFetcher, EarliestVersionKeepsReferences) {
  struct Case {
    int version;
    bool hasDirectory;
    const char* given;
    const char* stored;
    const char* shown;
  };
  const Case cases[] = {
      {1, true, "P", "$(P)", "P"},
      {1, true, "$(R)", "$(R)", "R"},
      {1, true, "WORKSPACE_NAME", "$(WORKSPACE_NAME)", "WORKSPACE_NAME"},
      {1, true, "NOPE", "", ""},
      {1, true, "$P", "", ""},
      {1, true, "", "", ""},
      {1, true, "<Unused>", "", ""},
      {1, false, "NOPE", "$(NOPE)", "NOPE"},
      {1, false, "$()", "$()", "$()"},
      {1, false, "$(x", "$(x", "$(x"},
      {2, true, "NOPE", "NOPE", "NOPE"},
      {3, true, "$(P)", "$(P)", "$(P)"},
  };
  const SmallDirectory directory;
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.version) + " " + c.given);
    const auto cfg = makeFetcher(c.version);
    cfg->setParameterDirectory(c.hasDirectory ? &directory : nullptr);
    for (const char* parameter : {"FETCHED", "OTHER"}) {
      const bool isFetched = parameter == QLatin1String("FETCHED");
      EXPECT_TRUE(cfg->setParameterValue(parameter, c.given, false));
      EXPECT_EQ(cfg->getParameterValue(parameter), isFetched ? c.stored : c.given);
      if (isFetched) {
        EXPECT_EQ(cfg->getParameterDisplayValue(parameter), c.shown);
        EXPECT_EQ(cfg->getDefaultMacroLine(parameter),
                  QString("DEFAULT_MACRO FETCHED %1").arg(c.version == 1 ? c.shown : c.stored));
      }
      EXPECT_EQ(cfg->canCreateGlobalParameter(parameter), c.version > 1 || !isFetched);
    }
    EXPECT_FALSE(cfg->setParameterValue("NO_SUCH", c.given, false));
  }
}

TEST(ParameterFetcher, EntriesNameMacros) {
  const auto cfg = makeFetcher(3);
  struct Case {
    const char* entry;
    const char* macro;
  };
  const Case cases[] = {{"$(X)", "X"},
                        {"\"$(X)\"", "X"},
                        {"{$(X)}", "X"},
                        {"\"$(X)}", "X"},
                        {"{$(X)\"", "X"},
                        {"$()", ""},
                        {"{$()}", ""},
                        {"WORKSPACE_NAME", "WORKSPACE_NAME"},
                        {"Log File", "ORX_LOG_FILE"},
                        {"{Log File}", ""},
                        {"X", ""},
                        {"", ""},
                        {"\"$X\"", ""},
                        {"{}", ""},
                        {"'$(X)'", ""},
                        {"$(A)$(B)", "A)$(B"}};
  for (const Case& c : cases) {
    EXPECT_EQ(asFetcher(*cfg).macroNameFromMacroDef(c.entry), c.macro) << c.entry;
  }
  EXPECT_EQ(asFetcher(*makeFetcher(1)).attrListSeparator(), ",");
  EXPECT_EQ(asFetcher(*makeFetcher(2)).attrListSeparator(), ",");
  EXPECT_EQ(asFetcher(*cfg).attrListSeparator(), " ");
}

TEST(ParameterFetcher, TheListIsWrittenValidatedAndAddsAttributes) {
  struct Case {
    int version;
    const char* value;
    const char* written;
    const char* refused;  // the entry that the message names
    QStringList added;
  };
  const Case cases[] = {
      {2, "A,B", "\"A\",\"B\"", "A", {"A", "B"}},
      {2, "\"$(P)\",$(R)", "\"$(P)\",\"$(R)\"", "", {"P", "R"}},
      {2, "A", "A", "A", {}},
      {2, "$(P)", "$(P)", "", {"P"}},
      {2, ",$(P),,WORKSPACE_NAME,", "\"$(P)\",\"WORKSPACE_NAME\"", "", {"P", "WORKSPACE_NAME"}},
      {2, "$(P) $(Q)", "$(P) $(Q)", "$(P) $(Q)", {"P) $(Q"}},
      {3, "A B", "{A} {B}", "A", {"A", "B"}},
      {3, "{$(P)}  $(X)", "{$(P)} {$(X)}", "$(X)", {"P", "X"}},
      {3, "$(P),$(Q)", "$(P),$(Q)", "$(P),$(Q)", {"P),$(Q"}},
      {3, "WORKSPACE_NAME", "WORKSPACE_NAME", "", {"WORKSPACE_NAME"}},
      {3, "", "", "", {}},
      {3, "<Unused>", "<Unused>", "", {}},
      {1, "A,B", "\"A\",\"B\"", "", {}},
  };
  const SmallDirectory directory;
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.version) + " " + c.value);
    const auto cfg = makeFetcher(c.version);
    EXPECT_TRUE(cfg->setParameterValue("ATTR_LIST", c.value, false));
    EXPECT_EQ(refusalOf(*cfg, "ATTR_LIST"), "") << "nobody is there to ask";
    cfg->setParameterDirectory(&directory);
    EXPECT_EQ(writtenValue(*cfg, "ATTR_LIST"), c.written);
    EXPECT_EQ(cfg->getOutputAttributes("OUTPUT"), QStringList({"id", "name"}) + c.added);
    QStringList tooltip;
    cfg->getTooltipLines(tooltip, true);
    EXPECT_EQ(tooltip.join('|'), c.added.join(", "));
    for (const char* language : {"en", "de", "fr"}) {
      const auto restore = qScopeGuard([] { QORXSetLanguage("en"); });
      QORXSetLanguage(language);
      EXPECT_EQ(refusalOf(*cfg, "ATTR_LIST"), *c.refused ? TransformResString(370617, c.refused) : QString());
    }
    EXPECT_EQ(refusalOf(*cfg, "OTHER"), TransformResString(370608, "Prompt"));
    EXPECT_EQ(refusalOf(*cfg, "NO_SUCH"), "?");
    EXPECT_TRUE(cfg->parameterSupportsAttributeReference("ATTR_LIST"));
    EXPECT_FALSE(cfg->parameterSupportsAttributeReference("OTHER"));
  }
}

TEST(ParameterFetcher, UpgradesGatherTheList) {
  struct Case {
    int from;
    QStringList values;  // name, value, name, value
    int to;
    const char* list;
    bool isComplete;
  };
  const Case cases[] = {
      {1, {"PARAMETER_1", "P", "PARAMETER_3", "$(R)"}, 3, "$(P) $(R)", true},
      {1, {"PARAMETER_2", "Q"}, 2, "$(Q)", true},
      {1, {"PARAMETER_1", "P", "ATTRIBUTE_1", "mine"}, 3, "$(P)", false},
      {1, {}, 3, "", true},
      {2, {"ATTR_LIST", "\"$(P)\",$(Q),Workspace Name"}, 3, "$(P) $(Q) WORKSPACE_NAME", true},
      {2, {"ATTR_LIST", "<Unused>"}, 3, "", true},
      {3, {"ATTR_LIST", "$(P) {$(Q)}"}, 3, "$(P) $(Q)", true},
  };
  const SmallDirectory directory;
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.from) + " " + c.values.join(' ').toStdString());
    const auto older = makeShipped("ParameterFetcher", c.from);
    const auto newer = makeShipped("ParameterFetcher", c.to);
    older->setParameterDirectory(&directory);
    for (int i = 0; i + 1 < c.values.size(); i += 2) {
      EXPECT_TRUE(older->setParameterValue(c.values[i], c.values[i + 1], false));
    }
    EXPECT_EQ(newer->upgradeTransformer(older.get()), c.isComplete);
    EXPECT_EQ(newer->getParameterValue("ATTR_LIST"), c.list);
    EXPECT_EQ(refusalOf(*newer, "ATTR_LIST"), "");
  }
}

// A workspace whose features get two parameters, one of which a later transformer uses.
TEST(ParameterFetcher, WorksInAWorkspace) {
  const auto workspaceWith = [](int version, const QStringList& parameters) {
    SmallWorkspace workspace;
    workspace.parameter("GUI TEXT_ENCODED TOWN Town", "Ulm")
        .parameter("GUI INT LIMIT Limit", "7")
        .reader(1, "Parcels", {"id"})
        .writer(2, "Out")
        .transformer(3, "ParameterFetcher", QStringList{"XFORMER_NAME", "Fetch"} + parameters,
                     {"VERSION", QString::number(version)})
        .transformer(4, "FormulaCalculator",
                     {"XFORMER_NAME", "Sum", "RESULT_ATTRIBUTE", "sum", "FORMULA",
                      "@Value<leftparenthesis>LIMIT<rightparenthesis>+1"},
                     {"VERSION", "1"});
    workspace.link(1, "fo 0 Parcels", 3, "fi 0 INPUT")
        .link(3, "fo 0 OUTPUT", 4, "fi 0 INPUT")
        .link(4, "fo 0 OUTPUT", 2, "fi 0");
    return workspace;
  };
  struct Case {
    int version;
    QStringList parameters;
    QStringList rules;      // what is found
    const char* statement;  // that is written
  };
  const Case cases[] = {
      {3, {"ATTR_LIST", "$(TOWN) $(LIMIT)"}, {}, "FACTORY_OPTION Fetch PARAMETERS {$(TOWN)} {$(LIMIT)}"},
      {2,
       {"ATTR_LIST", "$(TOWN),$(LIMIT)"},
       {"newer-version"},
       "FACTORY_OPTION Fetch PARAMETERS \"$(TOWN)\",\"$(LIMIT)\""},
      {3,
       {"ATTR_LIST", "$(TOWN) $(NO_SUCH)"},
       {"unused-parameter", "invalid-value", "unknown-reference", "missing-attribute"},
       ""},
      {1,
       {"PARAMETER_1", "$(TOWN)", "ATTRIBUTE_1", "town", "PARAMETER_2", "$(LIMIT)", "ATTRIBUTE_2", "LIMIT"},
       {"newer-version"},
       "FACTORY_OPTION Fetch VALUE_2 $(LIMIT)"},
      {1,
       {"PARAMETER_1", "NO_SUCH", "ATTRIBUTE_1", "LIMIT"},
       {"unused-parameter", "unused-parameter", "newer-version", "missing-value"},
       ""},
  };
  makeShipped("ParameterFetcher");
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  for (const Case& c : cases) {
    SCOPED_TRACE(c.parameters.join(' ').toStdString());
    QTemporaryDir folder;
    const QString file = workspaceWith(c.version, c.parameters).save(folder);
    QStringList rules;
    for (const Diagnostic& finding : validateWorkspace(file, registry).findings) {
      rules << diagnosticRule(finding.rule).name;
    }
    EXPECT_EQ(rules, c.rules);
    if (!*c.statement) {
      continue;
    }
    Diagnostics diagnostics(file);
    QString error;
    const QString output = folder.filePath("out.mf");
    EXPECT_EQ(translateWorkspace({file, output, {}}, registry, diagnostics, error), TranslationResult::Done);
    QFile written(output);
    ASSERT_TRUE(written.open(QIODevice::ReadOnly));
    EXPECT_TRUE(QString::fromUtf8(written.readAll()).contains(QString(c.statement) + "\n"));
  }
}
