// What was found wrong inside a custom transformer, as findings of the workspace.
#pragma once

#include <transform/findings/Findings.h>

#include <QString>

class ExternalDocNetwork;

// `file` is the one that the lines of the problems belong to.
void reportNetworkProblems(const ExternalDocNetwork& network, const QString& file, orx::Findings& findings);
