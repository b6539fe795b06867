#include <transform/core/TransformerSource.h>
#include <transform/files/AtomicFile.h>
#include <translation/WorkspaceDocument.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/WorkspaceValidation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/graph/Workspace.h>
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
                                     orx::Findings& diagnostics, QString& error,
                                     const orx::RuleSettings& settings) {
  WorkspaceJudgement judgement(request.workspaceFile, source, settings, request.parameterValues);
  error = judgement.readError();
  if (!error.isEmpty())
    return TranslationResult::Unreadable;
  const auto end = [&](TranslationResult result) {
    diagnostics.take(judgement.findings());
    return result;
  };
  if (!judgement.allowsWriting())
    return end(TranslationResult::Refused);
  AtomicFile output(request.outputFile);
  if (!output.open()) {
    error = output.errorString();
    return end(TranslationResult::Unwritable);
  }
  {
    MFDeviceBuffer buffer(output.device());
    if (!judgement.write(buffer))
      return end(TranslationResult::Refused);
  }
  if (!output.commit()) {
    error = output.errorString();
    return end(TranslationResult::Unwritable);
  }
  return end(TranslationResult::Done);
}
