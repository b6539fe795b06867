// Writes values that are only known for each feature: "@EvaluateExpression([FDIV,]TYPE,NAME,BODY)". The
// grammar stands in docs/mapping-file.md.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/orxparameter.h>

#include <QString>

class ORX_EXPORT ExpressionWriter {
 public:
  // With `fractions`, "/" divides with fractions, also between whole numbers.
  explicit ExpressionWriter(bool fractions) : m_fractions(fractions) {}

  // One value, conditional ones included. `type` is the type word of the parameter, `encoded` tells that the
  // value is word-encoded.
  QString wrap(const QString& value, const QString& name, const QString& type, bool encoded) const;
  // The packed value of a multi-parameter or a table: each part that needs it is wrapped, under the name of
  // the member, or the name of the table, "." and that of the column.
  QString wrapMembers(const QString& value, const MemberList& members) const;
  QString wrapCells(const QString& value, const QString& name, const MemberList& columns) const;

  // Whether the value depends on the feature: it is conditional, it is an attribute reference as a whole, or
  // it holds one and the type may, or has no encoding of its own. Expressions are evaluated by their factory
  // and stay as they are; so are references inside the texts of other encoded types.
  static bool needsWrapping(const GUIType& type, const QString& value);
  // Whether what is wrapped for the type is a formula, whose result is a number.
  static bool isComputed(const GUIType& type);

 private:
  const bool m_fractions;
};
