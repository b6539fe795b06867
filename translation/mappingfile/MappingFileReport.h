// Takes what the checks of one mapping file find. Findings are bounded in number and length, so that a file
// of any content costs no more than its size.
#pragma once

#include <transform/findings/Findings.h>
#include <translation/NearestSpelling.h>

#include <QString>
#include <QStringList>

class MappingFileReport {
 public:
  // Not owned.
  explicit MappingFileReport(orx::Findings& diagnostics) : m_diagnostics(diagnostics) {}

  void add(orx::Rule rule, int line, const QStringList& arguments = {});
  // With the candidate that was probably meant by the first argument, when there is one.
  void addMisspelt(orx::Rule rule, int line, const QStringList& arguments, const QStringList& candidates);
  // The candidate that is spelt like `name`; empty when there is none.
  QString nearest(const QString& name, const QStringList& candidates);

 private:
  bool takesMore(int line);

  orx::Findings& m_diagnostics;
  NearestSpelling m_spelling;
  int m_count = 0;
};
