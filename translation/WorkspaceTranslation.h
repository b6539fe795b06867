// The main job: a workspace file becomes a mapping file.
#pragma once

#include <platform/Export.h>
#include <translation/Diagnostics.h>

#include <QHash>
#include <QString>

#include <memory>

class QIODevice;
class TransformerSource;
class Workspace;

enum class TranslationResult {
  Done,        // warnings may have been reported
  Refused,     // diagnostics say why
  Unreadable,  // the workspace file could not be read
  Unwritable,  // the output could not be written
};

struct TranslationRequest {
  QString workspaceFile;
  QString outputFile;                       // "-" is standard output
  QHash<QString, QString> parameterValues;  // other values for global parameters, by name
};

// Reads a workspace file into a graph of configured transformers. Null, with `error` set, when the file cannot be
// read or is no well-formed workspace; `isUnreadable` tells the first from the second.
ORX_EXPORT std::unique_ptr<Workspace> readWorkspace(const TranslationRequest& request, TransformerSource& source,
                                                    Diagnostics& diagnostics, QString& error, bool& isUnreadable);

// Writes the mapping file to a device that is open for writing. False when the workspace was refused; nothing has
// been written then. Failures of the device show in the device.
ORX_EXPORT bool writeMappingFile(Workspace& workspace, QIODevice& device, Diagnostics& diagnostics);

// The whole job. Output appears whole or not at all. `error` receives what no diagnostic of the document says: that
// a file could not be read, parsed or written, and why.
ORX_EXPORT TranslationResult translateWorkspace(const TranslationRequest& request, TransformerSource& source,
                                                Diagnostics& diagnostics, QString& error);
