#include <platform/orxutil/Decipher.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/reading/DocumentMessages.h>

#include <QFileInfo>

PlainFile::PlainFile(const QString& fileName, const QString& copyTemplate) : m_file(fileName) {
  // Without a registered routine no copy can come about, and no temporary file is needed to find that out.
  if (ORW_hasDecipherRoutine()) {
    auto copy = std::make_unique<TemporaryFile>(copyTemplate);
    if (copy->open()) {
      copy->close();
      if (ORW_decryptWorkspace(fileName, copy->fileName())) {
        m_copy = std::move(copy);
        m_file.setFileName(m_copy->fileName());
      }
    }
  }
  if (QFileInfo(m_file.fileName()).isDir() || !m_file.open(QIODevice::ReadOnly | QIODevice::Unbuffered))
    throw WorkspaceLoaderException(orx::messages::kFileNotOpened, {fileName});
}
