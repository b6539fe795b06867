// Name and version of this program, as its output names them.
#pragma once

#include <platform/Export.h>

#include <QString>

ORX_EXPORT QString programVersion();
