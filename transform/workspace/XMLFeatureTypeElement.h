// A feature type for callers without the string library. Holds its own copy of the record.
#pragma once

#include <platform/session/IORXString.h>
#include <platform/session/IORXStringArray.h>
#include <transform/workspace/WorkspaceRecords.h>

class ORX_EXPORT XMLFeatureTypeElement {
 public:
  explicit XMLFeatureTypeElement(const FeatureTypeStruct& record) : m_record(record) {}

  void getName(IORXString& name) const;
  // Of the dataset that the feature type belongs to.
  void getKeyword(IORXString& keyword) const;
  void getGeometry(IORXString& geometry) const;
  // The attributes' names in schema order; replaces what the array held.
  void getAttributes(IORXStringArray& names) const;
  // False, and an empty type, when there is no attribute of that name; of several the first counts.
  bool getAttrDataType(const IORXString& name, IORXString& type) const;

 private:
  FeatureTypeStruct m_record;
};
