#include <transform/files/InputFile.h>
#include <transform/text/NullBuffer.h>
#include <translation/WorkspaceJudgement.h>
#include <translation/WorkspaceValidation.h>

#include <algorithm>

int ValidationReport::count(orx::Severity severity) const {
  return static_cast<int>(
      std::count_if(findings.begin(), findings.end(),
                    [severity](const orx::Finding& finding) { return finding.severity == severity; }));
}

ValidationReport validateWorkspace(const QString& fileName, TransformerSource& source,
                                   const orx::RuleSettings& settings,
                                   const QHash<QString, QString>& parameterValues) {
  WorkspaceJudgement judgement(fileName, source, settings, parameterValues);
  if (judgement.allowsWriting()) {
    NullBuffer nowhere;
    judgement.write(nowhere);
  }
  return {InputFile::shownName(fileName), judgement.readError(), judgement.findings()};
}
