// Finds results of Tcl scripts that are known to hold a line break, without running anything.
#pragma once

class QByteArray;

// Where the command begins that gives such a result; null when none is known to. What only the running script
// tells is not found: the results of commands other than those that put texts together, and of loops.
const char* findResultWithLineBreak(const QByteArray& script);
