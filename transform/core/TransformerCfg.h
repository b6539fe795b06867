// The configuration of one transformer instance placed in a workspace: its parameters, its ports, the feature
// types and attributes that reach it, and the template from which it writes its share of the mapping file.
//
// The definition side (names, tags, texts, template, lookups) is immutable after configure() and shared by
// all copies; values and port data are each instance's own. An object owns its parameter records; the
// listener, the session and the directories set on it are not owned and must outlive it. Used by one thread
// at a time.
//
// The virtual operations stand in the order of their slots, which callers compiled elsewhere rely on: none is
// added.
#pragma once

#include <platform/Export.h>
#include <transform/core/ITransformerCfg.h>
#include <transform/core/ParameterSet.h>
#include <transform/core/PortTables.h>
#include <transform/core/TransformParamCfg.h>
#include <transform/core/UnpackLevel.h>
#include <transform/core/ValueEncoding.h>

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

#include <memory>
#include <typeinfo>
#include <vector>

class AttributePassage;
class AttributeReferences;
class CompiledTemplate;
class ConfiguredDefinition;
class DefinitionDirectory;
class IORXSession;
class MFBuffer;
class ParameterSubstitution;
class PortTexts;
class QTextStream;
class Substitution;
class TransformerCfgListener;
class TransformerSource;
class WorkspaceParameterDirectory;
struct PreservedAttributes;
struct TransformerDefinition;

// What addAttributesToList() adds: attributes that a parameter's value names.
struct AddAttributesInfo {
  QString parameter;       // the parameter whose value lists the attributes; may be empty
  QStringList attributes;  // attributes named outright, behind those of the parameter
  QString listName;        // when not empty, the attributes become members of this list ("LIST{}.NAME")
};

class ORX_EXPORT TransformerCfg : public ITransformerCfg {
 public:
  enum TransformerType {
    kOrdinary = 0,
    kBuiltIn = 1,  // the definition file lies under the product's home
  };

  static const QString kAll;    // "ALL"
  static const QString kGroup;  // "GROUPED"
  static const QString kNone;   // "NONE"

  // Workspaces edited by a build after this one divide with fractions in expressions.
  static int floatDivisionBuild;
  // The number of this build.
  static constexpr int kThisBuild = 18286;

  TransformerCfg();
  ~TransformerCfg() override;
  TransformerCfg(const TransformerCfg&) = delete;
  TransformerCfg& operator=(const TransformerCfg&) = delete;

  // The operations of the interface; each converts and forwards to the QString form below.
  void getName(IORXString& name) const override;
  void getFileName(IORXString& fileName) const override;
  void setIdentifier(const IORXString& identifier) override;
  void getInputTags(IORXStringArray& tags) const override;
  void getInputTagAliases(IORXStringArray& aliases) const override;
  bool lookupInputTagAlias(const IORXString& tag, IORXString& alias) const override;
  void getParameters(IORXStringArray& names) const override;
  void getOutputTags(IORXStringArray& tags) const override;
  bool getOutputFeatureType(const IORXString& tag, IORXString& featureType) const override;
  void addInputFeatureType(const IORXString& featureType) override;
  void addInputFeatureType(const IORXString& tag, const IORXString& featureType) override;
  void clearInputFeatureTypes() override;
  void getInputFeatureTypes(const IORXString& tag, IORXStringArray& featureTypes) const override;
  void addInputFilter(const IORXString& tag, const IORXString& filter) override;
  void addInputFilter(const IORXString& filter) override;
  void setOutputFeatureType(const IORXString& tag, const IORXString& featureType) override;
  void setOutputTagFuncs(const IORXString& tag, const IORXStringArray& functions) override;
  bool setParameterValue(const IORXString& name, const IORXString& value, bool notify) override;
  bool instantiate(IMFBuffer* buffer, const IORXString& documentName, bool inlineFlag) override;
  void turnOffMultiProcessing() override;
  void getUsedComponents(IORXStringArray& readers, IORXStringArray& writers, IORXStringArray& transformers,
                         bool recursive) const override;
  bool platformSupported() const override;

  // A new object of the same class with the same definition and values; owned by the caller.
  virtual TransformerCfg* getCopy() const;
  // Takes over the definition side and the values of `other`. Not taken over: the identity stem, which every
  // instance has for itself, and the listener, which watches one object.
  virtual void assign(const TransformerCfg* other);
  // Takes over values and what is connected to the ports alone; parameters that this object does not have are
  // left out.
  virtual void copyValues(const TransformerCfg* other);
  virtual int getVersion() const;
  virtual QString getFileName() const;
  // `shownNames`, when given, receives the names shown for tags that have one.
  virtual void getInputTags(QStringList& tags, QHash<QString, QString>* shownNames = nullptr) const;
  virtual QStringList getDynamicInputTags(QHash<QString, QString>* shownNames = nullptr) const;
  virtual QString getHiddenInputTag() const;
  virtual QString getHiddenOutputTag() const;
  virtual void getOutputTags(QStringList& tags, QHash<QString, QString>* shownNames = nullptr) const;
  virtual void setInputAttributes(const QString& tag, const QStringList& attributes);
  virtual void setInputAttributes(const QHash<QString, QStringList>& attributes);
  // What leaves the output: what passes through, what is added, lists included; each name once.
  virtual QStringList getOutputAttributes(const QString& tag) const;
  virtual bool parmValueAffectsOutputAttrs(const QString& parameter) const;
  virtual bool getShowParameter(const QString& parameter) const;
  virtual QString getParameterValue(const QString& parameter, UnpackLevel level = UnpackLevel::Stored) const;
  virtual QString getParameterDisplayValue(const QString& parameter,
                                           UnpackLevel level = UnpackLevel::Stored) const;
  virtual bool parameterSupportsAttributeReference(const QString& parameter) const;
  virtual const GUIType& getParameterGUIType(const QString& parameter) const;
  // The attributes that the parameter's value refers to, each once, in the order of reference.
  virtual QStringList getAttributeNamesInValue(const QString& parameter) const;
  // `missing` receives the referenced attributes that do not reach the transformer; `hasReferences` tells
  // whether the value holds at least one attribute reference.
  virtual void getMissingAttributeReferences(const QString& parameter, QStringList& missing,
                                             bool& hasReferences) const;
  virtual bool canCreateGlobalParameter(const QString& parameter) const;
  virtual QStringList getDescriptionLines() const;
  virtual QStringList getChangeLog() const;
  // The tooltip with its parameters filled in; `asHtml` escapes values for HTML.
  virtual void getTooltipLines(QStringList& lines, bool asHtml) const;
  // What a class has to say in its tooltip: texts for tokens "$(NAME)" of the tooltip that are no parameters,
  // lines to stand behind it and a title above it. All plain text; nothing by default.
  virtual void tooltipCustomizations(QHash<QString, QString>& tokens, QStringList& lines,
                                     QString& title) const;
  virtual QString getLocalizedName() const;
  // The parameter's prompt line; empty for an unknown parameter.
  virtual QString getGuiLine(const QString& parameter) const;
  virtual QString getDefaultMacroLine(const QString& parameter) const;
  // The attributes named by parameters whose type begins with `type`; `onlyInputs` leaves out those that do
  // not reach the transformer.
  virtual void getAttributesByType(const QString& type, QStringList& attributes, bool onlyInputs) const;
  // Any of "CONSTANT", "ATTRIBUTE", "PARAMETER", "EXPRESSION", "CONDITIONAL".
  virtual QStringList getSupportedValueTypes(const QString& parameter) const;
  // Stores a value without listener or reaction. False when there is no such parameter.
  virtual bool applyParameterValue(const QString& parameter, const QString& value);
  virtual bool validateParameter(const QString& parameter, QString& message) const;
  virtual bool getOutputFeatureType(const QString& tag, QString& featureType) const;
  virtual void clearInputFeatureType(const QString& tag);
  virtual bool getIsAsynchronous() const;
  virtual bool getIsBlocking() const;
  virtual bool getIsEmbeddable() const;
  virtual TransformerCfg* getLinkedVersion() const;
  virtual int getInsertMode() const;
  virtual QString getTransformerFile() const;
  virtual bool isDefinitionDeletable() const;
  virtual void deleteDefinition();
  virtual QString getGUID() const;
  virtual bool getRequiresVisualizerLauncher() const;
  virtual bool getIsSource() const;
  virtual bool getIsDefinitionValid() const;
  virtual bool getUsesTransformer(const QString& name, QSet<QString>* visited) const;
  virtual QString getVisualName() const;
  virtual void getUsedComponents(QStringList& readers, QStringList& writers, QStringList& transformers,
                                 bool recursive) const;
  // The text that replaces the parameter's token; may write statements into the buffer ahead of the
  // template's.
  virtual QString getParameterValueForMappingFile(const QString& name, const TransformParamCfg* parameter,
                                                  MFBuffer& buffer) const;
  virtual QStringList getTransformFactoryInputLines() const;
  virtual void autoUpgradeTransformer();
  virtual bool autoUpgradeSupported() const;
  // Takes over the values of an instance of an earlier version, by the definition's parameter mapping. The
  // base copies what has the same name or a mapped one. True when everything found a place.
  virtual bool upgradeTransformer(TransformerCfg* older);
  // Old tag to new tag, for tags that changed their name since `fromVersion`.
  virtual QHash<QString, QString> renamedInputTags(int fromVersion, TransformerCfg* older) const;
  virtual QHash<QString, QString> renamedOutputTags(int fromVersion, TransformerCfg* older) const;
  virtual int attributeConnectionStatus(const QString& tag, const QString& attribute, bool isInput,
                                        IORXSession* session) const;
  virtual void getConnectionParameters(QString& format, QString& dataset, QString& parameters) const;
  virtual void beginEditParms();
  virtual void endEditParms();
  virtual IORXSession* getOrxSession() const;
  virtual bool supportsInspect(const QString& parameter) const;
  virtual bool supportsOpenFolder(const QString& parameter) const;
  virtual QStringList openFolderParameters(const QString& parameter) const;
  virtual QStringList inspectParameters(const QString& parameter) const;
  virtual QString serialize() const;
  virtual void deserialize(QHash<QString, QString>& fields);
  virtual bool containsPython() const;
  // Puts these tokens in the place of what the definition says is preserved, for this object alone.
  virtual void updatePreservesAttributes(const QStringList& preserves);

 protected:
  virtual bool validateTableValues(const QString& parameter, const std::vector<TransformParamCfg>& columns,
                                   const QStringList& cells, QString& message) const;

 public:
  // What becomes of one incoming attribute on the way to an output; appends nothing when it does not pass.
  virtual void transformAttr(const QString& attribute, QStringList& result, const QString& inputTag,
                             const QString& outputTag) const;
  virtual void transformAllAttrs(QStringList& incoming, QStringList& result, const QString& inputTag,
                                 const QString& outputTag) const;
  // The attributes that the transformer itself adds to what leaves the output.
  virtual void addAdditionalAttrs(QStringList& result, const QString& outputTag) const;
  virtual void addAdditionalAttrsFromParameter(const QString& parameter, const QString& listName,
                                               const QString& outputTag, QStringList& result) const;
  virtual void onParameterChanged(const QString& parameter);
  virtual bool doInstantiate(MFBuffer& buffer, bool inlineFlag);
  virtual void substInputs(QStringList& lines) const;
  virtual void substOutputs(QStringList& lines) const;
  virtual void substParametersForToolTips(QStringList& lines) const;
  virtual void addAttributesToList(const AddAttributesInfo& info, QStringList& result) const;

  // --- configuration ---------------------------------------------------------------------------------------

  // Interprets the definition, adds the default parameters, runs the dependency checks. An unmet dependency
  // is recorded, not an error; `log`, when given, receives it and everything in the definition that could not
  // be understood, one line each.
  void configure(const TransformerDefinition& definition, IORXSession* session = nullptr,
                 QTextStream* log = nullptr);
  // Null before configure().
  const ConfiguredDefinition* definition() const { return m_definition.get(); }

  bool dependencyMet() const;
  QString dependencyMsg() const;

  // --- identity --------------------------------------------------------------------------------------------

  QString getName() const;
  QString getSavedName() const;
  void setSavedName(const QString& name) { m_savedName = name; }
  // The alias under which the registry was asked for this copy; empty when it was asked by name.
  QString getRequestedAlias() const { return m_requestedAlias; }
  void setRequestedAlias(const QString& alias) { m_requestedAlias = alias; }
  QString getIdentifier() const;
  void setIdentifier(const QString& identifier);
  QString getBaseGuid() const { return m_baseGuid; }
  // Instances whose stem is set write the same bytes at every run; without one a fresh stem is made.
  void setBaseGuid(const QString& stem) { m_baseGuid = stem; }
  TransformerType transformerType() const { return m_transformerType; }
  void setTransformerType(TransformerType type) { m_transformerType = type; }
  int lastParmEditBuild() const { return m_lastParmEditBuild; }
  void setLastParmEditBuild(int build) { m_lastParmEditBuild = build; }
  bool isAutoUpgraded() const { return m_autoUpgraded; }
  void setAutoUpgraded(bool upgraded) { m_autoUpgraded = upgraded; }

  TransformerCfgListener* listener() const { return m_listener; }
  void setListener(TransformerCfgListener* listener) { m_listener = listener; }
  void setParameterDirectory(const WorkspaceParameterDirectory* directory) {
    m_parameterDirectory = directory;
  }
  const WorkspaceParameterDirectory* parameterDirectory() const { return m_parameterDirectory; }
  void setDefinitionDirectory(const DefinitionDirectory* directory) { m_definitionDirectory = directory; }
  const DefinitionDirectory* definitionDirectory() const { return m_definitionDirectory; }

  // --- what the definition says ----------------------------------------------------------------------------

  const QStringList& getTemplateLines() const;
  QString category() const;
  QStringList tags() const;  // the category's tags
  QStringList aliases() const;
  int featureHolding() const;
  bool isVisible() const;
  bool isDeprecated() const;
  QString replacedBy() const;
  int replacedByVersion() const { return m_replacedByVersion; }
  void setReplacedByVersion(int version) { m_replacedByVersion = version; }
  bool nukersRequired() const;
  QString decorationName() const;
  bool isDecorationLeft() const;
  QStringList canvasProperties() const;
  QString pluginDialog() const;
  QString bannerImageName() const { return m_bannerImageName; }
  void setBannerImageName(const QString& name) { m_bannerImageName = name; }
  bool showInNavigator() const { return m_showInNavigator; }
  void setShowInNavigator(bool show) { m_showInNavigator = show; }
  bool strictParameterValidation() const { return m_strictParameterValidation; }
  void setStrictParameterValidation(bool strict) { m_strictParameterValidation = strict; }

  // Texts of a localised companion; each detaches this object's definition from its copies.
  void setDescriptionLines(const QStringList& lines);
  void setChangeLog(const QStringList& lines);
  void setTooltipLines(const QStringList& lines);
  void setLocalizedName(const QString& name);
  QString getTagDescription(const QString& tag) const;
  void setTagDescription(const QString& tag, const QString& description);

  // --- ports -----------------------------------------------------------------------------------------------

  QHash<QString, QString> getInputTagAliases() const;
  // False, and `alias` untouched, when the tag has no alias.
  bool lookupInputTagAlias(const QString& tag, QString& alias) const;
  void addInputFeatureType(const QString& featureType);
  void addInputFeatureType(const QString& tag, const QString& featureType);
  QStringList getInputFeatureTypes(const QString& tag) const;
  void addInputFilter(const QString& filter);
  void addInputFilter(const QString& tag, const QString& filter);
  void setOutputFeatureType(const QString& tag, const QString& featureType);
  void clearOutputFeatureTypes();
  void setOutputTagFuncs(const QString& tag, const QStringList& functions);
  QStringList getOutputTagFuncs(const QString& tag) const;
  QHash<QString, QStringList> getInputAttributes() const;
  // The same as setInputAttributes() and getOutputAttributes(), which are called with lists where the
  // object's class overrides what becomes of attributes; otherwise without any, at the cost of what changes.
  const QHash<QString, AttributeSet>& arrivingAttributes() const { return m_ports.inputAttributes; }
  void setArrivingAttributes(const QHash<QString, AttributeSet>& attributes);
  AttributeSet leavingAttributes(const QString& tag) const;
  // By the order of the inputs, each name once.
  QStringList getInputAttributeUnion() const;
  // The attribute names that the parameter's value lists, decoded; none that is only known at run time.
  QStringList attributesListedBy(const QString& parameter) const;

  // --- parameters ------------------------------------------------------------------------------------------

  // In definition order, which is the order of substitution.
  const QStringList& getParameters() const { return m_parameters.names(); }
  // Exact names only: members of a multi-parameter do not count.
  bool hasParameter(const QString& name) const;
  // The record of the name, else the first multi-parameter, in name order, that lists it as a member; null
  // when there is none. Owned by this object; stays valid until a parameter is added or removed.
  TransformParamCfg* getParameterByMacroName(const QString& name);
  const TransformParamCfg* getParameterByMacroName(const QString& name) const;
  // Cuts an overlong identifier, turns "&name" into an attribute reference where the type asks for it, lets
  // the listener rewrite the value when `notify`, stores it, reacts. False when there is no such parameter.
  bool setParameterValue(const QString& name, const QString& value, bool notify);
  QString getParameterType(const QString& name) const;
  const QString& getParameterPrompt(const QString& name) const;
  void setParameterPrompt(const QString& name, const QString& prompt);
  // Fills `table` with the lookup of a choice: shown to stored, or stored to shown when `direction` is
  // "STORED". False for an unknown parameter or one without lookup.
  bool getParameterLookupTable(const QString& name, const QString& direction,
                               QHash<QString, QString>& table) const;
  // Whether a person may edit the parameter: it has a prompt and its type is no mere label.
  bool canEditParm(const QString& name) const;
  bool isValueEncoded(const QString& name) const;
  // A stored value as people read it: decoded, choices by their shown side, members and rows separated,
  // passwords hidden, an unset value empty; `withPrompt` puts the prompt and ": " before it.
  QString formatParamDisplayString(const QString& name, const QString& value, bool withPrompt) const;
  // The cells of a table-valued parameter, row by row.
  QStringList getParameterTableValuesAsParts(const QString& name, UnpackLevel level) const;
  // Adds a parameter behind the others, or replaces the type of one that is there (its value stays).
  void addParameter(const TransformParamCfg& parameter);
  bool removeParameter(const QString& name);
  // Parameters whose value lists the names of groups. Of each value V of such a parameter P, "," separating
  // the word-encoded names, a group parameter DYNGROUP_P_n is kept, n from 1: its value is V, decoded, and it
  // frames the parameters whose names begin with V, encoded, and "_".
  const QStringList& getDynparamsParameters() const { return m_dynamicParameterNames; }
  void setDynparamsParameters(const QStringList& names);

  // --- mapping file ----------------------------------------------------------------------------------------

  bool instantiate(MFBuffer& buffer, const QString& documentName, bool inlineFlag = true);
  // What would make the statements wrong if they were written: values that the mapping file cannot carry,
  // deferred references that never close. One text per parameter; empty when the instance can be written.
  QHash<QString, QString> findUnwritableValues() const;
  static bool containsToken(const QStringList& lines, const QString& token);
  static void substToken(QStringList& lines, const QString& token, const QString& value);
  static void removeLinesWithToken(QStringList& lines, const QString& token);
  static void removeOutputClause(QStringList& lines, const QString& tag, bool wildcard);
  void substParametersForMappingFile(MFBuffer& buffer, QStringList& lines) const;
  static QString getParameterValueForMappingFile(const QString& value, ValueEncoding from, ValueEncoding to,
                                                 bool quote);
  static QString getParameterValueForMappingFile(const QString& value, bool isEncoded, bool quote);
  QString getDefaultMacroValue(const QString& name, UnpackLevel level) const;
  bool useBracketValueSyntax() const;
  QString resolveUserTypedMacro(const QString& value, UnpackLevel level) const;
  // Every parameter as one list of name, value, name, value, for a transform factory.
  QString getTransformerParams() const;
  QString wrapInEvaluateExpression(const QString& value, const QString& name, const QString& type,
                                   bool encoded) const;
  QString wrapGuiTableInEvaluateExpression(const TransformParamCfg& parameter, const QString& value) const;
  void writeMultiProcessTransformFact(MFBuffer& buffer, const QString& groupBy, const QString& parallelism,
                                      const QString& processSetting) const;

  // --- validation ------------------------------------------------------------------------------------------

  // Stops at the first refusal.
  bool validateParameters(QString& message) const;
  // Visits every name; refused ones are entered in `messages`.
  bool validateParameters(QStringList& names, QHash<QString, QString>& messages) const;

 protected:
  bool checkMultiParameterForMissingValues(const QString& value, const QString& type,
                                           QString& missingPrompt) const;
  void deepCopyParameterInfo(const TransformerCfg* other);
  void deepCopyAttributeInfo(const TransformerCfg* other);
  void addDefaultParms();
  // What the base's getParameterValueForMappingFile() makes of a value, for classes that write another one
  // than is stored.
  QString textForMappingFile(QString value, const QString& name, const TransformParamCfg* parameter,
                             MFBuffer& buffer) const;
  void writeChoiceBoxLookup(MFBuffer& buffer, const ChoiceList& lookup, const QString& value,
                            const QString& prompt, const QString& macro, bool optional) const;
  void writeListBoxLookup(MFBuffer& buffer, const ChoiceList& lookup, const QString& value,
                          const QString& prompt, const QString& macro, bool optional) const;
  // Returns the call of the procedure that it writes.
  QString writeChoiceLookupTclFunc(MFBuffer& buffer, const QString& name, const ChoiceList& lookup,
                                   const QString& value) const;

  ParameterSet& parameters() { return m_parameters; }
  const ParameterSet& parameters() const { return m_parameters; }
  PortTables& ports() { return m_ports; }
  const PortTables& ports() const { return m_ports; }
  // The definition for writing: detached from other objects first.
  // The reference is good until the object is copied or configured.
  ConfiguredDefinition& detachDefinition();
  void setName(const QString& name);
  void setVersion(int version);
  // Tells that objects of just this class leave to the base what becomes of attributes.
  void setPassesByRules(const std::type_info& type) { m_passesByRules = &type; }

 private:
  // The type of the values of the name: for a member of a multi-parameter the member's own.
  const GUIType& typeOfValue(const QString& name) const;
  QString displayString(const QString& name, const QString& value, bool withPrompt, bool isDecoded) const;
  // What a call from outside carries past operations whose signatures have no place for it.
  struct Call {
    const AttributePassage* passage = nullptr;  // of attributes on their way
    bool isHtml = false;                        // of a tooltip that is filled in
  };

  bool setParameterValue(const QString& name, const QString& value, bool notify, bool tellListener);
  QString tooltipValue(const QString& parameter) const;
  bool validateFile(const TransformParamCfg& record, const QString& parameter, QString& message) const;
  bool isConnectionKnown(const QString& encodedName) const;
  // `members` are those that the type itself lists; a registry may know better.
  bool checkMembers(const QString& value, const GUIType& type, const MemberList& members,
                    QString& missingPrompt) const;
  void addDefinedParameters(const TransformerDefinition& fields, QTextStream* log);
  void parseTagAliases(ConfiguredDefinition& definition);
  void initListActionDictionary(ConfiguredDefinition& definition, QTextStream* log);
  void setupPreservesAttributes(ConfiguredDefinition& definition, QTextStream* log);
  void checkDependencies(ConfiguredDefinition& definition, QTextStream* log);
  QStringList allInputTags() const;
  QStringList attributeTags() const;
  AttributeSet attributeUnion() const;
  // Whether a reference to the attribute finds it at an input.
  bool reaches(const QString& reference) const;
  bool passesByRules() const { return typeid(*this) == *m_passesByRules; }
  AttributeSet passedByRules(const QString& outputTag) const;
  const PreservedAttributes& preservedAttributes() const;
  void collectReferences(const QString& parameter, AttributeReferences& references) const;
  // The definition, or an empty one before configure().
  const ConfiguredDefinition& configured() const;
  void ensureBaseGuid();

  // The statements of this instance, without writing them. False when values insert each other without end.
  bool expandTemplate(MFBuffer& buffer, QStringList& lines);
  bool expandInOrder(ParameterSubstitution& values, MFBuffer& buffer, QStringList& lines) const;
  // Runs the step over the lines; notes when a substitution would have grown beyond all measure.
  template <class Step>
  void substitute(QStringList& lines, Step step) const;
  PortTexts portTexts() const;
  // Whether some text that is to be inserted holds a token itself, so that the order matters.
  static bool bringsTokens(const ParameterSubstitution& values, const PortTexts& ports);
  void putInstanceTokens(Substitution& lines) const;
  QString lookedUp(MFBuffer& buffer, const QString& name, const TransformParamCfg& record,
                   const QString& value) const;

  std::shared_ptr<const ConfiguredDefinition> m_definition;  // null before configure()
  std::shared_ptr<const PreservedAttributes> m_preserved;    // null: what the definition says
  QString m_baseGuid;
  QString m_savedName;
  QString m_requestedAlias;
  ParameterSet m_parameters;
  PortTables m_ports;
  const std::type_info* m_passesByRules = &typeid(TransformerCfg);
  mutable const Call* m_call = nullptr;  // the one that is on its way
  mutable bool m_isTooLarge = false;     // since statements were begun
  QString m_bannerImageName;
  bool m_showInNavigator = true;
  QStringList m_dynamicParameterNames;
  int m_replacedByVersion = -1;
  TransformerCfgListener* m_listener = nullptr;
  const WorkspaceParameterDirectory* m_parameterDirectory = nullptr;
  const DefinitionDirectory* m_definitionDirectory = nullptr;
  IORXSession* m_session = nullptr;
  int m_insertState = 2;  // carried for callers that read it; nothing here depends on it
  bool m_strictParameterValidation = true;
  int m_instantiationCounter = 0;
  bool m_autoUpgraded = false;
  int m_lastParmEditBuild = kThisBuild;
  TransformerType m_transformerType = kOrdinary;
};
