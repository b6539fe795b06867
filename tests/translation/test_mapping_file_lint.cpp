// Mapping files of any content end in findings: quickly, with bounded memory, whatever stands in them.
#include <tests/support/Files.h>
#include <tests/support/QtPrinters.h>
#include <translation/MappingFileLint.h>

#include <QElapsedTimer>
#include <QMap>
#include <QTemporaryDir>
#include <gtest/gtest.h>

namespace {

// The rules of the findings, with the line of the first of each; "*" behind those that were found more often.
QStringList rulesOf(const QByteArray& text) {
  QTemporaryDir folder;
  const QString path = folder.filePath("f.mf");
  put(path, text);
  const MappingFileFindings result = lintMappingFile(path, "f.mf", {});
  EXPECT_EQ(result.readError, QString());
  QStringList rules;
  QMap<QString, int> places;
  for (const orx::Finding& finding : result.findings) {
    const QString rule = orx::ruleRow(finding.rule).name;
    EXPECT_LT(finding.text.size(), 1000);
    if (places.contains(rule)) {
      if (!rules[places.value(rule)].endsWith('*'))
        rules[places.value(rule)] += '*';
      continue;
    }
    places.insert(rule, rules.size());
    rules << rule + ":" + QString::number(finding.line);
  }
  return rules;
}

QByteArray times(int count, const char* text) {
  return QByteArray(text).repeated(count);
}

TEST(MappingFileLint, EndsWithAFindingWhateverTheFileHolds) {
  constexpr int kMany = 1000 * 1000;
  QByteArray deep;
  for (int depth = 0; depth < 70; ++depth)
    deep += times(depth, "# ") + "# TRANSFORMER_BEGIN A" + QByteArray::number(depth) + ",1,T\n";
  QByteArray growing = "MACRO A0 " + times(200, "x") + "\n";
  for (int i = 1; i < 40; ++i)
    growing += "MACRO A" + QByteArray::number(i) + ' ' +
               ("$(A" + QByteArray::number(i - 1) + ')').repeated(36) + "\n";
  const struct {
    const char* name;
    QByteArray text;
    QStringList rules;
  } cases[] = {
      {"empty", "", {}},
      {"a long line", "MACRO A 1\n" + times(100 * kMany, "x") + "\nMACRO\n", {"long-statement:2"}},
      {"a long statement",
       times(9 * kMany, "ab\\\n") + "c\nMACRO\n",
       {"long-statement:1", "bad-statement:9000002"}},
      {"backslashes", times(kMany, "\\\n"), {"cut-continuation:1000000"}},
      {"parentheses",
       "FACTORY_OPTION A B @Value(" + times(kMany, "("),
       {"open-function:1", "unknown-factory:1"}},
      {"calls", "FACTORY_OPTION A B x" + times(kMany, "@Value("), {"open-function:1", "unknown-factory:1"}},
      {"quotes",
       "FACTORY_OPTION A B " + times(kMany, "\"\\"),
       {"cut-continuation:1", "open-quote:1", "unknown-factory:1"}},
      {"braces", "Tcl2 " + times(kMany, "{"), {"tcl-syntax:1"}},
      {"brackets", "Tcl2 " + times(kMany, "["), {"tcl-syntax:1"}},
      {"references", "FACTORY_OPTION A B " + times(kMany, "$("), {"open-reference:1", "unknown-factory:1"}},
      {"nested references",
       "MACRO A " + times(kMany, "$(") + "A" + times(kMany, ")"),
       {"open-reference:1", "unknown-reference:1*"}},
      {"deferred references", "MACRO A " + times(kMany, "$["), {}},
      {"values inside values", growing, {}},
      {"deep blocks", deep, {"open-block:1*", "unused-definition:2*", "deep-block:65"}},
      {"null characters",
       QByteArray("\0\0\n", 3).repeated(kMany),
       {"bad-character:1", "unknown-statement:1*", "too-many-findings:20000"}},
      {"two bytes a character",
       QByteArray("\xff\xfeM\0A\0C\0\n\0", 10),
       {"not-utf8:1", "bad-character:1", "unknown-statement:1*"}},
      {"words", "FACTORY_DEF * A FACTORY_NAME B " + times(kMany, "x "), {"bad-clause:1"}},
      {"blocks",
       times(kMany / 10, "# TRANSFORMER_BEGIN A,1,T\n# TRANSFORMER_END\n"),
       {"repeated-definition:3*", "too-many-findings:40003"}},
      {"includes",
       times(kMany / 10, "INCLUDE_CUSTOM_TRANSFORMER_VER A:1\n"),
       {"unknown-reference:1*", "too-many-findings:20001"}},
      {"garbage", times(kMany, "no words\n"), {"unknown-statement:1*", "too-many-findings:20001"}},
  };
  for (const auto& test : cases) {
    QElapsedTimer timer;
    timer.start();
    const QStringList rules = rulesOf(test.text);
    EXPECT_EQ(rules, test.rules) << test.name;
    EXPECT_LT(timer.elapsed(), 60000) << test.name;
  }
}

}  // namespace
