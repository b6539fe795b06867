// Finds the name that was meant when one was misspelt. What it costs is bounded: by the length of names, by
// the candidates looked at for one name, and by those looked at in the object's whole life.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

class ORX_EXPORT NearestSpelling {
 public:
  // The candidate with the fewest letters added, left out, changed or swapped, the first of several; upper
  // and lower case are alike. Empty when none comes close, or the bounds are reached. What counts as close
  // hangs on the length of the name; it is never more than `mostEdits`.
  QString find(const QString& name, const QStringList& candidates, int mostEdits = 3);

 private:
  int m_budget = 200000;  // candidates that may still be looked at
};
