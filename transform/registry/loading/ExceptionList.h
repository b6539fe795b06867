// The list of transformers that may not be created on this platform.
//
// Fields separated by "|"; the first line names the columns, of which XFORMER_NAME, PLATFORM and
// SHOULD_CREATE_TRANSFORMER count.
#pragma once

#include <QHash>
#include <QString>

class QIODevice;

class ExceptionList {
 public:
  // Reads the home's list; a list that is missing or lacks a column changes nothing.
  void readFromHome();
  void read(QIODevice& device);

  // A name that the list does not hold may be created.
  bool isAllowed(const QString& name) const { return m_allowed.value(name, true); }

 private:
  QHash<QString, bool> m_allowed;
};
