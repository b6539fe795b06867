// Contents of definition files that are easily misread.
#pragma once

#include <QByteArray>

#include <vector>

// Each holds definitions of its own names and versions, at least one of which every reader finds.
std::vector<QByteArray> awkwardDefinitions();
