// What the checks of definition files find.
#pragma once

#include <transform/findings/Finding.h>

#include <QString>
#include <QStringList>

#include <vector>

class LintReport {
 public:
  // `message` is one of orx::messages.
  void add(orx::Rule rule, long message, const QString& file, int line, const QStringList& arguments = {});
  // With a text that is put together already.
  void addText(orx::Rule rule, long message, const QString& file, int line, const QString& text);
  // By file, then line, then as they were found.
  void sort();
  const std::vector<orx::Finding>& findings() const { return m_findings; }

 private:
  std::vector<orx::Finding> m_findings;
};
