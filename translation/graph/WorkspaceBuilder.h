// Turns the records of a workspace document into a graph of configured transformers. What cannot be placed is
// a diagnostic; the rest is built all the same, so that one run names every fault.
#pragma once

#include <transform/custom/DocumentBinding.h>
#include <transform/findings/Findings.h>
#include <translation/graph/Workspace.h>

#include <QHash>

#include <memory>
#include <optional>

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
  void addGlobalParameters(const IXMLComponentReader& reader);
  void reportRepeatedNames(const IXMLComponentReader& reader);
  void buildUnused(const IXMLComponentReader& reader);
  void addFeatureType(const FeatureTypeStruct& record);
  void addTransformer(const TransformerStruct& record);
  void reportCustomTransformers();
  void addLink(const LinkStruct& record);
  void addAttributeLink(const LinkStruct& record);
  // Null where the link leads to nothing, or to a node that is left out.
  WorkspaceNode* nodeAt(int identifier);

  TransformerSource& m_source;
  orx::Findings& m_diagnostics;
  const QHash<QString, QString> m_parameterValues;
  bool m_includesUnused = false;
  std::unique_ptr<Workspace> m_workspace;
  std::optional<DocumentBinding> m_binding;
};
