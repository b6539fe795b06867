#include <tests/core/ConfigHelpers.h>
#include <transform/core/definition/DependencyChecker.h>

#include <QElapsedTimer>
#include <QTextStream>
#include <gtest/gtest.h>

namespace {

TEST(ConfigDependencies, AnswersOfScripts) {
  qputenv("ORX_TEST_VARIABLE", "set to this");
  qputenv("TCL_LIBRARY", "/some where");
  const struct {
    const char* script;
    const char* message;
  } cases[] = {
      {"", ""},
      {"return {}", ""},
      {"return {Needs the licence}", "Needs the licence"},
      {"set a 1; if {$a + 1 == 2} {return ok} else {return bad}", "ok"},
      {"catch {error {not there}} why; set why", "not there"},
      {"set n 0; foreach x {1 2 3} {incr n $x}; switch $n {6 {return six} default {return other}}", "six"},
      {"ORX_EncodeText {a b/c}", "a<space>b<solidus>c"},
      {"ORX_DecodeText a<space>b", "a b"},
      {"ORX_DecodeText [ORX_EncodeText Zürich]", "Zürich"},
      {"ORX_EncodeText",
       "Tcl error: ORX_EncodeText procedure requires one parameter -- the value to be encoded\n"},
      {"ORX_DecodeText a b",
       "Tcl error: ORX_DecodeText procedure requires one parameter -- the value to be decoded\n"},
      {"orx_env ORX_TEST_VARIABLE", "set to this"},
      {"orx_env ORX_TEST_NO_SUCH_VARIABLE", ""},
      {"set ::auto_path", "/some where"},
      {"orx_fileExists /no/such/file", "0"},
      {"orx_fileExists /", "1"},
      {"orx_programInPath sh", "1"},
      {"orx_programInPath /bin/sh", "0"},
      {"orx_programInPath no-such-program-here", "0"},
      {"orx_hasPackage no-such-package-here", "0"},
      {"orx_hasPackage Tcl", "1"},
      {"error {my own}", "Tcl error: my own\n"},
      {"string match a*c abc", "1"},
      {"if {[catch {exec ls}]} {return no}", "no"},
  };
  for (const auto& c : cases) {
    const DependencyChecker::Verdict verdict = DependencyChecker::check({qs(c.script)});
    EXPECT_EQ(verdict.message, qs(c.message)) << c.script;
    EXPECT_EQ(verdict.isMet, *c.message == '\0') << c.script;
  }
}

TEST(ConfigDependencies, TheFirstAnswerCounts) {
  const DependencyChecker::Verdict verdict =
      DependencyChecker::check({qs("set a {}"), qs("return first"), qs("return second")});
  EXPECT_EQ(verdict.message, qs("first"));
  EXPECT_TRUE(DependencyChecker::check(
                  {qs("set kept 1; return {}"), qs("if {[catch {set kept}]} {return {}}; return shared")})
                  .isMet)
      << "scripts do not see each other";
}

TEST(ConfigDependencies, TheVerdictIsRecordedAndTold) {
  TransformerDefinition definition = makeDefinition({});
  definition.dependencyScripts << qs("nonsense");
  QString text;
  QTextStream log(&text);
  TransformerCfg cfg;
  cfg.configure(definition, nullptr, &log);
  log.flush();
  EXPECT_FALSE(cfg.dependencyMet());
  EXPECT_EQ(cfg.dependencyMsg(), qs("Tcl error: invalid command name \"nonsense\"\n"));
  EXPECT_TRUE(text.contains(qs("Tcl error: invalid command name"))) << text.toStdString();
}

// Each would reach the system, or never end, or take all memory, or crash the interpreter.
TEST(ConfigDependencies, HarmfulScriptsAreStopped) {
  const QString deep(5000, QLatin1Char('['));
  const QString longWord(5000, QLatin1Char('x'));
  const QStringList scripts = {
      qs("exec ls"),
      qs("open /etc/passwd"),
      qs("source /etc/passwd"),
      qs("file delete /tmp/x"),
      qs("socket localhost 1"),
      qs("load x.so"),
      qs("cd /"),
      qs("glob *"),
      qs("exit"),
      qs("interp create"),
      qs("interp invokehidden {} exec ls"),
      qs("rename set x"),
      qs("namespace eval ::tcl {}"),
      qs("after 1000000"),
      qs("vwait x"),
      qs("package require x"),
      qs("trace add variable x write y"),
      qs("info commands"),
      qs("encoding names"),
      qs("uplevel 1 {}"),
      qs("::tcl::string::repeat a 1000000000"),
      qs("string repeat a 2000000000"),
      qs("regexp a b"),
      qs("lsearch -regexp a b"),
      qs("switch -regex a {a b}"),
      qs("binary format a1000000000 x"),
      qs("format %1000000000d 1"),
      qs("lrepeat 1000000000 a"),
      qs("clock seconds"),
      qs("chan names"),
      qs("::tcl::mathop::** 2 100000000"),
      qs("::tcl::file::delete x"),
      qs("::tcl::clock::add 1"),
      qs("while 1 {}"),
      qs("while 1 {catch {error x}}"),
      qs("for {} 1 {} {set a 1}"),
      qs("set f {if 1 $f}; if 1 $f"),
      qs("set x a; while 1 {append x $x}"),
      qs("set x a; while 1 {set x $x$x}"),
      qs("while 1 {lappend x a a a a a a a a}"),
      qs("switch -r a {a b}"),
      qs("proc f {} {}"),
      qs("::oo::class create a"),
      qs("::tcl::unsupported::assemble {push 1}"),
      qs("set l a; while 1 {lappend l {*}$l}"),
      qs("set l a; while 1 {catch {expr {\"$l$l\"}} l; append l $l}"),
      qs("expr {2**100000000}"),
      qs("expr {1<<1000000000}"),
      qs("set x 7; while 1 {set x [expr {$x*$x}]}"),
      qs("string match *a*a*a*a*a*b ") + QString(500, QLatin1Char('a')),
      qs("set x ") + longWord,
      qs("while 1 { catch { while 1 {} } }"),
      deep,
      qs("if 1 {") + deep,
      qs("set x ") + QString(100000, QLatin1Char('y')),
      QString(20, QLatin1Char('{')),
      qs("set a("),
      qs("expr {((((("),
  };
  for (const QString& script : scripts) {
    QElapsedTimer timer;
    timer.start();
    const DependencyChecker::Verdict verdict = DependencyChecker::check({script});
    EXPECT_FALSE(verdict.isMet) << script.left(60).toStdString();
    EXPECT_TRUE(verdict.message.startsWith(qs("Tcl error: ")))
        << script.left(60).toStdString() << " answered " << verdict.message.left(80).toStdString();
    EXPECT_LT(timer.elapsed(), 10000) << script.left(60).toStdString();
  }
}

}  // namespace
