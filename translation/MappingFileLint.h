// Checks mapping files and files of custom transformers: grammar, references, flow of feature types, scripts.
// docs/mapping-file.md is the reference for what is checked, docs/diagnostics.md tells what the rules mean.
//
// Linear in the size of the file; what is held in memory grows with its names, not with its text.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Findings.h>

#include <QString>

#include <functional>
#include <vector>

struct ORX_EXPORT MappingFileFindings {
  QString readError;                   // why the file cannot be read; empty when it can
  std::vector<orx::Finding> findings;  // by line
};

// Whether the installation has a version of a custom transformer. Without an answer no include is judged by
// it.
using CustomTransformerLookup = std::function<bool(const QString& name, int version)>;

// `path` is the file to read, `shownName` what messages call it. Runs python3 when there are Python scripts.
ORX_EXPORT MappingFileFindings lintMappingFile(const QString& path, const QString& shownName,
                                               const CustomTransformerLookup& isInstalled);
