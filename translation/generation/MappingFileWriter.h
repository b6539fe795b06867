// Writes a workspace as a mapping file. A workspace is written once: writing connects its transformers.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/generation/CustomDefinitions.h>
#include <translation/graph/Workspace.h>

#include <QString>
#include <QStringList>

#include <vector>

class FlowNames;
class InnerNames;
class MFBuffer;
class WrittenCheck;

class MappingFileWriter {
 public:
  // Neither is owned.
  MappingFileWriter(Workspace& workspace, orx::Findings& diagnostics);

  // Orders and connects the transformers and pushes attributes through; checks everything that will be
  // written. False when there are errors, those found before included.
  bool prepare();
  // Whether prepare() could connect the transformers and tell them which attributes arrive.
  bool isConnected() const { return m_isConnected; }
  // The whole mapping file. Call after prepare(), and not when anything was found that forbids the writing.
  // False when a transformer did not write its statements after all, which diagnostics tell. A check that
  // judges what is written is the buffer at the same time, and is told who writes.
  bool write(MFBuffer& buffer, WrittenCheck* check = nullptr);

 private:
  bool order();
  void reserveInnerNames(FlowNames& names, InnerNames& inner);
  void nameFlows();
  void connect();
  void pushAttributes();
  void check();
  void checkParameters();
  QString refuseScript(const GlobalParameters::Parameter& parameter) const;
  void checkChoices(const GlobalParameters::Parameter& parameter);
  void checkParameter(const GlobalParameters::Parameter& parameter, const QString& value);
  // False when something was reported.
  bool checkText(const QString& text, const QString& what, int line, const QString& node);
  void checkWord(const QString& text, int line, const QString& node);
  void checkNoReference(const QString& name, int line, const QString& node);
  void checkAttributes(const WorkspaceNode& node);

  // The flow that leaves a link's source through its port.
  const QString& flowOf(int node, const QString& output) const;
  void writeHeader(MFBuffer& buffer, WrittenCheck* check) const;
  void writeParameters(MFBuffer& buffer, WrittenCheck* check) const;
  void writeFeatureTypes(MFBuffer& buffer, WrittenCheck* check) const;
  bool writeTransformers(MFBuffer& buffer, WrittenCheck* check);
  void writeWriterRoutes(MFBuffer& buffer, WrittenCheck* check) const;
  // Whether names alone may make any statement wrong.
  bool hasHarmfulNames() const;

  Workspace& m_workspace;
  orx::Findings& m_diagnostics;
  bool m_isConnected = false;
  std::vector<int> m_order;                              // transformers, each behind what feeds it
  std::vector<QHash<QString, QString>> m_flows;          // per node: output tag to flow; "" for feature types
  std::vector<QHash<QString, QStringList>> m_functions;  // per node: output tag to output functions
  std::vector<QHash<QString, QStringList>> m_copies;  // per node: output tag to attributes that functions add
  std::vector<QString> m_copiedFlows;        // per reader with copied attributes: the flow behind the copies
  CustomDefinitions m_definitions;           // of the embedded custom transformers
  std::vector<std::vector<int>> m_incoming;  // per node: its links, in the order of the sources
};
