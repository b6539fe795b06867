#include "SpecialisedSetup.h"
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

TEST(BulkAttributeRemover, RemovesWhatMatches) {
  struct Case {
    const char* expression;  // encoded
    const char* mode;
    const char* ignoreCase;
    QString refusal;
    QStringList left;
  };
  const QStringList all{"id", "Name", "tmp_a", "part{}.tmp_b", "orx_feature_type"};
  const Case cases[] = {
      {"^tmp_", "REMOVE", "NO", "", {"id", "Name", "part{}.tmp_b", "orx_feature_type"}},
      {"tmp_", "REMOVE", "NO", "", {"id", "Name", "orx_feature_type"}},
      {"tmp_", "All other attributes", "NO", "", {"tmp_a", "part{}.tmp_b", "orx_feature_type"}},
      {"^tmp_", "KEEP", "NO", "", {"tmp_a", "orx_feature_type"}},
      {"^name<dollarsign>", "REMOVE", "NO", "", all},
      {"^name<dollarsign>", "REMOVE", "YES", "", {"id", "tmp_a", "part{}.tmp_b", "orx_feature_type"}},
      {".", "REMOVE", "NO", "", {"orx_feature_type"}},
      {"<leftparenthesis>a", "REMOVE", "NO", TransformResString(370611, "(a"), all},
      {"<leftparenthesis>$(P)", "REMOVE", "NO", "", all},
      {"", "REMOVE", "NO", TransformResString(370608, "Regular Expression"), all},
      {"<Unused>", "KEEP", "NO", "", all},
  };
  const auto cfg = makeShipped("BulkAttributeRemover");
  cfg->setInputAttributes("INPUT", all);
  for (const Case& c : cases) {
    SCOPED_TRACE(c.expression);
    EXPECT_TRUE(cfg->setParameterValue("EXPRESSION", c.expression, false));
    EXPECT_TRUE(cfg->setParameterValue("MODE", c.mode, false));
    EXPECT_TRUE(cfg->setParameterValue("IGNORE_CASE", c.ignoreCase, false));
    EXPECT_EQ(refusalOf(*cfg, "EXPRESSION"), c.refusal);
    EXPECT_EQ(refusalOf(*cfg, "NO_SUCH"), "?");
    EXPECT_EQ(cfg->getOutputAttributes("OUTPUT"), c.left);
  }
  for (const char* parameter : {"EXPRESSION", "MODE", "IGNORE_CASE", "XFORMER_NAME"}) {
    EXPECT_EQ(cfg->parmValueAffectsOutputAttrs(parameter), parameter != QLatin1String("XFORMER_NAME"));
  }
}
