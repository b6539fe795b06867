#include <platform/session/ORXString.h>
#include <platform/session/ORXStringArray.h>
#include <transform/workspace/XMLFeatureTypeElement.h>

#include <algorithm>

void XMLFeatureTypeElement::getName(IORXString& name) const {
  ORXAssign(name, m_record.featureTypeName);
}
void XMLFeatureTypeElement::getKeyword(IORXString& keyword) const {
  ORXAssign(keyword, m_record.keyword);
}
void XMLFeatureTypeElement::getGeometry(IORXString& geometry) const {
  ORXAssign(geometry, m_record.featGeomtype);
}

void XMLFeatureTypeElement::getAttributes(IORXStringArray& names) const {
  QStringList list;
  for (const FeatAttributeStruct& attribute : m_record.attributes)
    list.append(attribute.attrName);
  ORXAssign(names, list);
}

bool XMLFeatureTypeElement::getAttrDataType(const IORXString& name, IORXString& type) const {
  const QString wanted = ORXToQString(name);
  const auto found =
      std::find_if(m_record.attributes.begin(), m_record.attributes.end(),
                   [&](const FeatAttributeStruct& attribute) { return attribute.attrName == wanted; });
  const bool exists = found != m_record.attributes.end();
  ORXAssign(type, exists ? found->attrType : QString());
  return exists;
}
