// What the checks of definition files find.
#pragma once

#include <transform/findings/Finding.h>

#include <QString>

#include <vector>

class LintReport {
 public:
  void add(orx::Rule rule, const QString& file, int line, const QString& text);
  // By file, then line, then as they were found.
  void sort();
  const std::vector<orx::Finding>& findings() const { return m_findings; }

 private:
  std::vector<orx::Finding> m_findings;
};
