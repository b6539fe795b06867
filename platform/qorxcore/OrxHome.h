// Where the product is installed, and file names made presentable.
#pragma once

#include <platform/Export.h>

#include <QString>

// $ORX_HOME, else the installed share/orx beside the library, else the source tree's resources/. Absolute,
// without a trailing slash. The environment is read at every call, so that tests can move the home.
ORX_EXPORT QString QORXOrxHome();

// Absolute where possible, forward slashes, no "." and ".." steps, no doubled slashes, no trailing slash.
// Backslashes count as separators unless the name begins with a slash or names an existing file. A name with
// a drive letter is absolute already. Symbolic links are not followed.
ORX_EXPORT QString QORXPrettyUpFileName(const QString& fileName);
