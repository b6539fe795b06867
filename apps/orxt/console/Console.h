// Standard output for results, standard error for all else.
#pragma once

#include <transform/findings/Findings.h>

#include <QByteArray>
#include <QString>
#include <QStringList>

class Console {
 public:
  Console();

  // Results; false when standard output takes no more.
  bool print(const QString& text);
  bool flush();
  // "orxt: text" on standard error, whatever a stranger's name in it holds.
  void fail(const QString& text);
  // With one of orx::messages.
  void fail(long message, const QStringList& arguments = QStringList());
  // A file that could not be read or written: "FILE: error: reason".
  void failFile(const QString& file, const QString& reason);
  void failFile(const QString& file, long message, const QStringList& arguments = QStringList());
  void show(const orx::Findings& findings);
  // With the name of its rule behind it.
  void show(const orx::Finding& finding);
  // The same form for findings that no rule of workspaces covers.
  void showFinding(const QString& file, int line, orx::Severity severity, const QString& text);
  // Overwrites the last progress line; nothing unless standard error is a terminal.
  void showProgress(const QString& text);
  void endProgress();

 private:
  void writeError(const QString& text);

  bool m_colours;
  bool m_progress;
  bool m_progressShown = false;
};
