// Parses Tcl scripts with the Tcl library, without running them: commands, the bodies of procedures and of
// the usual control structures, and expressions in braces.
#pragma once

#include <platform/Export.h>

#include <QString>

// Where the script cannot be parsed, and why; an empty text when it is sound.
struct TclFault {
  int line = 0;    // from 1
  int offset = 0;  // of the command, in bytes of UTF-8
  QString text;
};

ORX_EXPORT TclFault findTclFault(const QString& script);
