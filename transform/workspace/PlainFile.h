// A file opened for reading; when it is enciphered, a plain temporary copy of it, deleted with this object.
#pragma once

#include <platform/Export.h>
#include <transform/files/TemporaryFile.h>

#include <QFile>
#include <QString>

#include <memory>

class ORX_EXPORT PlainFile {
 public:
  // Throws WorkspaceLoaderException when the file cannot be opened. `copyTemplate` names the plain copy.
  PlainFile(const QString& fileName, const QString& copyTemplate);

  QIODevice& device() { return m_file; }
  // The same, from its beginning on.
  QIODevice& rewound() {
    m_file.seek(0);
    return m_file;
  }
  // Of the file that is really read.
  QString fileName() const { return m_file.fileName(); }

 private:
  std::unique_ptr<TemporaryFile> m_copy;
  QFile m_file;
};
