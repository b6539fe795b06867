#include <translation/MappingFileLint.h>
#include <translation/mappingfile/MappingFileReader.h>
#include <translation/mappingfile/MappingFileReport.h>
#include <translation/mappingfile/MappingFileStatements.h>

#include <algorithm>

using orx::Rule;

MappingFileFindings lintMappingFile(const QString& path, const QString& shownName,
                                    const CustomTransformerLookup& isInstalled) {
  orx::Findings diagnostics(shownName);
  MappingFileReport report(diagnostics);
  MappingFileReader reader(path, report);
  if (!reader.open())
    return {reader.errorString(), {}};
  MappingFileStatements statements(report);
  MappingFileReader::Item item = reader.next();
  for (; item != MappingFileReader::Item::End && !statements.isFull(); item = reader.next()) {
    switch (item) {
      case MappingFileReader::Item::Statement:
        statements.check(reader.statement());
        break;
      case MappingFileReader::Item::ScriptLine:
        statements.addScriptLine(reader.statement());
        break;
      case MappingFileReader::Item::BlockBegin:
        statements.beginBlock(reader.statement());
        break;
      case MappingFileReader::Item::BlockEnd:
        statements.endBlock();
        break;
      case MappingFileReader::Item::End:
        break;
    }
  }
  if (item != MappingFileReader::Item::End)
    report.add(Rule::TooManyNames, reader.lineNumber());
  statements.finish(isInstalled);
  std::vector<orx::Finding> findings = diagnostics.all();
  std::stable_sort(findings.begin(), findings.end(),
                   [](const orx::Finding& a, const orx::Finding& b) { return a.line < b.line; });
  return {reader.errorString(), std::move(findings)};
}
