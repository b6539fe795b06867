// A Tcl interpreter for scripts from strangers: no way to the system but a few questions, and bounds on
// commands, time, memory and whatever a single command could blow up.
#pragma once

#include <QByteArrayList>
#include <QString>

struct Tcl_Interp;

class SafeTclInterpreter {
 public:
  SafeTclInterpreter();
  ~SafeTclInterpreter();
  SafeTclInterpreter(const SafeTclInterpreter&) = delete;
  SafeTclInterpreter& operator=(const SafeTclInterpreter&) = delete;

  // Runs the script once. False when it failed or was stopped; `result` is then the error.
  bool evaluate(const QString& script, QString& result);

 private:
  void removeUnlistedCommands();
  QByteArrayList listOf(const char* script);
  void addCommands();

  Tcl_Interp* m_interp;
};
