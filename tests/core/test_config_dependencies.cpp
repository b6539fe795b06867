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
    const DependencyChecker::Verdict verdict = DependencyChecker::check({c.script});
    EXPECT_EQ(verdict.message, c.message) << c.script;
    EXPECT_EQ(verdict.isMet, *c.message == '\0') << c.script;
  }
}

TEST(ConfigDependencies, TheFirstAnswerCounts) {
  EXPECT_EQ(DependencyChecker::check({"set a {}", "return first", "return second"}).message, "first");
  const QStringList separate{"set kept 1; return {}", "if {[catch {set kept}]} {return {}}; return shared"};
  EXPECT_TRUE(DependencyChecker::check(separate).isMet) << "scripts do not see each other";
}

TEST(ConfigDependencies, TheVerdictIsRecordedAndTold) {
  TransformerDefinition definition = makeDefinition({});
  definition.dependencyScripts << "nonsense";
  QString text;
  QTextStream log(&text);
  TransformerCfg cfg;
  cfg.configure(definition, nullptr, &log);
  log.flush();
  EXPECT_FALSE(cfg.dependencyMet());
  EXPECT_EQ(cfg.dependencyMsg(), "Tcl error: invalid command name \"nonsense\"\n");
  EXPECT_TRUE(text.contains("Tcl error: invalid command name")) << text.toStdString();
}

// Each would reach the system, or never end, or take all memory, or crash the interpreter.
TEST(ConfigDependencies, HarmfulScriptsAreStopped) {
  const QString deep(5000, QLatin1Char('['));
  QStringList scripts =
      QString(
          "exec ls|open /etc/passwd|source /etc/passwd|file delete /tmp/x|socket localhost 1|load x.so|cd /"
          "|glob *|exit|interp create|interp invokehidden {} exec ls|rename set x|namespace eval ::tcl {}"
          "|after 1000000|vwait x|package require x|trace add variable x write y|info commands"
          "|encoding names|uplevel 1 {}|::tcl::string::repeat a 1000000000|string repeat a 2000000000"
          "|regexp a b|lsearch -regexp a b|switch -regex a {a b}|binary format a1000000000 x"
          "|format %1000000000d 1|lrepeat 1000000000 a|clock seconds|chan names"
          "|::tcl::mathop::** 2 100000000|::tcl::file::delete x|::tcl::clock::add 1|while 1 {}"
          "|while 1 {catch {error x}}|for {} 1 {} {set a 1}|set f {if 1 $f}; if 1 $f"
          "|set x a; while 1 {append x $x}|set x a; while 1 {set x $x$x}|while 1 {lappend x a a a a a a a a}"
          "|switch -r a {a b}|proc f {} {}|::oo::class create a|::tcl::unsupported::assemble {push 1}"
          "|set l a; while 1 {lappend l {*}$l}|set l a; while 1 {catch {expr {\"$l$l\"}} l; append l $l}"
          "|expr {2**100000000}|expr {1<<1000000000}|set x 7; while 1 {set x [expr {$x*$x}]}"
          "|while 1 { catch { while 1 {} } }|set a(|expr {(((((")
          .split(QLatin1Char('|'));
  scripts << QString("string match *a*a*a*a*a*b ") + QString(500, QLatin1Char('a'))
          << QString("set x ") + QString(5000, QLatin1Char('x')) << deep << QString("if 1 {") + deep
          << QString("set x ") + QString(100000, QLatin1Char('y')) << QString(20, QLatin1Char('{'));
  for (const QString& script : scripts) {
    QElapsedTimer timer;
    timer.start();
    const DependencyChecker::Verdict verdict = DependencyChecker::check({script});
    EXPECT_FALSE(verdict.isMet) << script.left(60).toStdString();
    EXPECT_TRUE(verdict.message.startsWith("Tcl error: "))
        << script.left(60).toStdString() << " answered " << verdict.message.left(80).toStdString();
    EXPECT_LT(timer.elapsed(), 10000) << script.left(60).toStdString();
  }
}

}  // namespace
