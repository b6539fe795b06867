// The configuration of one transformer instance, as callers without the string library see it. Texts are in
// the system's 8-bit encoding; arrays passed in for an answer are replaced.
#pragma once

#include <platform/Export.h>

class IMFBuffer;
class IORXString;
class IORXStringArray;

class ORX_EXPORT ITransformerCfg {
 public:
  virtual ~ITransformerCfg();

  virtual void getName(IORXString& name) const = 0;
  virtual void getFileName(IORXString& fileName) const = 0;
  virtual void setIdentifier(const IORXString& identifier) = 0;
  virtual void getInputTags(IORXStringArray& tags) const = 0;
  // The alias of each input tag, in the order of the tags; a tag without one stands for itself.
  virtual void getInputTagAliases(IORXStringArray& aliases) const = 0;
  // False, and `alias` untouched, when the tag has no alias.
  virtual bool lookupInputTagAlias(const IORXString& tag, IORXString& alias) const = 0;
  virtual void getParameters(IORXStringArray& names) const = 0;
  virtual void getOutputTags(IORXStringArray& tags) const = 0;
  // False, and `featureType` untouched, when the output is not connected.
  virtual bool getOutputFeatureType(const IORXString& tag, IORXString& featureType) const = 0;
  // Connects a feature type to the first input tag.
  virtual void addInputFeatureType(const IORXString& featureType) = 0;
  virtual void addInputFeatureType(const IORXString& tag, const IORXString& featureType) = 0;
  virtual void clearInputFeatureTypes() = 0;
  virtual void getInputFeatureTypes(const IORXString& tag, IORXStringArray& featureTypes) const = 0;
  // The n-th filter of a tag stands behind its n-th feature type.
  virtual void addInputFilter(const IORXString& tag, const IORXString& filter) = 0;
  // Adds a filter to the first input tag.
  virtual void addInputFilter(const IORXString& filter) = 0;
  virtual void setOutputFeatureType(const IORXString& tag, const IORXString& featureType) = 0;
  virtual void setOutputTagFuncs(const IORXString& tag, const IORXStringArray& functions) = 0;
  // False when there is no such parameter.
  virtual bool setParameterValue(const IORXString& name, const IORXString& value, bool notify) = 0;
  // Writes the instance's statements. `documentName` names the document the instance stands in and serves
  // messages alone. `buffer` must be one of this library's buffers; a null buffer writes nothing and answers
  // false.
  virtual bool instantiate(IMFBuffer* buffer, const IORXString& documentName, bool inlineFlag) = 0;
  virtual void turnOffMultiProcessing() = 0;
  // The readers, writers and transformers in use; with `recursive` also those inside custom transformers.
  virtual void getUsedComponents(IORXStringArray& readers, IORXStringArray& writers,
                                 IORXStringArray& transformers, bool recursive) const = 0;
  virtual bool platformSupported() const = 0;
};
