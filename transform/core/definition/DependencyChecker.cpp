#include <transform/core/definition/DependencyChecker.h>
#include <transform/core/definition/SafeTclInterpreter.h>

DependencyChecker::Verdict DependencyChecker::check(const QStringList& scripts) {
  for (const QString& script : scripts) {
    SafeTclInterpreter interpreter;
    QString result;
    if (!interpreter.evaluate(script, result)) {
      return {false, QString::asprintf("Tcl error: %s\n", result.toUtf8().constData())};
    }
    if (!result.isEmpty()) {
      return {false, result};
    }
  }
  return {};
}
