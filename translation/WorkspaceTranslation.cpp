#include <transform/core/TransformerSource.h>
#include <transform/files/AtomicFile.h>
#include <transform/files/TemporaryFile.h>
#include <translation/WorkspaceDocument.h>
#include <translation/WorkspaceJudgement.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/graph/Workspace.h>
#include <translation/graph/WorkspaceBuilder.h>

namespace {

constexpr qint64 kChunk = 1024 * 1024;

// False when the temporary file cannot be written or read; what fails at the place itself is told there.
bool copy(TemporaryFile& from, QIODevice& to) {
  if (!from.flush() || !from.seek(0))
    return false;
  while (!from.atEnd()) {
    const QByteArray bytes = from.read(kChunk);
    if (bytes.isEmpty() || to.write(bytes) != bytes.size())
      return from.error() == QFileDevice::NoError;
  }
  return true;
}

}  // namespace

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
  // What goes to its place at once is held back until all of it is judged.
  TemporaryFile held(QStringLiteral("orx-mf-XXXXXX"));
  if (output.isDirect() && !held.open()) {
    error = held.errorString();
    return end(TranslationResult::Unwritable);
  }
  {
    MFDeviceBuffer buffer(held.isOpen() ? held : output.device());
    if (!judgement.write(buffer))
      return end(TranslationResult::Refused);
    if (held.isOpen() && (buffer.hasFailed() || !copy(held, output.device()))) {
      error = held.errorString();
      return end(TranslationResult::Unwritable);
    }
  }
  if (!output.commit()) {
    error = output.errorString();
    return end(TranslationResult::Unwritable);
  }
  return end(TranslationResult::Done);
}
