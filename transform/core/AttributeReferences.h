// Attributes that parameter values refer to: "@Value(NAME)" inside a value, also in its word-encoded form,
// and the values of attribute types, which are names as a whole.
#pragma once

#include <platform/orxparameter/orxparameter.h>

#include <QSet>
#include <QString>
#include <QStringList>

#include <functional>

class TransformParamCfg;

// Visits the parts of a value with their types: the members of a multi-parameter, the cells of a table, or
// the value itself. A part that no member bears the name of has the null type. A conditional value is one
// part.
void forEachPart(const TransformParamCfg& parameter, const QString& value,
                 const std::function<void(const GUIType& type, const QString& part)>& visit);

// The names that a value lists as a whole, decoded: one for single attribute types, those between ","
// otherwise. None for an unset or conditional value, and none that is only known at run time.
QStringList listedAttributeNames(const GUIType& type, const QString& value);

// Collects the attributes that values refer to, each once, in the order of reference.
class AttributeReferences {
 public:
  // Of a parameter with all its members or cells.
  void addParameter(const TransformParamCfg& parameter, const QString& value);
  // Of one value of a type without members.
  void addValue(const GUIType& type, const QString& value);

  const QStringList& names() const { return m_names; }
  // Whether every place that names the attribute also takes a name that is new.
  bool mayBeNew(const QString& name) const { return m_known.contains(name) && !m_required.contains(name); }

 private:
  void add(const QString& name, bool mayBeNew);

  QStringList m_names;
  QSet<QString> m_known;
  QSet<QString> m_required;
};
