// Takes what the checks of one mapping file find. Findings are bounded in number and length, so that a file
// of any content costs no more than its size.
#pragma once

#include <translation/Diagnostics.h>
#include <translation/NearestSpelling.h>

#include <QString>
#include <QStringList>

class MappingFileReport {
 public:
  // Not owned.
  explicit MappingFileReport(Diagnostics& diagnostics) : m_diagnostics(diagnostics) {}

  void add(Rule rule, int line, const QStringList& arguments = {});
  // With the candidate that was probably meant by the first argument, when there is one.
  void addMisspelt(Rule rule, int line, const QStringList& arguments, const QStringList& candidates);
  // The candidate that is spelt like `name`; empty when there is none.
  QString nearest(const QString& name, const QStringList& candidates);

 private:
  bool takesMore(int line);

  Diagnostics& m_diagnostics;
  NearestSpelling m_spelling;
  int m_count = 0;
};
