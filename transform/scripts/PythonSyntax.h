// Has Python compile scripts without running them: one interpreter for all that were given.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

#include <vector>

struct PythonFault {
  int script = 0;  // its index
  int line = 0;    // from 1; 0 when not known
  QString text;
};

class ORX_EXPORT PythonSyntax {
 public:
  // False when there is no interpreter, or it did not answer in time: errorString() then tells why and no
  // script counts as checked.
  bool check(const QStringList& scripts);
  const std::vector<PythonFault>& faults() const { return m_faults; }
  QString errorString() const { return m_error; }

 private:
  std::vector<PythonFault> m_faults;
  QString m_error;
};
