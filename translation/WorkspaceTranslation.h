// The main job: a workspace file becomes a mapping file.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Findings.h>
#include <transform/findings/RuleSettings.h>

#include <QHash>
#include <QString>

#include <memory>

class TransformerSource;
class Workspace;

enum class TranslationResult {
  Done,        // warnings may have been reported
  Refused,     // diagnostics say why
  Unreadable,  // the workspace file could not be read
  Unwritable,  // the output could not be written
};

struct TranslationRequest {
  QString workspaceFile;                    // "-" is standard input
  QString outputFile;                       // "-" is standard output
  QHash<QString, QString> parameterValues;  // other values for global parameters, by name
};

// Reads a workspace file into a graph of configured transformers, unjudged. Null when there is no document to
// build from: `error` says why the file cannot be read, and is empty when diagnostics say what is wrong
// inside.
ORX_EXPORT std::unique_ptr<Workspace> readWorkspace(const TranslationRequest& request,
                                                    TransformerSource& source, orx::Findings& diagnostics,
                                                    QString& error);

// The whole job. The workspace is judged as validation does, with the same settings and the same findings;
// where one counts as an error nothing is written. Output appears whole or not at all. `error` receives why a
// file could not be read or written.
ORX_EXPORT TranslationResult translateWorkspace(const TranslationRequest& request, TransformerSource& source,
                                                orx::Findings& diagnostics, QString& error,
                                                const orx::RuleSettings& settings = {});
