// Binds the records of one document to what they name: transformers to configurations, the ends of links to
// nodes and their ports. What cannot be placed is a finding; the rest is bound all the same, so that one run
// names every fault.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/GUIType.h>
#include <transform/custom/TransformerPorts.h>
#include <transform/findings/Findings.h>

#include <QHash>
#include <QString>

#include <map>
#include <memory>
#include <optional>
#include <set>
#include <tuple>

class IXMLComponentReader;
class TransformerCfg;
class TransformerCfgListener;
class TransformerSource;
class WorkspaceParameterDirectory;
struct GlobalParameterStruct;
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
    bool isRepeated = false;  // another link has said it
  };
  // An attribute that goes on along a flow under another name as well.
  struct AttributeCopy : Flow {
    std::size_t flow = 0;  // among those that repeat none, in the order in which they were bound
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

  // What the prompt line of a parameter says; the null type when it cannot be read.
  GUIType promptOf(const GlobalParameterStruct& record);

  // Nothing when the link is left out. Those of features come first.
  std::optional<Flow> flow(const LinkStruct& record);
  std::optional<AttributeCopy> attributeCopy(const LinkStruct& record);

 private:
  std::unique_ptr<TransformerCfg> make(const TransformerStruct& record, const QString& title);
  void configure(const TransformerStruct& record, const QString& title, TransformerCfg& cfg);
  void checkOutputs(const TransformerStruct& record, const Place& place, const TransformerCfg& cfg);
  void takeName(const QString& name, int line);
  bool findEnds(const LinkStruct& record, const Place*& source, const Place*& target);
  bool findPort(const LinkStruct& record, const Place& place, bool isOutput, unsigned number,
                const QString& name, QString& tag);
  bool readPort(const LinkStruct& record, const Place& place, bool isOutput, QString& tag);
  void reportPort(const LinkStruct& record, const Place& place, const QString& description);
  std::optional<Flow> findFlow(const LinkStruct& record);
  // False when no features flow there, or the attribute is given already.
  bool takeAttribute(const LinkStruct& record, AttributeCopy& copy);

  const IXMLComponentReader& m_reader;
  TransformerSource& m_source;
  orx::Findings& m_findings;
  const WorkspaceParameterDirectory* m_parameters;
  TransformerCfgListener* m_listener;
  QHash<int, Place> m_places;         // by identifier in the document
  QHash<QString, int> m_linesByName;  // of transformers

  struct Declared {
    QString value;
    QString promptLine;
    int line = 0;
  };
  QHash<QString, Declared> m_declared;  // parameters

  struct Taken {
    QString from;
    int line = 0;
  };
  struct BoundFlow {
    std::size_t number = 0;
    int line = 0;
  };
  // Source and its port, target and its port.
  using Ends = std::tuple<int, QString, int, QString>;
  std::map<Ends, BoundFlow> m_flows;
  std::map<Ends, std::map<QString, Taken>> m_copies;  // by flow, which an input and a loop point may share
  QHash<QString, int> m_givingPorts;                  // the first of each name
  std::set<std::pair<int, int>> m_leftOut;  // nodes that a link leads between which could not be bound
};
