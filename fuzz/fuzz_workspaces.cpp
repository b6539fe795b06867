// Workspace documents: whatever is read can be written, and read again to the same records.
#include <transform/workspace/DocumentCopy.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/WorkspaceLossReport.h>
#include <transform/workspace/XMLComponentReader.h>
#include <transform/workspace/XMLComponentWriter.h>

#include <QBuffer>
#include <QTemporaryFile>

#include <fuzz/FuzzTarget.h>

namespace {

// One file for all inputs: the reader takes file names.
QString fileWith(const std::uint8_t* data, std::size_t size) {
  static QTemporaryFile file;
  require(file.isOpen() || file.open(), "a temporary file can be made");
  require(file.resize(0) && file.seek(0), "the temporary file can be emptied");
  file.write(reinterpret_cast<const char*>(data), static_cast<qint64>(size));
  require(file.flush(), "the temporary file can be written");
  return file.fileName();
}

void requireSame(const IXMLComponentReader& first, const IXMLComponentReader& second) {
  require(first.GetFeatureTypeList() == second.GetFeatureTypeList(), "feature types survive rewriting");
  require(first.GetDatasetList() == second.GetDatasetList(), "datasets survive rewriting");
  for (const QString& document : QStringList(QString()) + first.GetSubDocList()) {
    require(first.GetTransformerList(document) == second.GetTransformerList(document),
            "transformers survive rewriting");
    require(first.GetFeatureTypeLinkList(document) == second.GetFeatureTypeLinkList(document),
            "links survive rewriting");
    require(first.GetGlobalParameterList(document) == second.GetGlobalParameterList(document),
            "global parameters survive rewriting");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const QString fileName = fileWith(data, size);
  QString error;
  XMLComponentReader::IsFileXMLWorkspace(fileName);
  for (const VersionInfo& version : XMLComponentReader::getVersions(fileName, error)) {
    try {
      XMLComponentReader reader;
      QStringList headerLines;
      QByteArray before;
      QByteArray behind;
      reader.ReadVersionedInput(fileName, version.byteOffset, version.byteLength, true, headerLines, before,
                                behind);
    } catch (const WorkspaceLoaderException&) {
    }
  }

  XMLComponentReader reader;
  try {
    QStringList headerLines;
    reader.ReadInput(fileName, headerLines);
  } catch (const WorkspaceLoaderException& refused) {
    require(!refused.getMessage().isEmpty(), "a refusal says why");
    return 0;
  }
  const WorkspaceLossReport losses(reader);
  for (const WorkspaceLossReport::Loss& loss : losses.losses()) {
    require(!loss.describe().isEmpty(), "a loss can be described");
  }
  QBuffer written;
  written.open(QIODevice::WriteOnly);
  XMLComponentWriter writer(&written, reader.GetDocumentType());
  copyDocument(reader, writer);
  writer.writeDocument();
  if (!writer.getRefusal().isEmpty()) {
    return 0;
  }
  XMLComponentReader again;
  try {
    again.ReadBufferInput(written.data());
  } catch (const WorkspaceLoaderException&) {
    require(false, "what was written can be read");
  }
  requireSame(reader, again);
  return 0;
}
