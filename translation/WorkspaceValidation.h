// Finds everything that is wrong with a workspace, in one run, and changes nothing. Whoever writes a mapping
// file asks first, so that both say the same.
//
// Beside all that stops or disturbs the writing of a mapping file: values that the transformers refuse,
// attributes that do not arrive, inputs that nothing feeds, features that nothing takes, outdated
// transformers, parameters and references that do not fit together, global parameters that do not fit their
// prompt lines. The transformers inside custom transformers, embedded and linked, are judged as well. Which
// attributes reach the inside differs by instance, so no attribute is called missing there. Embedded custom
// transformers that nothing uses are judged like those in use.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Findings.h>
#include <transform/findings/RuleSettings.h>

#include <QHash>
#include <QString>

#include <vector>

class TransformerSource;

struct ORX_EXPORT ValidationReport {
  QString file;                        // as messages call it
  QString readError;                   // why the file cannot be read; empty when it can
  std::vector<orx::Finding> findings;  // by line; behind them those in linked files, by file and line

  bool isReadable() const { return readError.isEmpty(); }
  int count(orx::Severity severity) const;
};

// The judgement alone. What passes is written as well, to nowhere, so that nothing is left to be found.
ORX_EXPORT ValidationReport validateWorkspace(const QString& fileName, TransformerSource& source,
                                              const orx::RuleSettings& settings = {},
                                              const QHash<QString, QString>& parameterValues = {});
