// The rules by which a feature type without a fixed schema finds its name, its schema and its geometry.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

// How one of the three is found.
enum class DynamicSchemaMode : int { Automatic = 0, Fixed = 1, FromAttribute = 2, FirstEncountered = 3 };

// Modes are plain integers here, so that a value outside DynamicSchemaMode can be held; it is written as
// "AUTOMATIC". Getters return copies, setters replace.
class ORX_EXPORT IDynamicSchemaInfo {
 public:
  virtual ~IDynamicSchemaInfo();

  virtual int getFeatureTypeMode() const = 0;
  virtual void setFeatureTypeMode(int mode) = 0;
  // The fixed name, or the attribute that supplies it.
  virtual QString getFeatureTypeName() const = 0;
  virtual void setFeatureTypeName(const QString& name) = 0;

  virtual int getDefinitionMode() const = 0;
  virtual void setDefinitionMode(int mode) = 0;
  // The fixed schema source, or the attribute that supplies it.
  virtual QString getDefinitionName() const = 0;
  virtual void setDefinitionName(const QString& name) = 0;

  virtual int getGeometryMode() const = 0;
  virtual void setGeometryMode(int mode) = 0;
  // The fixed geometry, or the attribute that supplies it.
  virtual QString getGeometryName() const = 0;
  virtual void setGeometryName(const QString& name) = 0;

  // Names of the attributes that are dropped from the dynamic schema.
  virtual QStringList getAttributesToRemove() const = 0;
  virtual void setAttributesToRemove(const QStringList& names) = 0;
};
