#include <transform/files/InputFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QFile>
#include <QFileInfo>

#include <fcntl.h>
#include <unistd.h>

namespace messages = orx::messages;

namespace {

constexpr qint64 kLargestStream = qint64(1) << 30;
constexpr int kPieceSize = 1 << 16;

}  // namespace

bool InputFile::isStandardInput(const QString& fileName) {
  return fileName == QLatin1String("-");
}

QString InputFile::shownName(const QString& fileName) {
  return isStandardInput(fileName) ? QStringLiteral("standard input") : fileName;
}

QString InputFile::path() const {
  return m_copy ? m_copy->fileName() : m_fileName;
}

bool InputFile::open() {
  m_copy.reset();
  m_error.clear();
  // A closed descriptor would be taken by the next file that is opened.
  if (isStandardInput(m_fileName) && fcntl(STDIN_FILENO, F_GETFD) < 0)
    return fail(TransformResString(messages::kStreamClosed));
  QFile file(m_fileName);
  const bool isOpen = isStandardInput(m_fileName)
                          ? file.open(STDIN_FILENO, QIODevice::ReadOnly | QIODevice::Unbuffered)
                          : file.open(QIODevice::ReadOnly | QIODevice::Unbuffered);
  if (!isOpen)
    return fail(TransformResString(messages::kCannotBeRead, file.errorString()));
  if (isStandardInput(m_fileName) || !QFileInfo(m_fileName).isFile())
    return copy(file);
  char first;
  return file.read(&first, 1) >= 0 || fail(TransformResString(messages::kCannotBeRead, file.errorString()));
}

bool InputFile::copy(QFile& stream) {
  auto copy = std::make_unique<TemporaryFile>(QStringLiteral("kx-stream-XXXXXX"));
  if (!copy->open())
    return fail(TransformResString(messages::kNoTemporaryCopy, copy->errorString()));
  QByteArray piece(kPieceSize, '\0');
  qint64 total = 0;
  for (;;) {
    const qint64 count = stream.read(piece.data(), piece.size());
    if (count < 0)
      return fail(TransformResString(messages::kCannotBeRead, stream.errorString()));
    if (count == 0)
      break;
    total += count;
    if (total > kLargestStream)
      return fail(TransformResString(messages::kStreamTooLarge, QString::number(kLargestStream >> 20)));
    if (copy->write(piece.constData(), count) != count)
      return fail(TransformResString(messages::kNoTemporaryCopy, copy->errorString()));
  }
  if (!copy->flush())
    return fail(TransformResString(messages::kNoTemporaryCopy, copy->errorString()));
  copy->close();
  m_copy = std::move(copy);
  return true;
}

bool InputFile::fail(const QString& reason) {
  m_error = reason;
  return false;
}
