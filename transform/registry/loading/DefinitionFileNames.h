// Which files of a folder hold definitions, and which their texts in another language. A file is one of the
// two at most.
#pragma once

#include <QString>

bool isDefinitionFileName(const QString& name);
bool isCompanionFileName(const QString& name);
