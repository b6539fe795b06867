#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/NestedNetworks.h>
#include <translation/WorkspaceDocument.h>
#include <translation/WorkspaceJudgement.h>
#include <translation/generation/PreparedWorkspace.h>
#include <translation/graph/WorkspaceBuilder.h>
#include <translation/mappingfile/WrittenCheck.h>
#include <translation/validation/DocumentChecks.h>
#include <translation/validation/WorkspaceChecks.h>

#include <algorithm>

using orx::Severity;

namespace {

std::vector<orx::Finding> inDocumentOrder(const orx::Findings& diagnostics) {
  std::vector<orx::Finding> findings = diagnostics.all();
  std::stable_sort(findings.begin(), findings.end(),
                   [&](const orx::Finding& left, const orx::Finding& right) {
                     const bool isLeftOther = left.file != diagnostics.file();
                     const bool isRightOther = right.file != diagnostics.file();
                     if (isLeftOther != isRightOther)
                       return isRightOther;
                     if (left.file != right.file)
                       return left.file < right.file;
                     return left.line < right.line;
                   });
  return findings;
}

}  // namespace

struct WorkspaceJudgement::Work {
  Work(const QString& fileName, TransformerSource& transformers, const orx::RuleSettings& rules)
      : source(transformers), diagnostics(InputFile::shownName(fileName)), settings(rules) {}

  void judge(const QString& fileName, const QHash<QString, QString>& parameterValues);

  TransformerSource& source;
  orx::Findings diagnostics;
  orx::RuleSettings settings;
  QString readError;
  std::unique_ptr<Workspace> workspace;  // null when there is no document to build it from
  std::unique_ptr<PreparedWorkspace> prepared;
};

void WorkspaceJudgement::Work::judge(const QString& fileName,
                                     const QHash<QString, QString>& parameterValues) {
  WorkspaceDocument document(fileName);
  if (document.read(diagnostics, readError) != WorkspaceDocument::Reading::Done)
    return;
  WorkspaceBuilder builder(source, diagnostics, parameterValues);
  builder.includeUnused();
  workspace = builder.build(document.reader(), fileName, document.headerLines());
  prepared = std::make_unique<PreparedWorkspace>(*workspace, diagnostics);
  WorkspaceChecks(document.reader(), document.headerLines(), source, settings, diagnostics)
      .check(*workspace, prepared->isConnected());
  checkDocument(document, diagnostics);
}

WorkspaceJudgement::WorkspaceJudgement(const QString& fileName, TransformerSource& source,
                                       const orx::RuleSettings& settings,
                                       const QHash<QString, QString>& parameterValues)
    : m_work(std::make_unique<Work>(fileName, source, settings)) {
  m_work->judge(fileName, parameterValues);
}

WorkspaceJudgement::~WorkspaceJudgement() = default;

const QString& WorkspaceJudgement::readError() const {
  return m_work->readError;
}

std::vector<orx::Finding> WorkspaceJudgement::findings() const {
  return m_work->settings.apply(inDocumentOrder(m_work->diagnostics));
}

bool WorkspaceJudgement::allowsWriting() const {
  const std::vector<orx::Finding>& all = m_work->diagnostics.all();
  return m_work->prepared && std::none_of(all.begin(), all.end(), [this](const orx::Finding& finding) {
           return m_work->settings.severity(finding.rule) == Severity::Error;
         });
}

bool WorkspaceJudgement::write(MFBuffer& buffer) {
  WrittenCheck check(buffer);
  const bool isWritten = m_work->prepared->write(check, &check);
  check.finish(
      [this](const QString& name, int version) {
        return isCustomTransformer(m_work->source.makeTransformer(name, version).get());
      },
      m_work->diagnostics);
  return isWritten && allowsWriting();
}
