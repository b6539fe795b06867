#include <transform/workspace/DynamicSchemaInfo.h>

#include <array>

namespace {

// By mode.
const std::array<QLatin1String, 4>& modeNames() {
  static const std::array<QLatin1String, 4> names = {QLatin1String("AUTOMATIC"), QLatin1String("FIXED"),
                                                     QLatin1String("FROM_ATTRIBUTE"),
                                                     QLatin1String("FIRST_ENCOUNTERED")};
  return names;
}

}  // namespace

IDynamicSchemaInfo::~IDynamicSchemaInfo() = default;
DynamicSchemaInfo::~DynamicSchemaInfo() = default;

int DynamicSchemaInfo::getFeatureTypeMode() const {
  return m_featureTypeMode;
}
void DynamicSchemaInfo::setFeatureTypeMode(int mode) {
  m_featureTypeMode = mode;
}
QString DynamicSchemaInfo::getFeatureTypeName() const {
  return m_featureTypeName;
}
void DynamicSchemaInfo::setFeatureTypeName(const QString& name) {
  m_featureTypeName = name;
}

int DynamicSchemaInfo::getDefinitionMode() const {
  return m_definitionMode;
}
void DynamicSchemaInfo::setDefinitionMode(int mode) {
  m_definitionMode = mode;
}
QString DynamicSchemaInfo::getDefinitionName() const {
  return m_definitionName;
}
void DynamicSchemaInfo::setDefinitionName(const QString& name) {
  m_definitionName = name;
}

int DynamicSchemaInfo::getGeometryMode() const {
  return m_geometryMode;
}
void DynamicSchemaInfo::setGeometryMode(int mode) {
  m_geometryMode = mode;
}
QString DynamicSchemaInfo::getGeometryName() const {
  return m_geometryName;
}
void DynamicSchemaInfo::setGeometryName(const QString& name) {
  m_geometryName = name;
}

QStringList DynamicSchemaInfo::getAttributesToRemove() const {
  return m_attributesToRemove;
}
void DynamicSchemaInfo::setAttributesToRemove(const QStringList& names) {
  m_attributesToRemove = names;
}

QString DynamicSchemaInfo::modeName(int mode) {
  const auto& names = modeNames();
  const bool known = mode >= 0 && mode < static_cast<int>(names.size());
  return names[known ? static_cast<std::size_t>(mode) : 0];
}

int DynamicSchemaInfo::modeOfName(const QString& name) {
  const auto& names = modeNames();
  const auto found = std::find(names.begin(), names.end(), name);
  return found == names.end() ? 0 : static_cast<int>(found - names.begin());
}
