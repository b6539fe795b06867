#include "ScriptRunners.h"
#include <platform/qorxcore/WordEncoding.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

#include <gtest/gtest.h>

namespace {

const QString kPrefix = "CT_WORKSPACE_NAME";

// What the scripts see: a macro of the workspace and one of the instance, under one name.
const QMap<QString, QString> kMacros = {{kPrefix, "CT_1"},
                                        {"A", "outer"},
                                        {"CT_1_A", "inner"},
                                        {"outer", "indirect"},
                                        {"CT_1_inner", "indirect inner"},
                                        {"ORX_HOME", "/home"},
                                        {"HOSTILE", "q\" [exit] $x {a ]b\\ 'c"},
                                        {"CT_1_HOSTILE", "q\" [exit] $x {a ]b\\ 'c"}};

struct ValueCase {
  const char* code;
  QString value;          // without a prefix
  QString instanceValue;  // with one; the same when null
};

struct RefusalCase {
  const char* code;
  long message;
  int line;
  const char* meant;  // the value that the code would have by itself, when it has one
  bool onlyWithPrefix = false;
};

const ValueCase kPythonValues[] = {
    {"'x'", "x", {}},
    {"return 'x'", "x", {}},
    {"return('x')", "x", {}},
    {"1 + 2", "3", {}},
    {"None", "", {}},
    {"x = 5\nx + 1\n# the end\n\n   # really\n", "6", {}},
    {"a = 1 + \\\n    2\na", "3", {}},
    {"1 + \\   \n   2", "3", {}},
    {"x = [1,\n     2, # two\n     3]\nsum(x)", "6", {}},
    {"import os\nif len('a') == 1:\n    return 'early'\nelse:\n    return 'late'", "early", {}},
    {"def f(a, b=2):\n\treturn a * b\n\nf(3)", "6", {}},
    {"for i in range(5):\n  if i == 3:\n    return i", "3", {}},
    {"x = 'a'\r\nx + \\\r\n 'b'\r\n", "ab", {}},
    {"f = lambda a, b=1: a + b\nlambda_ = f(1)\nlambda_", "2", {}},
    {"dict(a=1)['a'] == 1", "True", {}},
    {"'a;b: c = d' ; # note", "a;b: c = d", {}},
    {"'\"' + \"#'\" + '\\\\'", "\"#'\\", {}},
    {"'''one line'''", "one line", {}},
    {"'Straße 😀 <tag> $(X)'", "Straße 😀 <tag> $(X)", {}},
    {"  'indented'", "indented", {}},
    {"ORX_MacroValues['A']", "outer", "inner"},
    {"ORX_MacroValues[ \"A\" ] + ORX_MacroValues['A']", "outerouter", "innerinner"},
    {"ORX_MacroValues['ORX_HOME'] + ORX_MacroValues[\"A\"]", "/homeouter", "/homeinner"},
    {"ORX_MacroValues[ORX_MacroValues['A']]", "indirect", "indirect inner"},
    {"k = 'A'\nORX_MacroValues[k]", "outer", "inner"},
    {"ORX_MacroValues['%s' % 'A']", "outer", "inner"},
    {"f\"{ORX_MacroValues['A']}!\"", "outer!", "inner!"},
    {"x = ORX_MacroValues[\\\n  'A']\nx", "outer", "inner"},
    {"ORX_MacroValues['HOSTILE']", kMacros["HOSTILE"], {}},
};

const RefusalCase kPythonRefusals[] = {
    {"", 370731, 0, nullptr},
    {"# nothing\n\n", 370731, 0, nullptr},
    {"'a\x01'\n'b\rc'", 370732, 2, nullptr},
    {"x = 1\nEND_INCLUDE\nx", 370733, 2, nullptr},
    {"1 + \\\n2 + \\\n3", 370734, 2, "6"},
    {"x = 5 if True\\\nelse 6\nx", 370734, 1, "5"},
    {"# note \\\nx = 1\nx", 370734, 1, "1"},
    {"'a\\\n  b'", 370734, 1, "a  b"},
    {"1 \\", 370734, 1, nullptr},
    {"x = '''a\n  b'''\nx", 370735, 2, "a\n  b"},
    {"x = (1\nx", 370736, 1, nullptr},
    {"x = 1)\nx", 370736, 1, nullptr},
    {"x = (1]\nx", 370736, 1, nullptr},
    {"'open", 370736, 1, nullptr},
    {"'''open", 370736, 1, nullptr},
    {"(1 +\n 2)", 370737, 2, "3"},
    {"returned = 5\nreturned", 370738, 2, "5"},
    {"x = 5", 370738, 1, nullptr},
    {"x = 5\nx <<= 1", 370738, 2, nullptr},
    {"x = 5; x + 1", 370738, 1, nullptr},
    {"if 1: 'x'", 370738, 1, nullptr},
    {"import os", 370738, 1, nullptr},
    {"'ORX_MacroValues[\"A\"]'", 370739, 1, "ORX_MacroValues[\"A\"]", true},
    {"f'{ORX_MacroValues[\"A\"]}'", 370739, 1, "inner", true},
    {"ORX_MacroValues['A' if 0 else 'A']", 370739, 1, "inner", true},
};

const ValueCase kTclValues[] = {
    {"", "", {}},
    {"# nothing\n", "", {}},
    {"abc", "abc", {}},
    {"return [expr {1 + 2}]", "3", {}},
    {"set x 5\n[expr {$x + 1}] ;# the end\n\n  # really", "6", {}},
    {"  set x 5\n  $x  \n", "5", {}},
    {"set x 1\r\n$x\r\n", "1", {}},
    {"if {1} {\n  return early\n}\nlate", "early", {}},
    {"if {0} {\n  return a\n} else {\n  return b\n}", "b", {}},
    {"foreach x {a b} {\n  return $x\n}", "a", {}},
    {"proc twice {x} {\n  set y $x$x\n  return $y\n}\n[twice ab]", "abab", {}},
    {"\"a b\"", "a b", {}},
    {"{a ]b \" $c}", "a ]b \" $c", {}},
    {"returner\nproc returner {} {}\nreturn ok", "!invalid command name \"returner\"", {}},
    {"{Straße €}", "Straße €", {}},
    {"$ORX_MacroValues(A)", "outer", "inner"},
    {"$ORX_MacroValues(A)$ORX_MacroValues(ORX_HOME)[set ORX_MacroValues(A)]", "outer/homeouter",
     "inner/homeinner"},
    {"$ORX_MacroValues($ORX_MacroValues(A))", "indirect", "indirect inner"},
    {"set k A\n[expr {$ORX_MacroValues($k) eq {}}]$ORX_MacroValues($k)", "0outer", "0inner"},
    {"$ORX_MacroValues(HOSTILE)", kMacros["HOSTILE"], {}},
    {"set x \"a\\nb\"\nset n [string length $x]\nset x [llength [split $x \"\\n\"]]\n$x/$n", "2/3", {}},
};

const RefusalCase kTclRefusals[] = {
    {"set x 1\nEND_INCLUDE\n$x", 370733, 2, nullptr},
    {"set x [list a \\\n b]\n$x", 370734, 1, "a b"},
    {"set x \"a\n  b\"\n$x", 370735, 2, "a\n  b"},
    {"set y 1\nset x {a\n  b}\n$x", 370735, 3, "a\n  b"},
    {"if {1} {\nset x 1", 370736, 1, nullptr},
    {"set x 1\n}", 370736, 2, nullptr},
    {"} ; puts \"MACRO B evil\" ; proc ParamFunc {} {", 370736, 1, nullptr},
    {"# a } b\nset x 1\n$x", 370736, 1, "1"},
    {"set x 1\n# a { b\n$x", 370736, 2, "1"},
    {"set x \"open", 370736, 1, nullptr},
    {"set x [open", 370736, 1, nullptr},
    {"foreach x {1 2 3} {\n  if {$x > 1} {\n    return $x\n  }\n}", 370737, 5, "2"},
    {"if {1} {\n  set x 5\n}", 370737, 3, "5"},
    {"switch b {\n  a { return 1 }\n  b { return 2 }\n}", 370737, 4, "2"},
    {"expr {1 +\n2}", 370737, 2, "3"},
    {"expr {1 + 2}", 370738, 1, "3"},
    {"set x 5; format 7", 370738, 1, "7"},
    {"${ORX_MacroValues(A)}", 370739, 1, "inner", true},
    {"return \"a\\nb\"", 371346, 1, nullptr},
    {"set y [list x \\r]\n$y", 371346, 2, nullptr},
    {"append x [join {a b} \\n]\nif {1} {\n  return $x\n}\n$x", 371346, 3, nullptr},
};

using Generator = void (*)(const QString&, const QString&, const QString&, QStringList&);
using Check = bool (*)(const QString&, const QString&, const QString&, QString&);

QStringList blockOf(Generator generate, const QString& prefix, const char* code) {
  QStringList lines;
  generate(prefix, "P", QORXWwjdEncode(QString::fromUtf8(code)), lines);
  return lines;
}

QMap<QString, QString> expectedMacros(const QString& name, const QString& value) {
  return value.startsWith('!') ? QMap<QString, QString>{{"!", value.mid(1)}}
                               : QMap<QString, QString>{{name, value}};
}

// Every case without and with a prefix, as generated and as the buffer leaves it.
template <std::size_t N>
void checkValues(Generator generate, Check canWrite, const ValueCase (&cases)[N],
                 QVector<QMap<QString, QString>> (*run)(const QVector<ScriptRun>&)) {
  QVector<ScriptRun> runs;
  QVector<QMap<QString, QString>> expected;
  QStringList described;
  for (const ValueCase& c : cases) {
    for (const QString& prefix : {QString(), kPrefix}) {
      QString reason;
      EXPECT_TRUE(canWrite(prefix, "P", QORXWwjdEncode(QString::fromUtf8(c.code)), reason))
          << c.code << ": " << reason.toStdString();
      const QStringList block = blockOf(generate, prefix, c.code);
      const bool isInstance = !prefix.isEmpty();
      for (const QStringList& lines : {block, asFlushed(block)}) {
        runs.append({lines, kMacros});
        expected.append(expectedMacros(isInstance ? "CT_1_P" : "P",
                                       isInstance && !c.instanceValue.isNull() ? c.instanceValue : c.value));
        described.append(lines.join('\n'));
      }
    }
  }
  const QVector<QMap<QString, QString>> results = run(runs);
  ASSERT_EQ(results.size(), expected.size());
  for (int i = 0; i < results.size(); ++i) {
    EXPECT_EQ(results[i], expected[i]) << described[i].toStdString();
  }
}

// A refusal names its reason and line; and where the code means something by itself, the block would not give
// it.
template <std::size_t N>
void checkRefusals(Generator generate, Check canWrite, const RefusalCase (&cases)[N],
                   QVector<QMap<QString, QString>> (*run)(const QVector<ScriptRun>&)) {
  QVector<ScriptRun> runs;
  QVector<QMap<QString, QString>> meant;
  for (const RefusalCase& c : cases) {
    for (const QString& prefix : {QString(), kPrefix}) {
      QString reason;
      const bool can = canWrite(prefix, "P", QORXWwjdEncode(QString::fromUtf8(c.code)), reason);
      const bool isRefused = !prefix.isEmpty() || !c.onlyWithPrefix;
      EXPECT_EQ(can, !isRefused) << c.code;
      if (isRefused) {
        const QString why = c.line > 0 ? TransformResString(c.message, QString::number(c.line))
                                       : TransformResString(c.message);
        EXPECT_EQ(reason.toStdString(), TransformResString(370613, {"P", why}).toStdString()) << c.code;
      }
    }
    if (c.meant != nullptr) {
      runs.append({asFlushed(blockOf(generate, kPrefix, c.code)), kMacros});
      meant.append({{"CT_1_P", QString::fromUtf8(c.meant)}});
    }
  }
  const QVector<QMap<QString, QString>> results = run(runs);
  ASSERT_EQ(results.size(), meant.size());
  for (int i = 0; i < results.size(); ++i) {
    EXPECT_NE(results[i], meant[i]) << runs[i].block.join('\n').toStdString();
  }
}

QVector<QMap<QString, QString>> runTclBlocks(const QVector<ScriptRun>& runs) {
  QVector<QMap<QString, QString>> results;
  for (const ScriptRun& run : runs) {
    results.append(runTclBlock(run));
  }
  return results;
}

}  // namespace

TEST(ScriptBlocks, PythonBlocksDefineTheirMacros) {
  checkValues(getPythonParameterLines, canWritePythonParameter, kPythonValues, runPythonBlocks);
}

TEST(ScriptBlocks, PythonRefusals) {
  checkRefusals(getPythonParameterLines, canWritePythonParameter, kPythonRefusals, runPythonBlocks);
}

TEST(ScriptBlocks, TclBlocksDefineTheirMacros) {
  checkValues(getTclParameterLines, canWriteTclParameter, kTclValues, runTclBlocks);
}

TEST(ScriptBlocks, TclRefusals) {
  checkRefusals(getTclParameterLines, canWriteTclParameter, kTclRefusals, runTclBlocks);
}

TEST(ScriptBlocks, ExactText) {
  QStringList lines{"before"};
  getPythonParameterLines("PRE", "P", QORXWwjdEncode("a = 1 + \\\n  2 \n\nORX_MacroValues['A']  \n# end"),
                          lines);
  EXPECT_EQ(lines, (QStringList{"before", "INCLUDE PYTHON", "def ParamFunc():", "  a = 1 + 2", "  ", "  ",
                                "  return ORX_MacroValues[ORX_MacroValues['PRE'] + '_' + 'A']", "  # end",
                                "value = ParamFunc()", "macroName = ORX_MacroValues['PRE'] + '_P'",
                                "if value == None:", "  return { macroName : '' }",
                                "else:", "  return { macroName : str(value) }", "END_INCLUDE"}));
  lines.clear();
  getTclParameterLines("PRE", "P", QORXWwjdEncode("  set a $ORX_MacroValues(A)\n\n\t$a "), lines);
  EXPECT_EQ(lines,
            (QStringList{"INCLUDE TCL", "proc ParamFunc {} {", " upvar ORX_MacroValues ORX_MacroValues",
                         "set a $ORX_MacroValues($ORX_MacroValues(PRE)_A)", "", "return $a", "}",
                         "set macroName \"$ORX_MacroValues(PRE)_P\"",
                         "puts \"MACRO $macroName [ParamFunc]\" ", "END_INCLUDE"}));
}

TEST(ScriptBlocks, NamesCannotBreakOut) {
  struct NameCase {
    QString prefix;
    QString name;
    bool python;
    bool tcl;
  };
  const NameCase cases[] = {{"", "P", true, true},
                            {"", "Größe-1.b", true, true},
                            {"", "", false, false},
                            {"", "a b", false, false},
                            {"", "a'b", false, false},
                            {"", "a\"b", false, false},
                            {"", "a[exit]", false, false},
                            {"", "a\\", false, false},
                            {"", "$a", false, false},
                            {"", "a\nb", false, false},
                            {"", QString(QChar(0xd800)), false, false},
                            {"Bob's_WORKSPACE_NAME", "P", false, true},
                            {"F_(2)_WORKSPACE_NAME", "P", true, false},
                            {"F]_WORKSPACE_NAME", "P", true, false},
                            {"F\\_WORKSPACE_NAME", "P", false, false}};
  for (const NameCase& c : cases) {
    QString reason;
    EXPECT_EQ(canWritePythonParameter(c.prefix, c.name, "1", reason), c.python) << c.name.toStdString();
    EXPECT_EQ(canWriteTclParameter(c.prefix, c.name, "1", reason), c.tcl) << c.name.toStdString();
    EXPECT_EQ(reason.isEmpty(), c.python && c.tcl) << c.name.toStdString();
  }
}

TEST(ScriptBlocks, HugeAndDeepScriptsEnd) {
  for (const char* piece :
       {"[", "$a(", "{", "\"", "ORX_MacroValues[", "$ORX_MacroValues(", "(", "'''", "\\\n"}) {
    const QString code = QORXWwjdEncode(QString(piece).repeated(100000));
    for (const Check canWrite : {canWritePythonParameter, canWriteTclParameter}) {
      QString reason;
      const bool can = canWrite(kPrefix, "P", code, reason);
      EXPECT_EQ(can, reason.isEmpty()) << piece;
    }
    QStringList lines;
    getPythonParameterLines(kPrefix, "P", code, lines);
    getTclParameterLines(kPrefix, "P", code, lines);
    EXPECT_GT(lines.size(), 10) << piece;
  }
  QString reason;
  EXPECT_FALSE(canWriteTclParameter("", "P", QORXWwjdEncode(QString("[").repeated(100000)), reason));
  EXPECT_EQ(reason, TransformResString(370613, {"P", TransformResString(370729)}));
}
