// What the registry has to say about categories: descriptions, and names in the language of the load.
#pragma once

#include <QHash>
#include <QString>
#include <QStringList>

class CategoryTexts {
 public:
  // In the place of an earlier one.
  void describe(const QString& category, const QStringList& lines) { m_descriptions.insert(category, lines); }
  void setLocalizedName(const QString& category, const QString& localizedName);

  // False, with `lines` as they were, when there is no description.
  bool description(const QString& category, QStringList& lines) const;
  // What has no other name keeps its own.
  QString localizedName(const QString& category) const { return m_localizedNames.value(category, category); }
  QString nameOf(const QString& localizedName) const { return m_names.value(localizedName, localizedName); }

 private:
  QHash<QString, QStringList> m_descriptions;
  QHash<QString, QString> m_localizedNames;
  QHash<QString, QString> m_names;  // by localised name
};
