// One parameter of a configured transformer: its type, its value and its default.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/orxparameter.h>
#include <transform/core/Keywords.h>

#include <QString>
#include <QStringList>

#include <memory>

class ORX_EXPORT TransformParamCfg : public GUIType {
 public:
  TransformParamCfg() = default;
  // `lookupLines` give a plain choice its lookup table (`KEY,MAPPED%...` each).
  explicit TransformParamCfg(const GUIType& type, const QStringList& lookupLines = QStringList());

  const QString& getDefaultValue() const { return m_defaultValue; }
  void setDefaultValue(const QString& value) { m_defaultValue = value; }
  const QString& getValue() const { return m_value; }
  // Attribute types (not new-attribute types) lose a leading "&": they store the bare attribute name.
  void setValue(const QString& value);
  // What setValue() is to be given for this record to hold `value`, which was stored in a record before.
  QString settable(const QString& value) const;
  // Empty or "<Unused>".
  bool isUnset() const { return isUnsetValue(m_value); }

  // The type and, unless empty or `""`, a blank and the configuration.
  QString getTypeWithConfig() const;
  // Takes the type from a prompt line, or from the type text of a definition; name and prompt stay, the
  // lookup data is rebuilt.
  void setTypeFromGUILine(const QString& line);

  // The entries of a choice or list box type; empty for any other. Shared by all copies.
  const ChoiceList& choices() const;
  // The members of a multi-parameter or the columns of a table type; empty for any other. Shared by all
  // copies.
  const MemberList& members() const;
  bool isMultiParameter() const;
  bool isTable() const;

 private:
  // Whether setting the value would take its first character away.
  bool losesMark(const QString& value) const;

  struct LookupData;
  void rebuildLookupData();

  QString m_defaultValue;
  QString m_value;
  QStringList m_lookupLines;
  std::shared_ptr<const LookupData> m_lookupData;  // null for types that have neither choices nor members
};
