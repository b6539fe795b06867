#include <platform/orxutil/Decipher.h>
#include <transform/files/AtomicFile.h>
#include <transform/files/TemporaryFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/reading/FileLines.h>

#include <QBuffer>
#include <QFile>

#include <algorithm>

namespace messages = orx::messages;

const char* const VersionStore::kFirstLine = "# ORW custom transformers";
const char* const VersionStore::kBegin = "# TRANSFORMER_BEGIN ";
const char* const VersionStore::kEnd = "# TRANSFORMER_END";
const char* const VersionStore::kDocument = "#! <?xml version";

namespace {

constexpr int kNeededFields = 3;
const char* const kDefinitionPrefix = "# ";
const char* const kDocumentPrefix = "#! ";
const QString kCopyName = QStringLiteral("kx-in-XXXXXX");
const QString kVersionCopyName = QStringLiteral("kx-custom-xform-ver-XXXXXX");

QByteArray currentLine(const FileLines& lines) {
  QByteArray line(lines.data(), lines.size());
  while (line.endsWith('\n') || line.endsWith('\r'))
    line.chop(1);
  return line;
}

// False for a line with too few fields.
bool readOpeningLine(const QByteArray& line, VersionInfo& info) {
  QStringList fields =
      QString::fromUtf8(line.mid(static_cast<int>(qstrlen(VersionStore::kBegin)))).split(QLatin1Char(','));
  for (QString& field : fields)
    field = field.trimmed();
  if (fields.size() < kNeededFields)
    return false;
  info.name = fields[0];
  info.version = fields[1].toInt();
  if (info.version == 0)
    info.version = 1;
  info.category = fields[2];
  info.guid = fields.value(3).remove(QLatin1Char('{')).remove(QLatin1Char('}'));
  return true;
}

QList<VersionInfo> scan(QIODevice& device) {
  QList<VersionInfo> found;
  FileLines lines(device);
  bool inBlock = false;
  const auto close = [&](qint64 end) {
    if (!found.isEmpty() && found.last().byteLength == 0)
      found.last().byteLength = end - found.last().byteOffset;
  };
  qint64 end = 0;
  while (lines.next()) {
    end = lines.position() + lines.size();
    if (!lines.startsLine())
      continue;
    if (inBlock) {
      inBlock = !lines.startsWith(VersionStore::kEnd);
      found.last().startLine = lines.lineNumber();
      continue;
    }
    VersionInfo info;
    if (!lines.startsWith(VersionStore::kBegin) || !readOpeningLine(currentLine(lines), info))
      continue;
    close(lines.position());
    info.byteOffset = lines.position();
    info.startLine = lines.lineNumber();
    found.append(info);
    inBlock = true;
  }
  close(end);
  return found;
}

// What stands in a version beside its marks.
struct Content {
  QByteArray definition;  // without the prefix of its lines
  QByteArray behind;      // from the line behind the end mark on
  int behindLine = 0;     // lines of the version in front of that
};

Content contentOf(const QByteArray& version) {
  Content content;
  QBuffer buffer;
  buffer.setData(version);
  buffer.open(QIODevice::ReadOnly);
  FileLines lines(buffer);
  lines.next();  // the opening line
  while (lines.next() && !lines.startsWith(VersionStore::kEnd)) {
    QByteArray line(lines.data(), lines.size());
    if (lines.startsLine() && line.startsWith(kDefinitionPrefix))
      line.remove(0, static_cast<int>(qstrlen(kDefinitionPrefix)));
    content.definition += line;
  }
  content.behindLine = lines.lineNumber();
  while (lines.next())
    content.behind.append(lines.data(), lines.size());
  return content;
}

bool isDocument(const QByteArray& text) {
  const QByteArray start = text.trimmed();
  return (start.startsWith("#!") ? start.mid(2).trimmed() : start).startsWith('<');
}

// With the prefix of a document's lines, should it lack that.
QByteArray asComment(const QByteArray& text) {
  if (text.startsWith(kDocumentPrefix) || text.contains(QByteArray("\n") + kDocumentPrefix))
    return text;
  QByteArray commented;
  for (int at = 0; at < text.size();) {
    const int end = text.indexOf('\n', at) < 0 ? text.size() : text.indexOf('\n', at) + 1;
    commented += kDocumentPrefix + text.mid(at, end - at);
    at = end;
  }
  return commented;
}

// The plain text of what the registered routine takes for enciphered; empty for anything else.
QByteArray deciphered(const QByteArray& text) {
  if (!ORW_hasDecipherRoutine() || text.trimmed().isEmpty())
    return QByteArray();
  TemporaryFile copy(kVersionCopyName);
  if (!copy.open() || copy.write(text) != text.size() || !copy.flush())
    throw WorkspaceLoaderException(messages::kFileNotOpened, {copy.fileTemplate()});
  PlainFile plain(copy.fileName(), kVersionCopyName);
  return plain.fileName() == copy.fileName() ? QByteArray() : plain.device().readAll();
}

}  // namespace

QList<VersionInfo> VersionStore::versions(QString& error) const {
  error.clear();
  try {
    return scan(PlainFile(m_fileName, kCopyName).device());
  } catch (const WorkspaceLoaderException& exception) {
    error = exception.getMessage();
    return {};
  }
}

VersionInfo VersionStore::newest(const QList<VersionInfo>& versions) {
  return *std::max_element(
      versions.begin(), versions.end(),
      [](const VersionInfo& left, const VersionInfo& right) { return left.version < right.version; });
}

VersionStore::Piece VersionStore::read(qint64 offset, qint64 length) const {
  PlainFile plain(m_fileName, kCopyName);
  const QByteArray all = plain.device().readAll();
  if (offset < 0 || length <= 0 || offset > all.size() || length > all.size() - offset) {
    throw WorkspaceLoaderException(messages::kNoVersionAtByte, {QString::number(offset), m_fileName});
  }
  Piece piece;
  piece.before = all.left(static_cast<int>(offset));
  piece.behind = all.mid(static_cast<int>(offset + length));
  const QByteArray version = all.mid(static_cast<int>(offset), static_cast<int>(length));
  const int firstLine = piece.before.count('\n') + 1;
  int start = version.startsWith(kDocument) ? 0 : version.indexOf(QByteArray("\n") + kDocument) + 1;
  if (start > 0 || version.startsWith(kDocument)) {
    piece.document = version.mid(start);
    piece.documentLine = firstLine + version.left(start).count('\n');
  } else {
    const Content content = contentOf(version);
    const bool hasDefinition = !content.definition.trimmed().isEmpty();
    piece.document = hasDefinition ? content.definition : content.behind;
    piece.documentLine = firstLine + (hasDefinition ? 1 : content.behindLine);
    if (!isDocument(piece.document)) {
      const QByteArray plainBehind = deciphered(content.behind);
      const QByteArray plainDefinition =
          plainBehind.isEmpty() ? deciphered(content.definition) : QByteArray();
      if (!plainBehind.isEmpty()) {
        piece.document = plainBehind;
        piece.documentLine = firstLine + content.behindLine;
      } else if (!plainDefinition.isEmpty()) {
        piece.document = plainDefinition;
      }
      piece.isUnreadable = !isDocument(piece.document);
    }
    piece.document = asComment(piece.document);
  }
  if (piece.document.trimmed().isEmpty()) {
    throw WorkspaceLoaderException(messages::kVersionWithoutDocument, {QString::number(offset), m_fileName});
  }
  return piece;
}

namespace {

bool hasLineBreak(const QString& text) {
  return text.contains(QLatin1Char('\n')) || text.contains(QLatin1Char('\r'));
}

// Why these cannot become a version; empty when they can.
QString refusal(const QStringList& fields, const QStringList& definition, const QByteArray& document) {
  if (fields.size() < kNeededFields || fields[0].trimmed().isEmpty())
    return documentText(messages::kVersionNeedsFields);
  bool isNumber = false;
  if (fields[1].trimmed().toInt(&isNumber) < 1 || !isNumber)
    return documentText(messages::kNoVersionNumber, {fields[1]});
  for (const QString& field : fields) {
    if (field.contains(QLatin1Char(',')) || hasLineBreak(field))
      return documentText(messages::kFieldBreaks, {field});
  }
  for (const QString& line : definition) {
    if (hasLineBreak(line))
      return documentText(messages::kDefinitionLineBreaks);
    if ((QLatin1String(kDefinitionPrefix) + line).startsWith(QLatin1String(VersionStore::kEnd)))
      return documentText(messages::kDefinitionLineEnds);
  }
  if (!(kDocumentPrefix + document).startsWith(VersionStore::kDocument))
    return documentText(messages::kNoXmlDeclaration);
  return QString();
}

QByteArray versionText(const QStringList& fields, const QStringList& definition, const QByteArray& document,
                       const QByteArray& lineEnd) {
  QByteArray text = VersionStore::kBegin + fields.join(QLatin1Char(',')).toUtf8() + lineEnd;
  for (const QString& line : definition)
    text += kDefinitionPrefix + line.toUtf8() + lineEnd;
  text += VersionStore::kEnd + lineEnd;
  for (int at = 0; at < document.size();) {
    int end = document.indexOf('\n', at);
    if (end < 0)
      end = document.size();
    QByteArray line = document.mid(at, end - at);
    if (line.endsWith('\r'))
      line.chop(1);
    text += kDocumentPrefix + line + lineEnd;
    at = end + 1;
  }
  return text;
}

}  // namespace

bool VersionStore::insert(const QStringList& fields, const QStringList& definition,
                          const QByteArray& document, QString& error, bool* isRefused) const {
  const auto fail = [&](const QString& reason, bool refused) {
    if (isRefused)
      *isRefused = refused;
    error = documentText(messages::kVersionNotWritten, {m_fileName, reason});
    return false;
  };
  const auto refuse = [&](const QString& reason) { return fail(reason, true); };
  error = refusal(fields, definition, document);
  if (!error.isEmpty())
    return refuse(error);

  QByteArray old;
  QFile file(m_fileName);
  if (file.exists()) {
    if (!file.open(QIODevice::ReadOnly))
      return fail(file.errorString(), false);
    old = file.readAll();
    if (file.error() != QFileDevice::NoError)
      return fail(file.errorString(), false);
    QBuffer buffer(&old);
    buffer.open(QIODevice::ReadOnly);
    VersionInfo wanted;
    readOpeningLine(kBegin + fields.join(QLatin1Char(',')).toUtf8(), wanted);
    for (const VersionInfo& info : scan(buffer)) {
      if (info.name == wanted.name && info.version == wanted.version)
        return refuse(documentText(messages::kVersionThere, {QString::number(info.version)}));
    }
  }
  const bool hasFirstLine = old.startsWith(kFirstLine);
  if (!old.isEmpty() && !hasFirstLine && !old.startsWith(kBegin))
    return refuse(documentText(messages::kNoVersionFile));

  const int firstEnd = old.indexOf('\n');
  const QByteArray lineEnd = firstEnd > 0 && old[firstEnd - 1] == '\r' ? "\r\n" : "\n";
  QByteArray head = hasFirstLine ? old.left(firstEnd < 0 ? old.size() : firstEnd + 1) : kFirstLine + lineEnd;
  const QByteArray rest = hasFirstLine ? old.mid(head.size()) : old;
  if (!head.endsWith('\n'))
    head += lineEnd;
  AtomicFile output(m_fileName);
  if (!output.open())
    return fail(output.errorString(), false);
  output.device().write(head);
  output.device().write(versionText(fields, definition, document, lineEnd));
  output.device().write(rest);
  return output.commit() || fail(output.errorString(), false);
}
