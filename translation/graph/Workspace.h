// A workspace as a graph: its feature types and configured transformers, and the links between their ports.
//
// Disabled nodes and links are left out. Nodes are numbered from 0: feature types first, then transformers,
// each in document order.
#pragma once

#include <transform/custom/AttributeCopies.h>
#include <transform/workspace/ParameterLines.h>
#include <translation/GlobalParameters.h>
#include <translation/graph/WorkspaceListener.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

class ExternalDocNetwork;
class ExternalTransformerNetwork;
class SubDocumentLibrary;
class TransformerCfg;

struct WorkspaceNode {
  enum class Kind { Reader, Writer, Transformer };

  Kind kind = Kind::Transformer;
  int identifier = -1;  // of the element in the document
  int line = 0;
  QString name;  // the transformer's identifier; the feature type's name

  // Feature types.
  QString keyword;  // of the dataset
  QStringList attributes;
  bool hasFixedAttributes = false;  // a writer's, which takes no others

  // Transformers.
  std::unique_ptr<TransformerCfg> cfg;
  QHash<QString, QStringList> inputOrder;  // input tag to the flows that enter there, in order
  ParameterLines parameterLines;
  bool isHarmless = true;  // no value that the document gives can mean anything to a mapping file
  QHash<QString, QStringList> exposed;  // output tag to the attributes that a user added there

  // Whether a link at this end was left out: it, or the node at its other end, is disabled or at fault.
  bool lacksInputLink = false;
  bool lacksOutputLink = false;

  bool isTransformer() const { return kind == Kind::Transformer; }
  // The attributes that leave an output, in so far as it is known what arrives.
  AttributeSet leaving(const QString& output) const;
};

struct WorkspaceLink {
  int source = -1;  // node numbers
  int target = -1;
  QString output;  // tags; empty for feature types
  QString input;
  int executionIndex = -1;
  int line = 0;
  AttributeCopies copies;
};

// An attribute that goes on along a link, mostly under another name.
struct AttributeLink {
  std::size_t link = 0;
  QString from;
  QString to;
  int identifier = -1;
  int line = 0;
};

class Workspace {
 public:
  Workspace();
  ~Workspace();
  Workspace(const Workspace&) = delete;
  Workspace& operator=(const Workspace&) = delete;

  QString fileName;
  QStringList headerLines;
  int firstHeaderLine = 0;
  GlobalParameters parameters;
  WorkspaceListener listener{parameters};
  // The custom transformers that the document embeds; outlives the nodes that are their instances.
  std::unique_ptr<SubDocumentLibrary> library;
  // Each behind the ones that stand inside it; those in use first.
  const std::vector<ExternalDocNetwork*>& customTransformers() const;
  std::size_t usedCustomTransformers = 0;
  // Those that files of their own hold, at any depth, whether or not what they stand in is used.
  std::vector<ExternalTransformerNetwork*> linkedCustomTransformers;
  std::vector<WorkspaceNode> nodes;
  std::vector<WorkspaceLink> links;
  std::vector<AttributeLink> attributeLinks;
};
