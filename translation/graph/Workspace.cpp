#include <transform/core/TransformerCfg.h>
#include <transform/custom/AttributeFlow.h>
#include <transform/custom/SubDocumentLibrary.h>
#include <translation/graph/Workspace.h>

Workspace::Workspace() = default;
Workspace::~Workspace() = default;

AttributeSet WorkspaceNode::leaving(const QString& output) const {
  AttributeSet all = isTransformer() ? attribute_flow::leaving(*cfg, output) : AttributeSet(attributes);
  all.add(exposed.value(output));
  return all;
}

const std::vector<ExternalDocNetwork*>& Workspace::customTransformers() const {
  static const std::vector<ExternalDocNetwork*> none;
  return library ? library->networks() : none;
}
