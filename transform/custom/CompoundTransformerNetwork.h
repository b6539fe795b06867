// The graph of a custom transformer: its ports, loops and inner transformers as nodes, the links between
// their ports, its published parameters, and what the custom transformer answers as a whole.
//
// A network is shared by all instances of its custom transformer, which listen to it. It owns its nodes and
// the inner transformers; listeners are not owned. Answers about attributes hold for the input attributes set
// last: an instance puts its own before it asks (CompoundTransformerCfg does). Used by one thread at a time.
//
// The virtual operations stand in the order of their slots: add new ones behind the last.
#pragma once

#include <platform/Export.h>
#include <transform/core/AttributeSet.h>
#include <transform/custom/AttributePropogationMode.h>
#include <transform/custom/CompoundTransformerParm.h>
#include <transform/custom/ParallelSettings.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

#include <cstdint>
#include <list>
#include <map>
#include <memory>
#include <typeinfo>
#include <vector>

class CompoundTransformerNetworkListener;
class NetworkListeners;
struct MetAttributes;
struct NetworkOrder;
class InnerTransformerListener;
class MFBuffer;
class SubDocNetworkObj;
class SubDocNetworkObjInput;
class SubDocNetworkObjLoop;
class SubDocNetworkObjOutput;
class SubDocNetworkObjXformer;
class TransformerCfg;

class ORX_EXPORT CompoundTransformerNetwork {
 public:
  // What leaves a loop passes to the output of this fixed name.
  static const QString kLoopOutput;  // "INCOMPLETE"
  // Custom transformers may stand inside each other this deep.
  static constexpr int kDeepestNesting = 64;

  CompoundTransformerNetwork();
  CompoundTransformerNetwork(const CompoundTransformerNetwork&) = delete;
  CompoundTransformerNetwork& operator=(const CompoundTransformerNetwork&) = delete;

  virtual ~CompoundTransformerNetwork();
  virtual QString getName() const;
  virtual int getVersion() const;
  virtual QString getCategory() const;
  // In the order of adding.
  virtual QStringList getInputs() const;
  virtual QStringList getOutputs() const;
  virtual QStringList getLoops() const;
  virtual const std::list<TransformerCfg*>& getTransformers() const;
  virtual QString getFileName() const;
  // An unknown input is ignored.
  virtual void setInputAttributes(const QString& input, const QStringList& attributes);
  // Inputs that are not named get none.
  virtual void setInputAttributes(const QHash<QString, QStringList>& attributes);
  // Attributes that the port's author declared: they reach the inside whatever else arrives.
  virtual void setStaticInputAttributes(const QString& input, const QStringList& attributes);
  // `origins` receives the attributes met on the way, each with the name of the node that it came from first.
  // Empty for an unknown output.
  virtual QStringList getOutputAttributes(const QString& output, QHash<QString, QString>& origins) const;
  // Whether an inner transformer of that identifier stands in the document; case counts.
  virtual bool hasTransformerNamed(const QString& identifier) const = 0;
  // In the order of publishing.
  virtual QStringList getParameters() const;
  virtual bool hasParameter(const QString& name) const;
  // Null for an unknown parameter; valid until the next change.
  virtual const CompoundTransformerParm* getParameterInfo(const QString& name) const;
  virtual IncomingAttributePropogationMode getIncomingAttributePropogationMode() const;
  // The inputs that feed the output, in the order in which they stand before it.
  virtual QStringList getUpstreamInputs(const QString& output) const;
  virtual bool isDeprecated() const;
  virtual QHash<QString, QString> getProperties() const;
  virtual QStringList getDescriptionLines() const;
  // Writes the network's own statement for an instance. False when nothing could be written.
  virtual bool instantiate(MFBuffer& buffer, TransformerCfg* instance, bool inlineFlag) = 0;
  virtual bool getIsAsynchronous() const;
  virtual bool getIsBlocking() const;
  // Writes the definition into a file of its own. False when it could not; extractError() says why.
  virtual bool extractToFile(const QString& fileName);
  virtual int getStartLine() const;
  virtual bool getIsEmbeddable() const;
  virtual int getInsertMode() const;
  virtual QString getGUID() const;
  virtual bool getIsDefinitionValid() const;
  // Whether a transformer of that name stands inside, at any depth. `visited`, which may be null, holds the
  // custom transformers ("NAME:VERSION") that need no second look.
  virtual bool getUsesTransformer(const QString& name, QSet<QString>* visited) const;
  // What stands inside, each name once; with `recursive` also what stands inside nested custom transformers.
  virtual void getUsedComponents(QStringList& readers, QStringList& writers, QStringList& transformers,
                                 bool recursive) const;
  virtual bool blockedLooping() const;
  virtual void setBlockedLooping(bool blocked);
  // Makes sure that the body is there; networks that are complete from the beginning have nothing to do.
  virtual void forceLoad();
  virtual void turnOffMultiProcessing();
  virtual void saveSubdocPrefixMacro(const QString& prefixMacro, const QString& instance);
  virtual QString subdocPrefixMacro(const QString& instance) const;
  virtual bool containsPythonTransformer() const;
  virtual QString getPythonVersion() const;
  // Finishes the graph and tells the listeners; `parametersChanged` is passed on to them.
  virtual void doneAdding(bool parametersChanged);
  // Empty in the base.
  virtual ParallelSettings getParallelSettings() const;
  virtual bool isDefinitionDeletable() const;
  // False when it could not be deleted.
  virtual bool deleteDefinition();
  // Whether texts of the definition are written in a markup that editors render.
  virtual bool getUseMarkdown() const;
  // Clear while forceLoad() still has something to do.
  virtual bool isBodyLoaded() const;

  // --- editing ---------------------------------------------------------------------------------------------
  // Each does nothing, and answers false, when there is no such node under that number; otherwise listeners
  // are told.

  bool removeInput(const QString& name, int nodeNumber);
  bool removeOutput(const QString& name, int nodeNumber);
  bool removeLoop(const QString& name, int nodeNumber);
  // Also false when the new name is empty or taken by a port of the same kind.
  bool renameInput(const QString& oldName, const QString& newName);
  bool renameOutput(const QString& oldName, const QString& newName);
  // Takes out everything but the name, the version and the listeners.
  void clear();

  // --- listeners -------------------------------------------------------------------------------------------

  void addListener(CompoundTransformerNetworkListener* listener);
  void removeListener(CompoundTransformerNetworkListener* listener);
  bool getIsInUse() const;

  // --- queries ---------------------------------------------------------------------------------------------

  // Mode 0, and the list untouched, for an unknown output.
  void getOutputAttributeMode(const QString& output, OutgoingAttributePropogationMode& mode,
                              QStringList& attributes) const;
  void setOutputAttributeMode(const QString& output, OutgoingAttributePropogationMode mode,
                              const QStringList& attributes);
  // The first loop; empty when there is none.
  QString getLoopTo() const;
  QString getLoopOutput() const { return kLoopOutput; }
  // What was set on the input; with `withStatic` also what its author declared, each name once.
  QStringList getInputAttributes(const QString& input, bool withStatic) const;
  // The same as setInputAttributes() and getOutputAttributes() without lists, for networks of the classes
  // that say so: others may override those two.
  bool answersWithSets() const { return m_answering && typeid(*this) == *m_answering; }
  void setArrivingAttributes(const QHash<QString, AttributeSet>& attributes);
  AttributeSet leavingAttributes(const QString& output) const;
  // The name under which an inner transformer's parameter is published.
  static QString createExposedParmName(const QString& transformerName, const QString& parameterName);
  const QString& extractError() const { return m_extractError; }

  // All nodes in the order of adding; they stay owned by the network and valid until it changes.
  const std::list<SubDocNetworkObj*>& nodes() const { return m_nodes; }
  SubDocNetworkObj* nodeByNumber(int number) const;
  // Those of the inner transformers that are custom transformers themselves.
  const std::vector<TransformerCfg*>& customTransformers() const { return m_customTransformers; }
  // The instance that put the input attributes last, with whose values the published parameters are taken;
  // null when the attributes are nobody's.
  const TransformerCfg* attributeOwner() const { return m_attributeOwner; }
  void setAttributeOwner(const TransformerCfg* owner) { m_attributeOwner = owner; }
  // What a new instance starts from: made once, shared by all instances, renewed after a change.
  const TransformerCfg& instancePrototype() const;

 protected:
  // `position` counts the ports of the kind in their document. A second port or loop of a name is ignored,
  // but links to its number lead to the first.
  void addInput(const QString& name, int nodeNumber, int position);
  void addOutput(const QString& name, int nodeNumber, OutgoingAttributePropogationMode mode,
                 const QStringList& attributes, int position);
  void addLoop(const QString& name, int nodeNumber);
  // Takes the configuration over. `inputAttributes` are known to reach an input beside what the links bring.
  // A number that is taken already is refused, and the configuration deleted: null then.
  SubDocNetworkObjXformer* addTransformer(TransformerCfg* cfg,
                                          const QHash<QString, QStringList>& inputAttributes, int nodeNumber);
  // False when either node is unknown.
  bool addLink(int fromNode, const QString& fromPort, int toNode, const QString& toPort);
  // A second parameter of a name replaces the first.
  void addPublishedParameter(const GUIType& type, const QString& name);
  // Gives a parameter its default value; a new one is entered without a type.
  void addPublishedParameter(const QString& name, const QString& value);
  void onNetworkChanged(bool parametersChanged);
  using NodeSet = QSet<const SubDocNetworkObj*>;
  // Appends the node and everything upstream of it, depth first, ports in name order, links in the order of
  // adding. What stands in `set` ends a branch; what is appended is added to it.
  static void createAncestorList(SubDocNetworkObj* node, std::vector<SubDocNetworkObj*>& list, NodeSet& set);
  // clear() without telling the listeners.
  void clearNodes();

  void setName(const QString& name) { m_name = name; }
  void setVersion(int version) { m_version = version; }
  void setCategory(const QString& category) { m_category = category; }
  void setProperties(const QHash<QString, QString>& properties) { m_properties = properties; }
  void setExtractError(const QString& error) { m_extractError = error; }
  // Tells that objects of just this class leave queries for attributes to the base, once they are loaded.
  void setAnswersWithSets(const std::type_info& type) { m_answering = &type; }

 private:
  struct AttributeMemo;

  template <class Node>
  Node* enter(std::unique_ptr<Node> node);
  void noteNumber(int number, SubDocNetworkObj* node);
  bool removeNode(SubDocNetworkObj* node);
  void ensureOrders() const;
  void forgetOrders();
  AttributeSet leavingAttributes(const QString& output, MetAttributes& met) const;
  AttributeSet evaluate(SubDocNetworkObjOutput& output, const NetworkOrder& order, MetAttributes& met) const;
  AttributeSet arrivingAttributes() const;

  QString m_name;
  int m_version = 1;
  QString m_category;
  QHash<QString, QString> m_properties;
  QString m_extractError;

  std::map<int, SubDocNetworkObj*> m_nodesByNumber;
  QMultiHash<const SubDocNetworkObj*, int> m_numbers;  // with those of further ports of the same name
  std::map<QString, SubDocNetworkObjInput*> m_inputNodes;
  std::map<QString, SubDocNetworkObjOutput*> m_outputNodes;
  std::map<QString, SubDocNetworkObjLoop*> m_loopNodes;
  QStringList m_inputs;
  QStringList m_outputs;
  QStringList m_loops;
  std::list<TransformerCfg*> m_transformers;
  std::vector<TransformerCfg*> m_customTransformers;
  std::list<SubDocNetworkObj*> m_nodes;  // owned
  std::uint32_t m_nextSerial = 0;
  QHash<QString, CompoundTransformerParm> m_parameters;
  QStringList m_parameterNames;
  std::unique_ptr<NetworkListeners> m_listeners;

  mutable bool m_ordersValid = false;
  std::unique_ptr<std::map<QString, NetworkOrder>> m_orders;  // by output
  const std::type_info* m_answering = nullptr;
  const TransformerCfg* m_attributeOwner = nullptr;
  std::unique_ptr<InnerTransformerListener> m_innerListener;
  mutable std::unique_ptr<AttributeMemo> m_memo;  // of the nested query under way
  mutable bool m_isEvaluating = false;
  mutable std::shared_ptr<const TransformerCfg> m_prototype;
};
