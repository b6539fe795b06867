#include <apps/orxt/console/Console.h>
#include <apps/orxt/facts/DocumentReading.h>
#include <translation/WorkspaceDocument.h>

ExitStatus readDocument(WorkspaceDocument& document, const QString& fileName, Console& console) {
  Diagnostics diagnostics(InputFile::shownName(fileName));
  QString error;
  const WorkspaceDocument::Reading reading = document.read(diagnostics, error);
  console.show(diagnostics);
  switch (reading) {
    case WorkspaceDocument::Reading::Done:
      return kExitDone;
    case WorkspaceDocument::Reading::Refused:
      return kExitRefused;
    case WorkspaceDocument::Reading::Unreadable:
      break;
  }
  console.failFile(diagnostics.file(), error);
  return kExitFile;
}
