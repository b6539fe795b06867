// What is wrong with a graph as a whole: its parameters, its transformers and those inside custom ones, and
// who reads what.
#pragma once

#include <transform/findings/RuleSettings.h>
#include <translation/validation/ValueChecks.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

class ExternalDocNetwork;
class ExternalTransformerNetwork;
class FlowChecks;
class GUIType;
class GlobalParameters;
class IXMLComponentReader;
class ReferencedNames;
class TransformerCfg;
class TransformerSource;
class Workspace;
struct GlobalParameterStruct;

class WorkspaceChecks {
 public:
  WorkspaceChecks(const IXMLComponentReader& reader, const QStringList& headerLines,
                  TransformerSource& source, const orx::RuleSettings& settings, orx::Findings& diagnostics)
      : m_reader(reader),
        m_headerLines(headerLines),
        m_source(source),
        m_settings(settings),
        m_diagnostics(diagnostics),
        m_values(diagnostics, settings) {}

  // `isConnected`: whether the transformers know which attributes arrive.
  void check(Workspace& workspace, bool isConnected);

 private:
  void checkBuild();
  void checkTransformers(const Workspace& workspace, bool isConnected);
  void checkAttributeLinks(const Workspace& workspace, const FlowChecks& flow);
  void checkParameters(Workspace& workspace);
  // Where findings about one file go, and the checks that report there.
  struct Place {
    orx::Findings& diagnostics;
    ValueChecks& values;
  };
  void checkInside(const ExternalDocNetwork& network, const Workspace& workspace, Place place);
  static void checkBuild(const ExternalDocNetwork& network, orx::Findings& diagnostics);
  void checkDefaults(const ExternalTransformerNetwork& linked, const Workspace& workspace, Place place);
  void checkLinked(const ExternalTransformerNetwork& linked, const Workspace& workspace);
  void checkAge(const TransformerCfg& cfg, int line, const QString& title, orx::Findings& diagnostics);
  void checkParameterValues(const Workspace& workspace);
  void checkParameterValue(const Workspace& workspace, const GlobalParameterStruct& parameter,
                           const GUIType& type, const QString& document);
  void checkParameterUse(const Workspace& workspace);
  void collectReferences(ReferencedNames& names) const;
  bool isKnown(const GlobalParameters& parameters, const QString& name) const;

  const IXMLComponentReader& m_reader;
  const QStringList& m_headerLines;
  TransformerSource& m_source;
  const orx::RuleSettings& m_settings;
  orx::Findings& m_diagnostics;
  ValueChecks m_values;
  QStringList m_parameterNames;
  bool m_includesOthers = false;       // the header takes in files that may set further parameters
  QSet<QString> m_lintedFiles;         // of linked custom transformers
  QHash<QString, int> m_newestByName;  // -1: not known outside the document
};
