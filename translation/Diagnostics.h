// What was found wrong with a document, in the order in which it was found.
#pragma once

#include <platform/Export.h>
#include <translation/DiagnosticRules.h>

#include <QString>
#include <QStringList>

#include <vector>

struct Diagnostic {
  Rule rule;
  Severity severity;
  QString file;
  int line = 0;  // of the element in the file, from 1; 0 when the whole file is meant
  QString node;  // empty when no node is meant
  QString text;
  QString parameter;  // name of the parameter that is meant; empty when none is
};

class ORX_EXPORT Diagnostics {
 public:
  explicit Diagnostics(const QString& file) : m_file(file) {}

  const QString& file() const { return m_file; }
  // The text is the rule's message in the current language with `arguments` (at most five) filled in.
  void report(Rule rule, int line, const QString& node, const QStringList& arguments = QStringList());

  // With a text that another part of the system has put together.
  void reportText(Rule rule, int line, const QString& node, const QString& text);
  // About one parameter of the node.
  void reportParameter(Rule rule, int line, const QString& node, const QString& parameter,
                       const QString& text);
  // The parameter's value cannot be written, for the reason given.
  void reportUnwritable(int line, const QString& node, const QString& parameter, const QString& reason);
  // About another file than the document itself.
  void reportIn(const QString& file, Rule rule, int line, const QString& node, const QString& text);

  bool hasErrors() const { return m_errors > 0; }
  const std::vector<Diagnostic>& all() const { return m_all; }

 private:
  QString m_file;
  std::vector<Diagnostic> m_all;
  int m_errors = 0;
};

// "error", "warning" or "hint".
ORX_EXPORT QString severityName(Severity severity);
// FILE:LINE: severity: text; the line is left out when it is 0.
ORX_EXPORT QString formatFinding(const QString& file, int line, const QString& severity, const QString& text);
// The text with its node in front, as findings show it.
ORX_EXPORT QString textWithNode(const Diagnostic& diagnostic);
// FILE:LINE: error|warning|hint: NODE: text
ORX_EXPORT QString formatDiagnostic(const Diagnostic& diagnostic);
