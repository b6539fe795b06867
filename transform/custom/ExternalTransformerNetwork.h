// The network of a custom transformer that lives in a file of its own.
//
// The header of the wanted version is read at once, its body when it is first asked for. What the body holds
// wrong, or why it could not be read, stands in problems(); the header's answers do not depend on it.
#pragma once

#include <transform/custom/CustomTransformerHeader.h>
#include <transform/custom/ExternalDocNetwork.h>
#include <transform/workspace/VersionInfo.h>

#include <memory>

class SubDocumentLibrary;

class ORX_EXPORT ExternalTransformerNetwork : public ExternalDocNetwork {
 public:
  // A negative version is the first one in the file. `manager`, usually the TransformerMgr, makes the
  // transformers inside; it is not owned and may be null when the body is never asked for.
  ExternalTransformerNetwork(const QString& fileName, int version, TransformerSource* manager);
  ~ExternalTransformerNetwork() override;

  // Whether the file holds the wanted version.
  bool isLoaded() const { return m_isLoaded; }
  // Why there is nothing inside, as a message for the user; empty unless the body was asked for and could not
  // be read. A body that wants a routine for deciphering is tried again once there is one.
  const QString& bodyFault() const { return m_bodyFault; }
  // The lines of the definition block, without their prefix.
  const QStringList& definitionLines() const { return m_header.definitionLines; }

  QStringList getInputs() const override;
  QStringList getOutputs() const override;
  QStringList getLoops() const override;
  const std::list<TransformerCfg*>& getTransformers() const override;
  QString getFileName() const override;
  void setInputAttributes(const QString& input, const QStringList& attributes) override;
  void setInputAttributes(const QHash<QString, QStringList>& attributes) override;
  QStringList getOutputAttributes(const QString& output, QHash<QString, QString>& origins) const override;
  bool hasTransformerNamed(const QString& identifier) const override;
  QStringList getParameters() const override;
  bool hasParameter(const QString& name) const override;
  const CompoundTransformerParm* getParameterInfo(const QString& name) const override;
  IncomingAttributePropogationMode getIncomingAttributePropogationMode() const override;
  QStringList getUpstreamInputs(const QString& output) const override;
  QHash<QString, QString> getProperties() const override;
  QStringList getDescriptionLines() const override;
  // Copies this version alone, byte for byte unless its settings were changed; refused for an enciphered
  // file. What is read back from the copy equals this network.
  bool extractToFile(const QString& fileName) override;
  int getStartLine() const override;
  bool getIsEmbeddable() const override;
  int getInsertMode() const override;
  bool getIsDefinitionValid() const override;
  void setBlockedLooping(bool blocked) override;
  void forceLoad() override;
  void turnOffMultiProcessing() override;
  void doneAdding(bool parametersChanged) override;
  // Whether the file may be written and does not belong to the product.
  bool isDefinitionDeletable() const override;
  // Takes this version out of the file; the file goes with the last one.
  bool deleteDefinition() override;
  bool isBodyLoaded() const override;

 protected:
  // The header has the last word.
  void takeIdentity(const QHash<QString, QString>& settings) override;

 private:
  void readHeader(int version);
  void loadBody();
  // Whether the body is unreadable for want of a routine for deciphering.
  bool lacksRoutine() const;
  // Where the version stands in its file, or in a plain copy of that; a negative length when it is not there
  // any more. `count` receives how many versions there are.
  VersionInfo findVersion(const QString& fileName, int* count = nullptr) const;
  bool isEnciphered() const;
  void ensureBody() const;

  QString m_fileName;
  TransformerSource* m_manager;
  CustomTransformerHeader m_header;
  QString m_insertMode;
  bool m_isLoaded = false;
  bool m_isComplete = false;
  bool m_isLoading = false;
  bool m_lacksRoutine = false;
  bool m_settingsChanged = false;
  QString m_bodyFault;
  std::unique_ptr<SubDocumentLibrary>
      m_library;  // the custom transformers that stand inside, in the same file
};
