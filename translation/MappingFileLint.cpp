#include <translation/MappingFileLint.h>
#include <translation/mappingfile/MappingFileCheck.h>

#include <algorithm>

MappingFileFindings lintMappingFile(const QString& path, const QString& shownName,
                                    const CustomTransformerLookup& isInstalled) {
  orx::Findings diagnostics(shownName);
  MappingFileCheck check(path, diagnostics);
  MappingFileReader& reader = check.reader();
  if (!reader.open())
    return {reader.errorString(), {}};
  check.run();
  check.finish(isInstalled);
  std::vector<orx::Finding> findings = diagnostics.all();
  std::stable_sort(findings.begin(), findings.end(),
                   [](const orx::Finding& a, const orx::Finding& b) { return a.line < b.line; });
  return {reader.errorString(), std::move(findings)};
}
