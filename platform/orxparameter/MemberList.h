// The members of a MULTIPARAMETER or the columns of a GUI_LINE_TABLE.
//
// Configuration: the word-encoded separator, a comma, then the word-encoded prompt lines of the members,
// separated by commas; one token without blanks. A MULTIPARAMETER's value is the list name, value, name,
// value packed with the separator; a table's value is its cells, row by row, packed with the separator.
#pragma once

#include <platform/Export.h>
#include <platform/orxparameter/GUIType.h>

#include <QString>
#include <QStringList>

#include <vector>

class ORX_EXPORT MemberList {
 public:
  MemberList() = default;
  explicit MemberList(const GUIType& type);

  QChar separator() const { return m_separator; }
  const std::vector<GUIType>& members() const { return m_members; }
  // Null when no member has the name.
  const GUIType* find(const QString& name) const;

  // The part of a packed MULTIPARAMETER value that belongs to `member`; empty when it has none.
  QString memberValue(const QString& value, const QString& member) const;
  // The packed value with the part of `member` replaced, all other parts as they were.
  QString withMemberValue(const QString& value, const QString& member, const QString& part) const;

  static QString configToken(QChar separator, const std::vector<GUIType>& members);

 private:
  QChar m_separator = QLatin1Char(',');
  std::vector<GUIType> m_members;
};
