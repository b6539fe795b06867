#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/core/WorkspaceParameterDirectory.h>

TransformerSource::~TransformerSource() = default;

QString TransformerSource::refusalReason() const {
  return QString();
}

DefinitionDirectory::~DefinitionDirectory() = default;
WorkspaceParameterDirectory::~WorkspaceParameterDirectory() = default;
