// The operations of the interface, for callers without the string library: each converts and forwards.
#include <platform/session/session.h>
#include <transform/core/TransformerCfg.h>
#include <transform/text/MFBuffer.h>

void TransformerCfg::getName(IORXString& name) const {
  ORXAssign(name, getName());
}

void TransformerCfg::getFileName(IORXString& fileName) const {
  ORXAssign(fileName, getFileName());
}

void TransformerCfg::setIdentifier(const IORXString& identifier) {
  setIdentifier(ORXToQString(identifier));
}

void TransformerCfg::getInputTags(IORXStringArray& tags) const {
  QStringList list;
  getInputTags(list);
  ORXAssign(tags, list);
}

void TransformerCfg::getInputTagAliases(IORXStringArray& aliases) const {
  QStringList list;
  getInputTags(list);
  for (QString& tag : list) {
    lookupInputTagAlias(QString(tag), tag);
  }
  ORXAssign(aliases, list);
}

bool TransformerCfg::lookupInputTagAlias(const IORXString& tag, IORXString& alias) const {
  QString found;
  if (!lookupInputTagAlias(ORXToQString(tag), found)) {
    return false;
  }
  ORXAssign(alias, found);
  return true;
}

void TransformerCfg::getParameters(IORXStringArray& names) const {
  ORXAssign(names, getParameters());
}

void TransformerCfg::getOutputTags(IORXStringArray& tags) const {
  QStringList list;
  getOutputTags(list);
  ORXAssign(tags, list);
}

bool TransformerCfg::getOutputFeatureType(const IORXString& tag, IORXString& featureType) const {
  QString found;
  if (!getOutputFeatureType(ORXToQString(tag), found)) {
    return false;
  }
  ORXAssign(featureType, found);
  return true;
}

void TransformerCfg::addInputFeatureType(const IORXString& featureType) {
  addInputFeatureType(ORXToQString(featureType));
}

void TransformerCfg::addInputFeatureType(const IORXString& tag, const IORXString& featureType) {
  addInputFeatureType(ORXToQString(tag), ORXToQString(featureType));
}

void TransformerCfg::getInputFeatureTypes(const IORXString& tag, IORXStringArray& featureTypes) const {
  ORXAssign(featureTypes, getInputFeatureTypes(ORXToQString(tag)));
}

void TransformerCfg::addInputFilter(const IORXString& tag, const IORXString& filter) {
  addInputFilter(ORXToQString(tag), ORXToQString(filter));
}

void TransformerCfg::addInputFilter(const IORXString& filter) {
  addInputFilter(ORXToQString(filter));
}

void TransformerCfg::setOutputFeatureType(const IORXString& tag, const IORXString& featureType) {
  setOutputFeatureType(ORXToQString(tag), ORXToQString(featureType));
}

void TransformerCfg::setOutputTagFuncs(const IORXString& tag, const IORXStringArray& functions) {
  setOutputTagFuncs(ORXToQString(tag), ORXToQStringList(functions));
}

bool TransformerCfg::setParameterValue(const IORXString& name, const IORXString& value, bool notify) {
  return setParameterValue(ORXToQString(name), ORXToQString(value), notify);
}

bool TransformerCfg::instantiate(IMFBuffer* buffer, const IORXString& documentName, bool inlineFlag) {
  auto* own = dynamic_cast<MFBuffer*>(buffer);
  return own && instantiate(*own, ORXToQString(documentName), inlineFlag);
}

void TransformerCfg::getUsedComponents(IORXStringArray& readers, IORXStringArray& writers,
                                       IORXStringArray& transformers, bool recursive) const {
  QStringList readerList;
  QStringList writerList;
  QStringList transformerList;
  getUsedComponents(readerList, writerList, transformerList, recursive);
  ORXAssign(readers, readerList);
  ORXAssign(writers, writerList);
  ORXAssign(transformers, transformerList);
}
