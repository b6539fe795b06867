// The network of a custom transformer that stands in a workspace document.
//
// The settings of the sub-document give name ("NAME"), version ("VERSION", 1 without one), category, GUID
// ("GUID"), "BLOCKED_LOOPING" and "DEPRECATED" ("yes" or "true"), "PYTHON_COMPATIBILITY",
// "ORT_ATTRIBUTE_PROPOGATION_MODE", "USE_MARKDOWN" and the parallel settings ("PARALLELISM",
// "PARALLEL_GROUP_BY", "PARALLEL_PROCESS_SETTING", "PARALLEL_COUNT_SETTING"). Its global parameters are the
// published ones.
#pragma once

#include <transform/custom/CompoundTransformerNetwork.h>
#include <transform/findings/Findings.h>

#include <vector>

class IXMLComponentReader;
class TransformerSource;

class ORX_EXPORT ExternalDocNetwork : public CompoundTransformerNetwork {
 public:
  ExternalDocNetwork();
  ~ExternalDocNetwork() override;

  // Reads the sub-document of that name, or the main document for the empty name; what stood in the network
  // before is given up. `source` makes the inner transformers. What cannot be placed becomes a problem, the
  // rest is built all the same. Neither argument is kept.
  void build(const IXMLComponentReader& reader, const QString& subDocumentName, TransformerSource& source);
  // In the order in which they were found, without the name of a file.
  const std::vector<orx::Finding>& problems() const { return m_problems.all(); }

  bool hasTransformerNamed(const QString& identifier) const override;
  IncomingAttributePropogationMode getIncomingAttributePropogationMode() const override;
  bool isDeprecated() const override;
  QStringList getDescriptionLines() const override;
  bool instantiate(MFBuffer& buffer, TransformerCfg* instance, bool inlineFlag) override;
  QString getGUID() const override;
  bool blockedLooping() const override;
  void setBlockedLooping(bool blocked) override;
  void turnOffMultiProcessing() override;
  void saveSubdocPrefixMacro(const QString& prefixMacro, const QString& instance) override;
  QString subdocPrefixMacro(const QString& instance) const override;
  QString getPythonVersion() const override;
  ParallelSettings getParallelSettings() const override;
  bool getUseMarkdown() const override;

 protected:
  // Takes what the document's settings tell about the custom transformer as a whole.
  virtual void takeIdentity(const QHash<QString, QString>& settings);
  // What a file of its own tells in its header as well.
  void takeRunSettings(const QHash<QString, QString>& settings);

  void addProblem(const orx::Finding& problem) { m_problems.add(problem); }
  void addProblem(orx::Rule rule, long message, int line, const QString& node, const QString& text);
  void clearProblems() { m_problems = orx::Findings(QString()); }

  void setGUID(const QString& guid) { m_guid = guid; }
  void setDeprecated(bool deprecated) { m_isDeprecated = deprecated; }
  // Unlike setBlockedLooping() without telling anyone.
  void takeBlockedLooping(bool blocked) { m_isBlockedLooping = blocked; }
  void setPythonVersion(const QString& version) { m_pythonVersion = version; }
  void setParallelSettings(const ParallelSettings& settings) { m_parallel = settings; }

 private:
  class Builder;

  void takeSettings(const QHash<QString, QString>& settings);

  orx::Findings m_problems{QString()};
  QSet<QString> m_transformerNames;
  IncomingAttributePropogationMode m_incomingMode = kIncomingDeclared;
  QString m_guid;
  bool m_isDeprecated = false;
  bool m_isBlockedLooping = false;
  bool m_useMarkdown = false;
  QString m_pythonVersion;
  ParallelSettings m_parallel;
  QHash<QString, QString> m_prefixMacros;  // by instance
};
