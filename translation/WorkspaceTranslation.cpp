#include <transform/core/TransformerSource.h>
#include <transform/files/AtomicFile.h>
#include <translation/WorkspaceDocument.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/graph/WorkspaceBuilder.h>

using orx::Rule;

std::unique_ptr<Workspace> readWorkspace(const TranslationRequest& request, TransformerSource& source,
                                         orx::Findings& diagnostics, QString& error) {
  WorkspaceDocument document(request.workspaceFile);
  if (document.read(diagnostics, error) != WorkspaceDocument::Reading::Done)
    return nullptr;
  WorkspaceBuilder builder(source, diagnostics, request.parameterValues);
  return builder.build(document.reader(), request.workspaceFile, document.headerLines());
}

TranslationResult translateWorkspace(const TranslationRequest& request, TransformerSource& source,
                                     orx::Findings& diagnostics, QString& error) {
  const std::unique_ptr<Workspace> workspace = readWorkspace(request, source, diagnostics, error);
  if (!workspace)
    return error.isEmpty() ? TranslationResult::Refused : TranslationResult::Unreadable;

  MappingFileWriter writer(*workspace, diagnostics);
  if (!writer.prepare())
    return TranslationResult::Refused;
  AtomicFile output(request.outputFile);
  if (!output.open()) {
    error = output.errorString();
    return TranslationResult::Unwritable;
  }
  {
    MFDeviceBuffer buffer(output.device());
    if (!writer.write(buffer))
      return TranslationResult::Refused;
  }
  if (!output.commit()) {
    error = output.errorString();
    return TranslationResult::Unwritable;
  }
  return TranslationResult::Done;
}
