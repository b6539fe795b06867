// The utility library's own string: a holder that converts to QString.
#pragma once

#include <platform/Export.h>

#include <QString>

class ORX_EXPORT QORXString {
 public:
  const QString& toQString() const { return m_text; }
  void assign(const QString& text) { m_text = text; }

 private:
  QString m_text;
};
