#include "SpecialisedSetup.h"
#include <transform/text/MessageStrings.h>

#include <gtest/gtest.h>

namespace {

const char kReference[] = "@Value<leftparenthesis>id<rightparenthesis>";
const char kWritten[] = "@EvaluateExpression(FDIV,STRING_ENCODED,MAPPING.RIGHT,@Value(id))";

std::unique_ptr<TransformerCfg> mapperWith(const QString& mapping, const char* direction = "FORWARD") {
  auto cfg = makeShipped("AttributeValueMapper");
  cfg->setInputAttributes("INPUT", {"id"});
  EXPECT_TRUE(cfg->setParameterValue("MAPPING", mapping, false));
  EXPECT_TRUE(cfg->setParameterValue("DIRECTION", direction, false));
  EXPECT_TRUE(cfg->setParameterValue("SOURCE_ATTRIBUTE", "id", false));
  return cfg;
}

}  // namespace

TEST(ValueMapper, RowsAreCheckedAndWritten) {
  struct Case {
    QString mapping;
    const char* direction;
    QString refusal;
    QStringList options;
  };
  const QString reference = kReference;
  const Case cases[] = {
      {"a;b;c;d", "FORWARD", "", {"MAP a b", "MAP c d"}},
      {"a;b;c;d", "From right to left", "", {"MAP b a", "MAP d c"}},
      {"a;b;c;b", "FORWARD", "", {"MAP a b", "MAP c b"}},
      {"a;b;c;b", "BACKWARD", TransformResString(370706, "b"), {"MAP b a", "MAP b c"}},
      {"x<space>y;1;x<space>y;2",
       "FORWARD",
       TransformResString(370706, "x y"),
       {"MAP x<space>y 1", "MAP x<space>y 2"}},
      {"\"\";none;a", "FORWARD", "", {"MAP \"\" none", "MAP a \"\""}},
      {"a;" + reference, "FORWARD", "", {QString("MAP a ") + kWritten}},
      {"a;" + reference,
       "BACKWARD",
       TransformResString(370707, "Mapped Value"),
       {QString("MAP ") + kWritten + " a"}},
      {reference + ";a", "FORWARD", TransformResString(370707, "Source Value"), {}},
      {"$(A);1;$(B);2", "FORWARD", "", {"MAP $(A) 1", "MAP $(B) 2"}},
      {"", "FORWARD", TransformResString(370608, "Values"), {}},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.mapping.toStdString() + " " + c.direction);
    const auto cfg = mapperWith(c.mapping, c.direction);
    EXPECT_EQ(refusalOf(*cfg, "MAPPING"), c.refusal);
    QStringList options;
    for (const QString& statement : statementsOf(*cfg)) {
      if (statement.startsWith("FACTORY_OPTION Attribute")) {
        options << statement.section(' ', 2);
      }
    }
    if (!c.options.isEmpty()) {
      EXPECT_EQ(options, c.options);
    }
  }
}

TEST(ValueMapper, WhatTheEditorMayOffer) {
  const auto forward = mapperWith("a;b");
  const auto backward = mapperWith("a;b", "BACKWARD");
  EXPECT_TRUE(forward->parameterSupportsAttributeReference("MAPPING"));
  EXPECT_FALSE(backward->parameterSupportsAttributeReference("MAPPING"));
  EXPECT_TRUE(backward->parameterSupportsAttributeReference("DEFAULT_VALUE"));
  EXPECT_EQ(forward->getSupportedValueTypes("MAPPING"), QStringList({"CONSTANT", "ATTRIBUTE"}));
  EXPECT_EQ(backward->getSupportedValueTypes("MAPPING"), QStringList("CONSTANT"));
  EXPECT_EQ(forward->getSupportedValueTypes("DIRECTION"), QStringList("CONSTANT"));
  EXPECT_TRUE(forward->getSupportedValueTypes("DEFAULT_VALUE").contains("CONDITIONAL"));
  EXPECT_TRUE(forward->canCreateGlobalParameter("DEFAULT_VALUE"));
}

TEST(ValueMapper, MarkedAttributesAreUpgraded) {
  const auto cfg = mapperWith("a;&id;b;c");
  cfg->autoUpgradeTransformer();
  EXPECT_EQ(cfg->getParameterValue("MAPPING"),
            "a;<commercialat>Value<leftparenthesis>id<rightparenthesis>;b;c");
  EXPECT_TRUE(cfg->isAutoUpgraded());
  const auto current = mapperWith("a;b&c");
  current->autoUpgradeTransformer();
  EXPECT_EQ(current->getParameterValue("MAPPING"), "a;b&c");
  EXPECT_FALSE(current->isAutoUpgraded());
}

TEST(ValueMapper, AnUnclosedReferenceIsNotWritten) {
  EXPECT_FALSE(isWritten(*mapperWith("a;$[x")));
  EXPECT_TRUE(isWritten(*mapperWith("a;$[x]")));
}
