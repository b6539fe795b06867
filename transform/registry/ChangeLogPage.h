// The page that shows what changed between two versions of a transformer: a whole HTML5 document, as lines.
#pragma once

#include <QString>
#include <QStringList>

class ChangeLogPage {
 public:
  explicit ChangeLogPage(const QString& title);

  // One version with its entries; texts are escaped here.
  void addVersion(const QString& heading, const QStringList& entries);
  QStringList lines() const;

 private:
  QStringList m_head;
  QStringList m_body;
};
