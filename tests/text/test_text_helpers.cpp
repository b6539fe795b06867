#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/TextHelpers.h>

#include <gtest/gtest.h>

namespace {

struct TextCase {
  QString given;
  QString expected;
};

void check(QString (*function)(const QString&), const std::vector<TextCase>& cases) {
  for (const TextCase& c : cases) {
    EXPECT_EQ(function(c.given).toStdString(), c.expected.toStdString()) << c.given.toStdString();
  }
}

}  // namespace

TEST(TextHelpers, MacroNames) {
  check(safeMacroName, {{"a b&c,d@e\\f/g", "a_b_c_d_e_f_g"}, {"Ab9.-:()'\tß", "Ab9.-:()'\tß"}, {"", ""}});
  check(makePrefixMacro, {{"My Filter/2", "My_Filter_2_WORKSPACE_NAME"}});
}

TEST(TextHelpers, ColumnsNeverTouch) {
  EXPECT_EQ(makeColumnString("ab", "c", 4), "ab   c");
  EXPECT_EQ(makeColumnString("abcd", "c", 4), "abcd c");
  EXPECT_EQ(makeColumnString("abcdefgh", "c", 4), "abcdefgh c");
  EXPECT_EQ(makeColumnString("", "c", -3), " c");
}

TEST(TextHelpers, QuotesValues) {
  check(quotifyStringForMF, {{"", "\"\""},
                             {"plain", "plain"},
                             {"line\nfeed", "line\nfeed"},
                             {"a b", "\"a b\""},
                             {"a\tb", "\"a\tb\""},
                             {"f(x)", "\"f(x)\""},
                             {"\"", "\"\\\"\""},
                             {"say \"x\"", "\"say \\\"x\\\"\""},
                             {"\"whole\"", "\"\\\"whole\\\"\""},
                             {"c:\\dir", "\"c:\\dir\""},
                             {"c:\\", "\"c:\\\\\""},
                             {"\\\\\\", "\"\\\\\\\\\\\\\""}});
  EXPECT_EQ(quotifyString("a,b", ","), "\"a,b\"");
  EXPECT_EQ(quotifyString("a b", ","), "a b");
}

TEST(TextHelpers, QuotesAttributeNames) {
  check(quotifyDefAttrName, {{"name", "name"},
                             {"\"", "\"\\\"\""},
                             {"two words", "\"\"two words\"\""},
                             {"\"own\"", "\\\"\\\"own\\\"\\\""},
                             {"\"\"", "\\\"\\\"\\\"\\\""},
                             {"half\"", "\"half\\\"\""},
                             {"x(1)", "\"x(1)\""}});
}

TEST(TextHelpers, EscapesUserTexts) {
  check(decodeUserString, {{"a\nb", "a\\nb"},
                           {"\a\b\t\n\v\f\r", "\\a\\b\\t\\n\\v\\f\\r"},
                           {"\\n", "\\\\n"},
                           {"Straße 😀\x06\x0e", "Straße 😀\x06\x0e"}});
  check(encodeUserString,
        {{"a\\nb", "a\nb"}, {"\\q", "\\q"}, {"end\\", "end\\"}, {"\\\\n", "\\n"}, {"\\\\\\", "\\\\"}});
  const QString every = "\\\a\b\t\n\v\f\r\\n\\\\é😀";
  EXPECT_EQ(encodeUserString(decodeUserString(every)), every);
}

TEST(TextHelpers, SplitsLists) {
  QStringList out{"old"};
  stringToList(",,a, b,,c,", out, ',');
  EXPECT_EQ(out, (QStringList{"a", " b", "c"}));
  stringToList(",,", out, ',');
  EXPECT_TRUE(out.isEmpty());
}

TEST(TextHelpers, StripsBasicStringInfo) {
  check(stripBasicStringInfo, {{"plain:text", "plain:text"},
                               {"orx_basicstring:utf-8:text", "text"},
                               {"a orx_basicstring:x:b orx_basicstring:y:c", "a b c"},
                               {"orx_basicorx_basicstring:x:string:y:z", "z"},
                               {"a orx_basicstring:open", "a open"},
                               {"orx_basicstring:orx_basicstring:a:b", "a:b"},
                               {"ORX_BASICSTRING:x:b", "ORX_BASICSTRING:x:b"}});
  const QString many = QString("orx_basicstring:x:").repeated(200000);
  EXPECT_EQ(stripBasicStringInfo(many + "end"), "end");
}

TEST(TextHelpers, ReadsPortDescriptions) {
  struct PortCase {
    const char* text;
    bool ok, isFeature, isOutput;
    unsigned first, second;
    const char* name;
  };
  const PortCase cases[] = {{"fo 3", true, true, true, 3, 8, ""},
                            {"  fi   12  A<space>B rest", true, true, false, 12, 8, "A B"},
                            {"ao 1", true, false, true, 1, 8, ""},
                            {"ai 1 2", true, false, false, 1, 2, ""},
                            {"ai 4294967295 2 x", true, false, false, 4294967295U, 2, "x"},
                            {"xo 3", false, false, false, 7, 8, ""},
                            {"fx 3", false, false, false, 7, 8, ""},
                            {"fo", false, false, false, 7, 8, ""},
                            {"f 3", false, false, false, 7, 8, ""},
                            {"fo -1 x", false, false, false, 7, 8, ""},
                            {"ao 1 two x", false, false, false, 7, 8, ""},
                            {"", false, false, false, 7, 8, ""}};
  for (const PortCase& c : cases) {
    bool isFeature = false;
    bool isOutput = false;
    unsigned first = 7;
    unsigned second = 8;
    QString name;
    EXPECT_EQ(decodePortDescription(c.text, isFeature, isOutput, first, second, name), c.ok) << c.text;
    EXPECT_EQ(std::tie(isFeature, isOutput, first, second),
              std::tie(c.isFeature, c.isOutput, c.first, c.second))
        << c.text;
    EXPECT_EQ(name, c.name) << c.text;
  }
}

TEST(TextHelpers, BuiltInMacrosAreFoundByEitherName) {
  QStringList names;
  QStringList shown;
  for (const GlobalMacro& macro : globalMacros()) {
    names << macro.name;
    shown << macro.displayName;
    EXPECT_EQ(globalMacroName(macro.name), macro.name);
    EXPECT_EQ(globalMacroName(macro.displayName), macro.name);
    EXPECT_FALSE(isGlobalMacro(macro.displayName));
  }
  EXPECT_EQ(names.removeDuplicates() + shown.removeDuplicates(), 0);
  for (const char* name : {"ORX_HOME", "WORKSPACE_NAME", "ORX_MF_NAME", "ORX_BUILD_NUM"}) {
    EXPECT_TRUE(isGlobalMacro(name)) << name;
  }
  EXPECT_EQ(globalMacroName("orx_home"), QString());
}
