// What was found wrong inside a custom transformer, as diagnostics.
#pragma once

#include <translation/Diagnostics.h>

#include <QString>

class ExternalDocNetwork;

// `file` is the one that the lines of the problems belong to.
void reportNetworkProblems(const ExternalDocNetwork& network, const QString& file, Diagnostics& diagnostics);
