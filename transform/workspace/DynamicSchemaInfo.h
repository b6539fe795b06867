// The plain holder of the dynamic-schema rules; copied by value, owns its texts.
#pragma once

#include <transform/workspace/IDynamicSchemaInfo.h>

class ORX_EXPORT DynamicSchemaInfo : public IDynamicSchemaInfo {
 public:
  DynamicSchemaInfo() = default;
  DynamicSchemaInfo(const DynamicSchemaInfo&) = default;
  DynamicSchemaInfo(DynamicSchemaInfo&&) = default;
  DynamicSchemaInfo& operator=(const DynamicSchemaInfo&) = default;
  DynamicSchemaInfo& operator=(DynamicSchemaInfo&&) = default;
  ~DynamicSchemaInfo() override;

  int getFeatureTypeMode() const override;
  void setFeatureTypeMode(int mode) override;
  QString getFeatureTypeName() const override;
  void setFeatureTypeName(const QString& name) override;

  int getDefinitionMode() const override;
  void setDefinitionMode(int mode) override;
  QString getDefinitionName() const override;
  void setDefinitionName(const QString& name) override;

  int getGeometryMode() const override;
  void setGeometryMode(int mode) override;
  QString getGeometryName() const override;
  void setGeometryName(const QString& name) override;

  QStringList getAttributesToRemove() const override;
  void setAttributesToRemove(const QStringList& names) override;

  // The name of a mode in a document; "AUTOMATIC" for a value that is none.
  static QString modeName(int mode);
  // The mode of a name; 0 for a text that names none.
  static int modeOfName(const QString& name);

 private:
  int m_featureTypeMode = 0;
  QString m_featureTypeName;
  int m_definitionMode = 0;
  QString m_definitionName;
  int m_geometryMode = 0;
  QString m_geometryName;
  QStringList m_attributesToRemove;
};
