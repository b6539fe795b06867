// Parses Tcl scripts with the Tcl library, without running them: commands, the bodies of procedures and of
// the usual control structures, and expressions in braces.
#pragma once

#include <QString>

// The line, from 1, at which the script cannot be parsed, and why; an empty text when it is sound.
struct TclFault {
  int line = 0;
  QString text;
};

TclFault findTclFault(const QString& script);
