// The members of a MULTIPARAMETER or the columns of a GUI_LINE_TABLE.
//
// Configuration: the word-encoded separator, a comma, then the word-encoded prompt lines of the members,
// separated by commas; one token without blanks. A separator that is not exactly one character counts as ",";
// a piece that is no prompt line is no member. A MULTIPARAMETER's value is the list name, value, name, value
// packed with the separator; a table's value is its cells, row by row, packed with the separator. Of several
// members of one name the first counts, in the configuration as in a value.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/GUIType.h>

#include <QHash>
#include <QString>
#include <QStringList>

#include <vector>

class ORX_EXPORT MemberList {
 public:
  MemberList() = default;
  // Empty for a type that has no members.
  explicit MemberList(const GUIType& type);

  QChar separator() const { return m_separator; }
  const std::vector<GUIType>& members() const { return m_members; }
  // Null when no member has the name.
  const GUIType* find(const QString& name) const;

  // The part of a packed MULTIPARAMETER value that belongs to `member`; empty when it has none. A name behind
  // which the value ends has an empty part.
  QString memberValue(const QString& value, const QString& member) const;
  // The packed value with the part of `member` replaced, all other parts as they were, to the character
  // unless faulty quotes in them would swallow the new part; the whole is packed anew then. A member that the
  // value does not name is put at its end.
  QString withMemberValue(const QString& value, const QString& member, const QString& part) const;

  // Null types are left out.
  static QString configToken(QChar separator, const std::vector<GUIType>& members);

 private:
  QChar m_separator = QLatin1Char(',');
  std::vector<GUIType> m_members;
  QHash<QString, int> m_byName;
};
