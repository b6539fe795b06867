// Standard output for results, standard error for all else.
#pragma once

#include <translation/Diagnostics.h>

#include <QByteArray>
#include <QString>

class Console {
 public:
  Console();

  // Results; false when standard output takes no more.
  bool print(const QString& text);
  bool flush();
  // "orxt: text" on standard error, whatever a stranger's name in it holds.
  void fail(const QString& text);
  // A file that could not be read or written: "FILE: error: reason".
  void failFile(const QString& file, const QString& reason);
  void show(const Diagnostics& diagnostics);
  void show(const Diagnostic& diagnostic);
  // The same form for findings that no rule of workspaces covers.
  void showFinding(const QString& file, int line, Severity severity, const QString& text);
  // Overwrites the last progress line; nothing unless standard error is a terminal.
  void showProgress(const QString& text);
  void endProgress();

 private:
  void writeError(const QString& text);

  bool m_colours;
  bool m_progress;
  bool m_progressShown = false;
};
