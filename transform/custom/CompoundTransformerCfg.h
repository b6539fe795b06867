// One instance of a custom transformer: a configuration whose ports, parameters and attributes come from a
// network instead of a definition.
//
// The network is shared by all instances and not owned; the instance listens to it and lives on, without
// ports, when the network goes first. The network computes attributes for one instance at a time: an instance
// keeps what reaches it and puts it to the network again before it asks, when another instance asked last.
#pragma once

#include <transform/core/TransformerCfg.h>
#include <transform/custom/CompoundTransformerNetworkListener.h>

#include <optional>

class CompoundTransformerNetwork;
class ParameterPlaces;

class ORX_EXPORT CompoundTransformerCfg : public TransformerCfg, public CompoundTransformerNetworkListener {
 public:
  enum class Body {
    Now,       // load the network's body at once
    Deferred,  // take what the header tells; the rest follows when the body is loaded or a copy is made
  };

  explicit CompoundTransformerCfg(CompoundTransformerNetwork* network, Body body = Body::Now);
  ~CompoundTransformerCfg() override;

  // Null after the network is gone.
  CompoundTransformerNetwork* getNetwork() const { return m_network; }

  TransformerCfg* getCopy() const override;
  // Takes over the values of `other`; from another custom transformer only those of parameters that both
  // have.
  void assign(const TransformerCfg* other) override;
  QString getFileName() const override;
  void getInputTags(QStringList& tags, QHash<QString, QString>* shownNames = nullptr) const override;
  void getOutputTags(QStringList& tags, QHash<QString, QString>* shownNames = nullptr) const override;
  void setInputAttributes(const QString& tag, const QStringList& attributes) override;
  void setInputAttributes(const QHash<QString, QStringList>& attributes) override;
  // Names that refer to a parameter of this instance, "$(NAME)", are given with its value; left out without
  // one.
  QStringList getOutputAttributes(const QString& tag) const override;
  // The same two with sets, see TransformerCfg: what is called for an object of this very class.
  void setArrivingAttributes(const QHash<QString, AttributeSet>& attributes);
  AttributeSet leavingAttributes(const QString& tag) const;
  bool parmValueAffectsOutputAttrs(const QString& parameter) const override;
  QStringList getDescriptionLines() const override;
  QStringList getChangeLog() const override;
  bool validateParameter(const QString& parameter, QString& message) const override;
  bool getIsAsynchronous() const override;
  bool getIsBlocking() const override;
  bool getIsEmbeddable() const override;
  int getInsertMode() const override;
  QString getTransformerFile() const override;
  bool isDefinitionDeletable() const override;
  void deleteDefinition() override;
  QString getGUID() const override;
  bool getRequiresVisualizerLauncher() const override;
  bool getIsSource() const override;
  bool getIsDefinitionValid() const override;
  bool getUsesTransformer(const QString& name, QSet<QString>* visited) const override;
  void getUsedComponents(QStringList& readers, QStringList& writers, QStringList& transformers,
                         bool recursive) const override;
  QStringList getTransformFactoryInputLines() const override;
  bool containsPython() const override;
  void turnOffMultiProcessing() override;
  // False, and nothing written, when instantiationFault() says so or a deferred reference never closes.
  bool doInstantiate(MFBuffer& buffer, bool inlineFlag) override;

  using TransformerCfg::getFileName;
  using TransformerCfg::getInputTags;
  using TransformerCfg::getOutputTags;
  using TransformerCfg::getUsedComponents;

  bool getUseMarkdown() const;
  // The first version that the network or a transformer inside names.
  QString pythonVersion() const;
  // What would make the parameter macros wrong if they were written: scripts that their block would change,
  // line breaks, deferred references that never close, values that a fragment inside cannot carry. One
  // message per parameter.
  QHash<QString, QString> findUnwritableParameters() const;
  // One message for each port whose name the statements cannot carry.
  QStringList findUnwritablePorts() const;
  // Why the settings of several processes cannot be written; empty when they can.
  QString refuseParallel() const;
  // A message for the user; empty when instances can be written.
  QString instantiationFault() const;
  // The caller sees to it that every deferred reference, "$[", in a value or script is closed;
  // doInstantiate() refuses one that is not.
  void writeParametersToMappingFile(MFBuffer& buffer, const QString& prefixMacro, bool defaultsOnly) const;

  void networkChanged(bool parametersChanged) override;
  void networkDeleted() override;
  void renameIONode(bool isInput, const QString& oldName, const QString& newName) override;

 protected:
  // Whether an AttributeSetter inside the network has "$(PARAMETER)" as its "DEST_ATTR".
  bool isParmUsedAsAttributeSetterAttribute(const QString& parameter) const;
  void networkChanged(bool parametersChanged, bool portsChanged);

 private:
  using Statements = std::vector<QStringList>;

  void takeParameters();
  void putInputAttributes() const;
  AttributeSet resolvedAttributes(AttributeSet attributes) const;
  Statements inputCollectors() const;
  Statements outputRenamers() const;
  // One line each.
  QStringList parameterStatements(const QString& prefixMacro, bool defaultsOnly) const;
  // The number of the message that says why, or 0.
  long refuseApart(const QString& parameter, const GUIType& type, const QString& stored) const;
  long refuseMacroValue(const QString& parameter, const QString& value,
                        std::optional<ParameterPlaces>& places) const;
  QString knownValue(const QString& parameter) const;
  long refuseSetting(const QString& parameter) const;
  bool printsMacroNames() const;
  QString macroValue(const QString& parameter, const GUIType& type, const QString& prefixMacro) const;
  // What the AttributeSetters inside, at any depth, have as their "DEST_ATTR".
  QSet<QString> attributeSetterDestinations() const;

  CompoundTransformerNetwork* m_network;
};
