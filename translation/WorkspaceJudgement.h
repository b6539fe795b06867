// Judges a workspace for whoever wants to write what passes. The workspace is read and judged once.
#pragma once

#include <platform/Export.h>
#include <transform/findings/Findings.h>
#include <transform/findings/RuleSettings.h>

#include <QHash>
#include <QString>

#include <memory>
#include <vector>

class MFBuffer;
class TransformerSource;

class ORX_EXPORT WorkspaceJudgement {
 public:
  // `fileName` may be "-", standard input; `parameterValues` gives global parameters other values, by name.
  // `source` is not owned.
  WorkspaceJudgement(const QString& fileName, TransformerSource& source,
                     const orx::RuleSettings& settings = {},
                     const QHash<QString, QString>& parameterValues = {});
  ~WorkspaceJudgement();
  WorkspaceJudgement(const WorkspaceJudgement&) = delete;
  WorkspaceJudgement& operator=(const WorkspaceJudgement&) = delete;

  // Why the file cannot be read; empty when it can.
  const QString& readError() const;
  // With the severities of the settings, in the order of a report.
  std::vector<orx::Finding> findings() const;
  // Whether nothing that was found counts as an error.
  bool allowsWriting() const;
  // The mapping file, to a buffer as it is made. Call once, when allowsWriting() answers true. False when a
  // transformer did not write its statements after all, or something that was written is wrong, which the
  // findings then tell.
  bool write(MFBuffer& buffer);

 private:
  struct Work;
  std::unique_ptr<Work> m_work;
};
