// Builds the network of a custom transformer from the records of its document.
#pragma once

#include <transform/custom/ExternalDocNetwork.h>
#include <transform/custom/TransformerPorts.h>
#include <transform/workspace/WorkspaceRecords.h>

#include <memory>
#include <vector>

class ExternalDocNetwork::Builder {
 public:
  Builder(ExternalDocNetwork& network, const IXMLComponentReader& reader, const QString& document,
          TransformerSource& source);

  void build();

 private:
  enum class Kind { Input, Output, Loop, Transformer };
  struct Place {
    Kind kind = Kind::Transformer;
    int line = 0;
    bool isLeftOut = false;  // disabled or not built: links to it are dropped without a word
    QString title;
    TransformerCfg* cfg = nullptr;
    TransformerPorts ports;  // of a transformer
  };

  void addPorts();
  void addTransformer(const TransformerStruct& record);
  std::unique_ptr<TransformerCfg> makeTransformer(const TransformerStruct& record, const QString& title);
  void configure(const TransformerStruct& record, Place& place);
  // False when the link is left out.
  bool addLink(const LinkStruct& record);
  void noteLeftOut(const LinkStruct& record);
  void addAttributeLink(const LinkStruct& record);
  void addParameters();
  void checkLoops();

  bool enter(int identifier, const Place& place);
  // False, with a problem, when an end is unknown; also false, without one, when an end is left out.
  bool findEnds(const LinkStruct& record, Place*& source, Place*& target);
  bool findPort(const LinkStruct& record, const Place& place, bool isOutput, unsigned number,
                const QString& name, QString& tag);
  void report(orx::Rule rule, int line, const QString& node, long message, const QStringList& arguments);
  void reportPort(const LinkStruct& record, const Place& place, const QString& description);

  ExternalDocNetwork& m_network;
  const IXMLComponentReader& m_reader;
  QString m_document;
  TransformerSource& m_source;
  QHash<int, Place> m_places;  // by identifier in the document
  QHash<QString, int> m_linesByTitle;
};
