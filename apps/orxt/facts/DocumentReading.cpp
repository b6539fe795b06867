#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/DocumentReading.h>

ExitStatus readDocument(WorkspaceDocument& document, const QString& fileName, Console& console,
                        WorkspaceDocument::Versions versions) {
  orx::Findings diagnostics(InputFile::shownName(fileName));
  QString error;
  const WorkspaceDocument::Reading reading = document.read(diagnostics, error, versions);
  console.show(diagnostics);
  switch (reading) {
    case WorkspaceDocument::Reading::Done:
      return diagnostics.hasErrors() ? kExitRefused : kExitDone;
    case WorkspaceDocument::Reading::Refused:
      return kExitRefused;
    case WorkspaceDocument::Reading::Unreadable:
      break;
  }
  console.failFile(diagnostics.file(), error);
  return kExitFile;
}
