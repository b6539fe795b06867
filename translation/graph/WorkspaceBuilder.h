// Turns the records of a workspace document into a graph of configured transformers. What cannot be placed is
// a diagnostic; the rest is built all the same, so that one run names every fault.
#pragma once

#include <transform/custom/TransformerPorts.h>
#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

#include <QHash>

#include <map>
#include <memory>

class IXMLComponentReader;
class TransformerSource;
struct FeatureTypeStruct;
struct LinkStruct;
struct TransformerStruct;

class WorkspaceBuilder {
 public:
  // `source` makes the configurations; `parameterValues` gives global parameters another value, by name.
  // Neither `source` nor `diagnostics` is owned.
  WorkspaceBuilder(TransformerSource& source, orx::Findings& diagnostics,
                   const QHash<QString, QString>& parameterValues = {});

  // Also builds the embedded custom transformers that the workspace does not use, and says so.
  void includeUnused() { m_includesUnused = true; }

  std::unique_ptr<Workspace> build(const IXMLComponentReader& reader, const QString& fileName,
                                   const QStringList& headerLines);

 private:
  // What a link may name as its end.
  struct Place {
    int node = -1;  // -1: the node is disabled or could not be built, links to it are dropped without a word
    int line = 0;
  };

  void addGlobalParameters(const IXMLComponentReader& reader);
  void reportRepeatedNames(const IXMLComponentReader& reader);
  void buildUnused(const IXMLComponentReader& reader);
  void addFeatureType(const FeatureTypeStruct& record);
  void addTransformer(const TransformerStruct& record);
  std::unique_ptr<TransformerCfg> makeTransformer(const TransformerStruct& record, const QString& nodeName);
  void reportCustomTransformers();
  TransformerPorts applyRecord(const TransformerStruct& record, WorkspaceNode& node);
  void takeName(const QString& name, int line);
  bool placeNode(int identifier, int line, const QString& name, int node);
  // False when the link cannot be placed; `source` and `target` are -1 when it leads to a node that is left
  // out.
  bool findEnds(const LinkStruct& record, int& source, int& target);
  // False when the link is left out.
  bool addLink(const LinkStruct& record);
  void noteLeftOut(const LinkStruct& record);
  void addAttributeLink(const LinkStruct& record);
  // `tag` stays empty for a feature type.
  bool findPort(int node, const LinkStruct& record, bool isOutput, unsigned number, const QString& name,
                QString& tag);

  TransformerSource& m_source;
  orx::Findings& m_diagnostics;
  const QHash<QString, QString> m_parameterValues;
  bool m_includesUnused = false;
  std::unique_ptr<Workspace> m_workspace;
  QHash<int, Place> m_places;               // by identifier in the document
  QHash<QString, int> m_linesByName;        // of transformers
  std::map<int, TransformerPorts> m_ports;  // by node
};
