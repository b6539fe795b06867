#include "SpecialisedSetup.h"
#include <platform/qorxcore/Language.h>
#include <tests/translation/SmallWorkspace.h>
#include <transform/registry/TransformerMgr.h>
#include <transform/specialised/attributes/ParameterFetcherTransformerCfg.h>
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
    const char* given;
    const char* stored;
    const char* shown;
    bool hasDirectory = true;
  };
  const SmallDirectory directory;
  for (const Case& c : {Case{1, "P", "$(P)", "P"},
                        {1, "$(R)", "$(R)", "R"},
                        {1, "WORKSPACE_NAME", "$(WORKSPACE_NAME)", "WORKSPACE_NAME"},
                        {1, "NOPE", "", ""},
                        {1, "$P", "", ""},
                        {1, "<Unused>", "", ""},
                        {1, "NOPE", "$(NOPE)", "NOPE", false},
                        {1, "$()", "$()", "$()", false},
                        {1, "$(x", "$(x", "$(x", false},
                        {2, "NOPE", "NOPE", "NOPE"},
                        {3, "$(P)", "$(P)", "$(P)"}}) {
    SCOPED_TRACE(std::to_string(c.version) + " " + c.given);
    const auto cfg = makeFetcher(c.version);
    cfg->setParameterDirectory(c.hasDirectory ? &directory : nullptr);
    EXPECT_TRUE(cfg->setParameterValue("OTHER", c.given, false));
    EXPECT_EQ(cfg->getParameterValue("OTHER"), c.given);
    EXPECT_TRUE(cfg->setParameterValue("FETCHED", c.given, false));
    EXPECT_EQ(cfg->getParameterValue("FETCHED"), c.stored);
    EXPECT_EQ(cfg->getParameterDisplayValue("FETCHED"), c.shown);
    EXPECT_EQ(cfg->getDefaultMacroLine("FETCHED"),
              QString("DEFAULT_MACRO FETCHED %1").arg(c.version == 1 ? c.shown : c.stored));
    EXPECT_EQ(cfg->canCreateGlobalParameter("FETCHED"), c.version > 1);
    EXPECT_TRUE(cfg->canCreateGlobalParameter("OTHER"));
  }
}

TEST(ParameterFetcher, EntriesNameMacros) {
  const auto cfg = makeFetcher(3);
  const QString cases =
      "$(X)=X|\"$(X)\"=X|{$(X)}=X|\"$(X)}=X|{$(X)\"=X|$()=|{$()}=|{Log File}=|X=|=|Log "
      "File=ORX_LOG_FILE|\"$X\"=|{}=|"
      "'$(X)'=|$(A)$(B)=A)$(B";
  for (const QString& c : cases.split('|'))
    EXPECT_EQ(c.section('=', 0, 0) + '=' + asFetcher(*cfg).macroNameFromMacroDef(c.section('=', 0, 0)), c);
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
    const char* added;
  };
  const SmallDirectory directory;
  const auto restore = qScopeGuard([] { QORXSetLanguage("en"); });
  for (const Case& c : {Case{2, "A,B", "\"A\",\"B\"", "A", "A, B"},
                        {2, "\"$(P)\",$(R)", "\"$(P)\",\"$(R)\"", "", "P, R"},
                        {2, "A", "A", "A", ""},
                        {2, "$(P)", "$(P)", "", "P"},
                        {2, ",$(P),,WORKSPACE_NAME,", "\"$(P)\",\"WORKSPACE_NAME\"", "", "P, WORKSPACE_NAME"},
                        {3, "A B", "{A} {B}", "A", "A, B"},
                        {3, "{$(P)}  $(X)", "{$(P)} {$(X)}", "$(X)", "P, X"},
                        {3, "\"$(P)\" \"$(R)\"", "{$(P)} {$(R)}", "", "P, R"},
                        {2, "{$(P)},$(R)", "\"$(P)\",\"$(R)\"", "", "P, R"},
                        {3, "{$(P)}", "{$(P)}", "", "P"},
                        {3, "$(P),$(Q)", "$(P),$(Q)", "$(P),$(Q)", "P),$(Q"},
                        {3, "WORKSPACE_NAME", "WORKSPACE_NAME", "", "WORKSPACE_NAME"},
                        {3, "", "", "", ""},
                        {2, ",$(P)", "$(P)", "", "P"},
                        {2, "$(P),", "$(P)", "", "P"},
                        {3, " $(P)  $(R) ", "{$(P)} {$(R)}", "", "P, R"},
                        {2, ",", "", "", ""},
                        {3, "<Unused>", "<Unused>", "", ""},
                        {1, "A,B", "\"A\",\"B\"", "", ""}}) {
    SCOPED_TRACE(std::to_string(c.version) + " " + c.value);
    const auto cfg = makeFetcher(c.version);
    EXPECT_TRUE(cfg->setParameterValue("ATTR_LIST", c.value, false));
    EXPECT_EQ(refusalOf(*cfg, "ATTR_LIST"), "") << "nobody is there to ask";
    cfg->setParameterDirectory(&directory);
    const QStringList added = QString(c.added).split(", ", Qt::SkipEmptyParts);
    EXPECT_EQ(writtenValue(*cfg, "ATTR_LIST"), c.written);
    EXPECT_EQ(cfg->getOutputAttributes("OUTPUT"),
              QStringList({"id", "name"}) + (added.size() > 1 ? added : QStringList()))
        << "a single one is the definition's";
    QStringList tooltip;
    cfg->getTooltipLines(tooltip, true);
    EXPECT_EQ(tooltip.join('|'), c.added);
    for (const char* language : {"en", "de", "fr"}) {
      QORXSetLanguage(language);
      EXPECT_EQ(refusalOf(*cfg, "ATTR_LIST"), *c.refused ? TransformResString(370617, c.refused) : QString());
      EXPECT_EQ(refusalOf(*cfg, "OTHER"), TransformResString(370608, "Prompt"));
    }
    EXPECT_EQ(refusalOf(*cfg, "NO_SUCH"), "?");
    EXPECT_TRUE(cfg->parameterSupportsAttributeReference("ATTR_LIST"));
    EXPECT_FALSE(cfg->parameterSupportsAttributeReference("OTHER"));
  }
}

TEST(ParameterFetcher, UpgradesGatherTheList) {
  struct Case {
    int from;
    const char* settings;
    int to;
    const char* list;
    bool isComplete = true;
  };
  const SmallDirectory directory;
  for (const Case& c : {Case{1, "PARAMETER_1=P | PARAMETER_3=$(R)", 3, "$(P) $(R)"},
                        {1, "PARAMETER_2=Q", 2, "$(Q)"},
                        {1, "PARAMETER_1=P | ATTRIBUTE_1=mine", 3, "$(P)", false},
                        {1, "PARAMETER_1=", 3, ""},
                        {2, "ATTR_LIST=\"$(P)\",$(Q),Workspace Name", 3, "$(P) $(Q) WORKSPACE_NAME"},
                        {2, "ATTR_LIST=<Unused>", 3, ""},
                        {3, "ATTR_LIST=$(P) {$(Q)}", 3, "$(P) $(Q)"}}) {
    SCOPED_TRACE(c.settings);
    const auto older = makeShipped("ParameterFetcher", c.from);
    const auto newer = makeShipped("ParameterFetcher", c.to);
    older->setParameterDirectory(&directory);
    applySettings(*older, c.settings);
    EXPECT_EQ(newer->upgradeTransformer(older.get()), c.isComplete);
    EXPECT_EQ(newer->getParameterValue("ATTR_LIST"), c.list);
    EXPECT_EQ(refusalOf(*newer, "ATTR_LIST"), "");
  }
}

// A workspace whose features get two parameters, one of which a later transformer uses.
TEST(ParameterFetcher, WorksInAWorkspace) {
  // `rules`: what is found
  // `statement`: that is written
  const std::tuple<int, QStringList, const char*, const char*> cases[] = {
      {3, {"ATTR_LIST", "$(TOWN) $(LIMIT)"}, "", "PARAMETERS {$(TOWN)} {$(LIMIT)}"},
      {2, {"ATTR_LIST", "$(TOWN),$(LIMIT)"}, "newer-version", "PARAMETERS \"$(TOWN)\",\"$(LIMIT)\""},
      {2, {"ATTR_LIST", "\"$(TOWN)\",$(LIMIT)"}, "newer-version", "PARAMETERS \"$(TOWN)\",\"$(LIMIT)\""},
      {3, {"ATTR_LIST", "{$(TOWN)} {$(LIMIT)}"}, "", "PARAMETERS {$(TOWN)} {$(LIMIT)}"},
      {3, {"ATTR_LIST", "$(LIMIT)"}, "unused-parameter", "PARAMETERS $(LIMIT)"},
      {3, {"ATTR_LIST", "$(TOWN) $(NO)"}, "unused-parameter invalid-value missing-attribute", ""},
      {1,
       {"PARAMETER_1", "NO", "ATTRIBUTE_1", "LIMIT"},
       "unused-parameter unused-parameter newer-version missing-value",
       ""},
  };
  makeShipped("ParameterFetcher");
  TransformerMgr& registry = TransformerMgr::getTransformerMgr();
  for (const auto& [version, parameters, wantedRules, statement] : cases) {
    SCOPED_TRACE(parameters.join(' ').toStdString());
    SmallWorkspace workspace;
    workspace.parameter("GUI TEXT_ENCODED TOWN Town", "Ulm")
        .parameter("GUI INT LIMIT Limit", "7")
        .reader(1, "Parcels", {"id"})
        .writer(2, "Out")
        .transformer(3, "ParameterFetcher", QStringList{"XFORMER_NAME", "Fetch"} + parameters,
                     {"VERSION", QString::number(version)})
        .transformer(4, "ExpressionEvaluator",
                     {"EXPRESSION", "@Value<leftparenthesis>LIMIT<rightparenthesis>+1"}, {"VERSION", "1"})
        .link(1, "fo 0 Parcels", 3, "fi 0 INPUT")
        .link(3, "fo 0 OUTPUT", 4, "fi 0 INPUT")
        .link(4, "fo 0 OUTPUT", 2, "fi 0");
    QTemporaryDir folder;
    const QString file = workspace.save(folder);
    QStringList rules;
    for (const orx::Finding& finding : validateWorkspace(file, registry).findings) {
      rules << orx::ruleRow(finding.rule).name;
    }
    rules.removeAll("dropped-features");
    EXPECT_EQ(rules.join(' '), wantedRules);
    orx::Findings diagnostics(file);
    QString error;
    const QString output = folder.filePath("out.mf");
    translateWorkspace({file, output, {}}, registry, diagnostics, error);
    EXPECT_EQ(QFile::exists(output), *statement != 0);
    EXPECT_TRUE(!*statement ||
                readAll(output).contains(QByteArray("FACTORY_OPTION Fetch ") + statement + "\n"));
  }
}
