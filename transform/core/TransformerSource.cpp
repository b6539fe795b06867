#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/core/WorkspaceParameterDirectory.h>

TransformerSource::~TransformerSource() = default;

const DefinitionDirectory* TransformerSource::definitionDirectory() const {
  return nullptr;
}

DefinitionDirectory::~DefinitionDirectory() = default;
WorkspaceParameterDirectory::~WorkspaceParameterDirectory() = default;
