// The page that shows what changed between two versions of a transformer: a whole HTML5 document, as lines.
#pragma once

#include <QString>
#include <QStringList>

class ChangeLogPage {
 public:
  // In the current language. Plain texts; they are escaped here, as are those below.
  explicit ChangeLogPage(const QString& title);

  // One version with its entries, of which there is at least one.
  void addVersion(const QString& heading, const QStringList& entries);
  // A sentence on its own.
  void addText(const QString& text);
  bool isEmpty() const { return m_body.isEmpty(); }

  QStringList lines() const;

 private:
  QString m_title;  // escaped
  QStringList m_body;
};
