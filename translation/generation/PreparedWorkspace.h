// A workspace made ready for writing: connected, and checked for what no mapping file can hold.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/generation/CustomDefinitions.h>
#include <translation/generation/WorkspaceConnection.h>

#include <optional>

class MFBuffer;
class WrittenCheck;

class PreparedWorkspace {
 public:
  // Changes the transformers of the workspace. Neither is owned.
  PreparedWorkspace(Workspace& workspace, orx::Findings& findings);

  // Whether the transformers know which attributes arrive.
  bool isConnected() const { return m_connection->isConnected(); }
  // Call when nothing was found that forbids it. See MappingFileWriter.
  bool write(MFBuffer& buffer, WrittenCheck* check = nullptr) const;

 private:
  const Workspace& m_workspace;
  orx::Findings& m_findings;
  std::optional<WorkspaceConnection> m_connection;
  CustomDefinitions m_definitions;  // of the embedded custom transformers
};
