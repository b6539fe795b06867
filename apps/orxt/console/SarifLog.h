// Findings as a SARIF 2.1.0 log, which code hosts and editors take.
#pragma once

#include <translation/Diagnostics.h>

#include <QHash>
#include <QJsonArray>
#include <QJsonObject>
#include <QString>

// One run. Rules of workspaces and mapping files are known; others are added before their findings.
class SarifLog {
 public:
  SarifLog();

  // A rule that is known already keeps its entry.
  void addRule(const QString& name, Severity severity, const QString& description = QString());
  // `line` is 0 when the file as a whole is meant; `node` may be empty.
  void addFinding(const QString& file, int line, Severity severity, const QString& rule, const QString& node,
                  const QString& text);
  // A file that cannot be read is a notification of the run, which then counts as not successful.
  void addUnreadable(const QString& file, const QString& reason);

  // As UTF-8 text.
  QString text() const;

 private:
  QHash<QString, int> m_rulePlaces;
  QJsonArray m_rules;
  QJsonArray m_results;
  QJsonArray m_notifications;
};
