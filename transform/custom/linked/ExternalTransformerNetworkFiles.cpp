// The part of ExternalTransformerNetwork that writes files: copies of its definition, and files without it.
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>
#include <transform/custom/ExternalTransformerNetwork.h>
#include <transform/files/AtomicFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>

#include <QFile>
#include <QFileInfo>

namespace messages = orx::messages;

namespace {

constexpr int kFieldsWithSettings = 8;
const QString kTemporaryName = QStringLiteral("kx-custom-xform-ver-XXXXXX");

}  // namespace

// As a whole: an enciphered body is copied as it is.
bool ExternalTransformerNetwork::isEnciphered() const {
  try {
    return PlainFile(m_fileName, kTemporaryName).fileName() != m_fileName;
  } catch (const WorkspaceLoaderException&) {
    return false;
  }
}

bool ExternalTransformerNetwork::extractToFile(const QString& fileName) {
  const auto refuse = [this](const QString& reason) {
    setExtractError(reason);
    return false;
  };
  setExtractError(QString());
  if (isEnciphered())
    return refuse(TransformResString(messages::kEnciphered, m_fileName));
  const VersionInfo version = findVersion(m_fileName);
  if (!m_isLoaded || version.byteLength < 0)
    return refuse(TransformResString(messages::kFileChanged, m_fileName));

  QFile source(m_fileName);
  if (!source.open(QIODevice::ReadOnly) || !source.seek(version.byteOffset))
    return refuse(source.errorString());
  QByteArray text = source.read(version.byteLength);
  if (text.size() != version.byteLength)
    return refuse(source.errorString());
  if (m_settingsChanged) {
    QStringList fields = m_header.fields;
    while (fields.size() < kFieldsWithSettings)
      fields.append(fields.size() == 4 ? m_insertMode : QString());
    const ParallelSettings parallel = getParallelSettings();
    fields[5] = QLatin1String(blockedLooping() ? "yes" : "no");
    fields[6] = parallel.parallelism;
    fields[7] = parallel.groupBy;
    const int end = text.indexOf('\n');
    text.replace(0, end < 0 ? text.size() : end,
                 QORXToLocal8Bit(CustomTransformerHeader::openingLine(fields)));
  }
  AtomicFile output(fileName);
  if (!output.open())
    return refuse(output.errorString());
  output.device().write(VersionStore::kFirstLine);
  output.device().write("\n");
  output.device().write(text);
  return output.commit() || refuse(output.errorString());
}

bool ExternalTransformerNetwork::isDefinitionDeletable() const {
  const QFileInfo file(m_fileName);
  const QString home = QORXOrxHome() + QLatin1Char('/');
  return m_isLoaded && file.isFile() && file.isWritable() && QFileInfo(file.absolutePath()).isWritable() &&
         !QORXPrettyUpFileName(m_fileName).startsWith(home) && !isEnciphered();
}

bool ExternalTransformerNetwork::deleteDefinition() {
  if (!isDefinitionDeletable())
    return false;
  int versions = 0;
  const VersionInfo version = findVersion(m_fileName, &versions);
  if (version.byteLength < 0)
    return false;
  if (versions == 1)
    return QFile::remove(m_fileName);
  QFile source(m_fileName);
  if (!source.open(QIODevice::ReadOnly))
    return false;
  QByteArray text = source.readAll();
  if (source.error() != QFileDevice::NoError || text.size() < version.byteOffset + version.byteLength)
    return false;
  text.remove(static_cast<int>(version.byteOffset), static_cast<int>(version.byteLength));
  AtomicFile output(m_fileName);
  if (!output.open())
    return false;
  output.device().write(text);
  return output.commit();
}
