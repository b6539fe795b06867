// Writes a workspace that is connected and judged as a mapping file.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

class CustomDefinitions;
class MFBuffer;
class WorkspaceConnection;
class WrittenCheck;

class MappingFileWriter {
 public:
  // None is owned.
  MappingFileWriter(const Workspace& workspace, const WorkspaceConnection& connection,
                    const CustomDefinitions& definitions, orx::Findings& findings)
      : m_workspace(workspace), m_connection(connection), m_definitions(definitions), m_findings(findings) {}

  // The whole mapping file. False when a transformer did not write its statements after all, which is
  // reported. A check that judges what is written is the buffer at the same time, and is told who writes.
  bool write(MFBuffer& buffer, WrittenCheck* check = nullptr);

 private:
  void writeHeader(MFBuffer& buffer, WrittenCheck* check) const;
  void writeCopies(MFBuffer& buffer, int node) const;
  void writeParameters(MFBuffer& buffer, WrittenCheck* check) const;
  void writeFeatureTypes(MFBuffer& buffer, WrittenCheck* check) const;
  bool writeTransformers(MFBuffer& buffer, WrittenCheck* check, bool judgesAll);
  void writeWriterRoutes(MFBuffer& buffer, WrittenCheck* check) const;
  // Whether names alone may make any statement wrong.
  bool hasHarmfulNames() const;

  const Workspace& m_workspace;
  const WorkspaceConnection& m_connection;
  const CustomDefinitions& m_definitions;
  orx::Findings& m_findings;
};
