// The registry of transformer definitions, as callers without the string library see it.
//
// Used by one thread at a time. Texts are in the system's 8-bit encoding.
#pragma once

#include <platform/Export.h>

class IORXSession;
class IORXString;
class ITransformerCfg;

class ORX_EXPORT ITransformerMgr {
 public:
  // Version arguments: the highest and the lowest version registered under a name.
  static constexpr int NEWEST_VERSION = -1;
  static constexpr int OLDEST_VERSION = -2;

  // The one registry of the process, made on first use.
  static ITransformerMgr& getTransformerMgr();

  virtual bool isLoaded() const = 0;
  // Reads everything anew. `session` may be null; it is not owned and must outlive the registry's use.
  virtual void loadTransformers(IORXSession* session) = 0;
  // Reads the custom transformers of the same folders anew.
  virtual void reloadCustomTransformers() = 0;
  // Fills `fileName` with the file of the name's newest definition; empty when the name is unknown.
  virtual void getDefinitionFileName(const IORXString& name, IORXString& fileName) const = 0;
  // A new copy, owned by the caller; null when name or version is unknown.
  virtual ITransformerCfg* getTransformer(const IORXString& name, int version) = 0;
  virtual void resetIteration() = 0;
  // The change-log page of a configuration, as HTML.
  virtual void getChangeLog(ITransformerCfg* configuration, IORXString& page) const = 0;
  // Whether a definition of that name and version (for the two version arguments: any version) was refused.
  virtual bool isTransformerIgnored(const IORXString& name, int version) const = 0;

  // The next name's newest version, as a new copy owned by the caller; null after the last.
  ITransformerCfg* getNextTransformer();

 protected:
  virtual ~ITransformerMgr();
};
