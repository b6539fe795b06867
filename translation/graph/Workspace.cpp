#include <transform/core/TransformerCfg.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <translation/graph/Workspace.h>

Workspace::Workspace() = default;
Workspace::~Workspace() = default;

const std::vector<ExternalDocNetwork*>& Workspace::customTransformers() const {
  static const std::vector<ExternalDocNetwork*> none;
  return library ? library->networks() : none;
}
