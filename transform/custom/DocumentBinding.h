// Binds the records of one document to what they name: transformers to configurations, the ends of links to
// nodes and their ports. What cannot be placed is a finding; the rest is bound all the same, so that one run
// names every fault.
#pragma once

#include <platform/Export.h>
#include <transform/custom/TransformerPorts.h>
#include <transform/findings/Findings.h>

#include <QHash>
#include <QString>

#include <memory>
#include <optional>

class IXMLComponentReader;
class TransformerCfg;
class TransformerCfgListener;
class TransformerSource;
class WorkspaceParameterDirectory;
struct LinkStruct;
struct TransformerStruct;

class ORX_EXPORT DocumentBinding {
 public:
  // What a link may name as its end.
  struct Place {
    int node = -1;  // in the graph that is built
    int line = 0;
    bool isLeftOut = false;  // disabled, or it could not be built: links to it are dropped without a word
    bool takes = true;       // features
    bool gives = true;
    QString name;                         // of a transformer: its identifier
    QString port;                         // the only one of what is no transformer
    const TransformerCfg* cfg = nullptr;  // of a transformer
    TransformerPorts ports;
  };
  // What goes from port to port.
  struct Flow {
    const Place* source = nullptr;
    const Place* target = nullptr;
    QString output;
    QString input;
  };
  // An attribute that leaves an output under another name as well.
  struct AttributeCopy {
    const Place* source = nullptr;
    QString output;
    QString from;
    QString to;
  };

  // None is owned. Configurations come from `source`; those of a document that runs by itself know its
  // `parameters` and have its `listener`.
  DocumentBinding(const IXMLComponentReader& reader, TransformerSource& source, orx::Findings& findings,
                  const WorkspaceParameterDirectory* parameters = nullptr,
                  TransformerCfgListener* listener = nullptr);

  // False when a place has that number already, which stays.
  bool enter(int identifier, const Place& place);
  // Makes, configures and enters the transformer; null when it has no place.
  std::unique_ptr<TransformerCfg> enter(const TransformerStruct& record, int node);
  // Null for an unknown number. Stays until the next one is entered.
  const Place* find(int identifier) const;

  // Nothing when the link is left out.
  std::optional<Flow> flow(const LinkStruct& record);
  std::optional<AttributeCopy> attributeCopy(const LinkStruct& record);

 private:
  std::unique_ptr<TransformerCfg> make(const TransformerStruct& record, const QString& title);
  void configure(const TransformerStruct& record, const QString& title, TransformerCfg& cfg);
  void takeName(const QString& name, int line);
  bool findEnds(const LinkStruct& record, const Place*& source, const Place*& target);
  bool findPort(const LinkStruct& record, const Place& place, bool isOutput, unsigned number,
                const QString& name, QString& tag);
  bool readPort(const LinkStruct& record, const Place& place, bool isOutput, QString& tag);
  void reportPort(const LinkStruct& record, const Place& place, const QString& description);

  const IXMLComponentReader& m_reader;
  TransformerSource& m_source;
  orx::Findings& m_findings;
  const WorkspaceParameterDirectory* m_parameters;
  TransformerCfgListener* m_listener;
  QHash<int, Place> m_places;         // by identifier in the document
  QHash<QString, int> m_linesByName;  // of transformers
};
