// What the tests of custom transformers are made of: transformers of simple definitions, networks that are
// put together by hand, documents from short descriptions, and a buffer that keeps what is written.
#pragma once

#include <tests/support/TextBuffer.h>
#include <transform/core/TransformerCfg.h>
#include <transform/core/TransformerDefinition.h>
#include <transform/core/TransformerSource.h>
#include <transform/custom/CompoundTransformerCfg.h>
#include <transform/custom/ExternalDocNetwork.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <memory>
#include <vector>

// A comma-separated list; the empty text is the empty list.
QStringList names(const QString& text);

// One input IN and the outputs given; what arrives passes, `added` (tokens of a definition) comes on top.
TransformerDefinition passing(const QString& type, const QString& outputs = "OUT",
                              const QString& added = QString());
std::unique_ptr<TransformerCfg> configured(const TransformerDefinition& definition,
                                           const QString& identifier = QString());

// Makes transformers of the definitions it was given.
class Definitions : public TransformerSource {
 public:
  void add(const TransformerDefinition& definition);
  std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version, QString*) override;

 private:
  QHash<QString, TransformerDefinition> m_definitions;
};

// A network that opens its building operations.
class OpenNetwork : public ExternalDocNetwork {
 public:
  explicit OpenNetwork(const QString& name = "Net", int version = 1);

  using CompoundTransformerNetwork::addInput;
  using CompoundTransformerNetwork::addLink;
  using CompoundTransformerNetwork::addLoop;
  using CompoundTransformerNetwork::addOutput;
  using CompoundTransformerNetwork::addPublishedParameter;
  using CompoundTransformerNetwork::addTransformer;
  using CompoundTransformerNetwork::clearNodes;
  using CompoundTransformerNetwork::createAncestorList;
  using CompoundTransformerNetwork::NodeSet;
  using ExternalDocNetwork::setParallelSettings;

  void publish(const QString& guiLine, const QString& value);
  QStringList attributesOf(const QString& output) const;
};

// Puts a network together from lines such as "in A", "out B", "own B x,y", "loop L", "pass P", "add P x,y",
// "use P" (an instance of `inner`), "P -> B". Node numbers follow the lines; ports are IN and OUT.
void assemble(OpenNetwork& network, const QStringList& lines, CompoundTransformerNetwork* inner = nullptr);

// The XML of a document of custom transformers. Each is described by lines as for assemble(), "use P NAME"
// for a nested one, "gui LINE | DEFAULT" for a parameter, "set NAME VALUE" for a setting, "parm P NAME VALUE"
// for a value of a transformer, "raw XML" for anything else inside FEAT_LINKS.
struct DocumentText {
  QString name;
  QStringList lines;
};
QByteArray documentXml(const std::vector<DocumentText>& documents);
