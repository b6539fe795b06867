// What dependency checks may ask about the system. All of it reads only. Answers are texts: "1" and "0" for
// yes and no.
#pragma once

#include <QString>

QString askFileExists(const QString& path);
// Empty when the variable is not set.
QString askEnvironment(const QString& name);
QString askProgramInPath(const QString& program);
// Looks for the package in the folders of the Tcl library, without running anything.
QString askTclPackage(const QString& name);

// The folder that TCL_LIBRARY names; empty without one.
QString tclLibraryFolder();
