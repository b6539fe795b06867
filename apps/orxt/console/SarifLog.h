// Findings as a SARIF 2.1.0 log, which code hosts and editors take.
#pragma once

#include <transform/findings/Finding.h>

#include <QJsonArray>
#include <QString>

// One run, which knows every rule.
class SarifLog {
 public:
  void add(const orx::Finding& finding);
  // A file that cannot be read is a notification of the run, which then counts as not successful.
  void addUnreadable(const QString& file, const QString& reason);

  // As UTF-8 text.
  QString text() const;

 private:
  QJsonArray m_results;
  QJsonArray m_notifications;
};
