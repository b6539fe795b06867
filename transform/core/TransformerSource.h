// What the configuration floor asks of a registry: a new configuration for a name and version, and what
// validation needs to know about connections and member types.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <memory>

class DefinitionDirectory;
class GUIType;
class MemberList;
class TransformerCfg;

class ORX_EXPORT TransformerSource {
 public:
  static constexpr int kNewestVersion = -1;
  static constexpr int kOldestVersion = -2;

  virtual ~TransformerSource();
  // A new configuration, or null when name or version is unknown. When the transformer is known all the same,
  // `refusal` receives a message for the user that says why; else it stays as it is.
  virtual std::unique_ptr<TransformerCfg> makeTransformer(const QString& name, int version,
                                                          QString* refusal = nullptr) = 0;
  // What the transformers made here are judged by; null when there is nothing to ask. Not owned.
  virtual const DefinitionDirectory* definitionDirectory() const;
};

class ORX_EXPORT DefinitionDirectory {
 public:
  virtual ~DefinitionDirectory();
  // `encodedName` is word-encoded.
  virtual bool isConnectionKnown(const QString& encodedName) const = 0;
  // The member definitions of a multi-parameter type, by the type's configuration; null when unknown. They
  // stay as long as the directory is not loaded anew.
  virtual const MemberList* memberDefinitions(const GUIType& type) const = 0;
};
