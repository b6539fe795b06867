// The first step of every command that takes a document without translating it.
#pragma once

#include <apps/orxt/console/Command.h>
#include <translation/WorkspaceDocument.h>

#include <QString>

// Reads the document and says on the console what is wrong with it.
ExitStatus readDocument(WorkspaceDocument& document, const QString& fileName, Console& console,
                        WorkspaceDocument::Versions versions = WorkspaceDocument::Versions::Refused);
