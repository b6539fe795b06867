#include <transform/core/TransformerCfg.h>
#include <translation/Workspace.h>

Workspace::Workspace() = default;
Workspace::~Workspace() = default;
