#include <transform/custom/NestedQuestion.h>
#include <transform/text/MessageNumbers.h>
#include <translation/generation/MappingFileWriter.h>
#include <translation/generation/PreparedWorkspace.h>
#include <translation/validation/WritingChecks.h>

PreparedWorkspace::PreparedWorkspace(Workspace& workspace, orx::Findings& findings)
    : m_workspace(workspace),
      m_findings(findings),
      m_definitions(workspace.customTransformers(), workspace.usedCustomTransformers, workspace.listener) {
  const OverrunListener overruns;
  m_connection.emplace(workspace, findings);
  WritingChecks(workspace, findings).check();
  for (const WorkspaceNode& node : workspace.nodes)
    m_definitions.addInstance(node.cfg.get());
  m_definitions.prepare(findings);
  if (overruns.hasHeard())
    findings.reportAs(orx::Rule::Nesting, orx::messages::kNestedTooCostly, 0, QString());
}

bool PreparedWorkspace::write(MFBuffer& buffer, WrittenCheck* check) const {
  return MappingFileWriter(m_workspace, *m_connection, m_definitions, m_findings).write(buffer, check);
}
