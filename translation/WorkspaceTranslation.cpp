#include <transform/core/TransformerSource.h>
#include <transform/files/AtomicFile.h>
#include <transform/files/InputFile.h>
#include <transform/workspace/IXMLComponentReader.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <translation/WorkspaceTranslation.h>
#include <translation/generation/MFDeviceBuffer.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/graph/WorkspaceBuilder.h>

std::unique_ptr<Workspace> readWorkspace(const TranslationRequest& request, TransformerSource& source,
                                         Diagnostics& diagnostics, QString& error) {
  // Asked before the reader is, because its exceptions do not tell a missing file from a malformed one.
  InputFile file(request.workspaceFile);
  if (!file.open()) {
    error = file.errorString();
    return nullptr;
  }

  QStringList headerLines;
  const std::unique_ptr<IXMLComponentReader> reader = IXMLComponentReader::create();
  try {
    reader->ReadInput(file.path(), headerLines);
  } catch (const WorkspaceLoaderException& exception) {
    diagnostics.reportText(Rule::MalformedDocument, exception.line(), QString(), exception.getMessage());
    return nullptr;
  }
  if (!reader->getRootNode()) {
    diagnostics.report(Rule::NoDocument, 0, QString());
    return nullptr;
  }
  WorkspaceBuilder builder(source, diagnostics, request.parameterValues);
  return builder.build(*reader, request.workspaceFile, headerLines);
}

TranslationResult translateWorkspace(const TranslationRequest& request, TransformerSource& source,
                                     Diagnostics& diagnostics, QString& error) {
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
