// A private temporary file that is deleted on every path.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QTemporaryFile>

// `nameTemplate` ends in "XXXXXX" and names the file inside the system's temporary folder; readable by its
// owner alone. Not open until open() is called.
class ORX_EXPORT TemporaryFile : public QTemporaryFile {
 public:
  explicit TemporaryFile(const QString& nameTemplate);
};
