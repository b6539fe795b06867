// Builds the network of a custom transformer from the records of its document.
#pragma once

#include <transform/custom/DocumentBinding.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/workspace/WorkspaceRecords.h>

class ExternalDocNetwork::Builder {
 public:
  Builder(ExternalDocNetwork& network, const IXMLComponentReader& reader, const QString& document,
          TransformerSource& source);

  void build();

 private:
  void addPorts();
  void addTransformer(const TransformerStruct& record);
  void addLink(const LinkStruct& record);
  void addAttributeLink(const LinkStruct& record);
  void addParameters();
  void checkLoops();

  ExternalDocNetwork& m_network;
  const IXMLComponentReader& m_reader;
  const QString m_document;
  orx::Findings& m_findings;
  DocumentBinding m_binding;
};
