#include <platform/vtl/SystemEncoding.h>
#include <transform/files/AtomicFile.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/PlainFile.h>
#include <transform/workspace/VersionStore.h>
#include <transform/workspace/WorkspaceFile.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/XMLComponentReader.h>
#include <transform/workspace/reading/DecodedInputSource.h>
#include <transform/workspace/reading/DocumentMessages.h>
#include <transform/workspace/reading/FileLines.h>
#include <transform/workspace/reading/WorkspaceSplitter.h>
#include <transform/workspace/writing/CommentLineDevice.h>

#include <QBuffer>
#include <QTextCodec>

namespace messages = orx::messages;

namespace {

constexpr int kDeclarationLength = 1024;
const QString kCopyName = QStringLiteral("kx-in-XXXXXX");

// The first character that is no blank; 0 when there is none.
ushort firstMark(const FileLines& lines) {
  for (int i = 0; i < lines.unitCount(); ++i) {
    if (!QChar(lines.unit(i)).isSpace())
      return lines.unit(i);
  }
  return 0;
}

WorkspaceFile::Form formOf(QIODevice& device) {
  FileLines lines(device);
  bool isBlank = true;
  bool saysVersions = false;
  while (lines.next()) {
    if (isBlank) {
      const ushort mark = firstMark(lines);
      if (mark == '<')
        return WorkspaceFile::Form::PlainXml;
      isBlank = mark == 0;
    }
    if (!lines.startsLine())
      continue;
    if (lines.startsWith(VersionStore::kBegin))
      return WorkspaceFile::Form::Versioned;
    if (lines.matchComment("") > 0)
      return WorkspaceFile::Form::Workspace;
    saysVersions = saysVersions || (lines.lineNumber() == 1 && lines.startsWith(VersionStore::kFirstLine));
  }
  return saysVersions ? WorkspaceFile::Form::Versioned : WorkspaceFile::Form::Unknown;
}

// The codec for a file's text: one that contains ASCII, or UTF-16 in a stated byte order; null for all else.
const QTextCodec* fileCodec(const QByteArray& name) {
  const bool isUtf16 = name.toUpper() == "UTF-16";
  const QTextCodec* const codec = QTextCodec::codecForName(isUtf16 ? QByteArray("UTF-16LE") : name);
  if (!codec || codec->name() == "UTF-16LE" || codec->name() == "UTF-16BE")
    return codec;
  const QString ascii = QStringLiteral("#! <?xml \"\n");
  QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
  return codec->fromUnicode(ascii.constData(), ascii.size(), &state) == ascii.toLatin1() ? codec : nullptr;
}

WorkspaceLoaderException noWorkspaceFile(const QString& fileName) {
  return WorkspaceLoaderException(messages::kNoWorkspaceFile, {fileName});
}

void readPiece(IXMLComponentReader& reader, const QString& fileName, const VersionInfo& version,
               QStringList& headerLines) {
  QByteArray before;
  QByteArray behind;
  reader.ReadVersionedInput(fileName, version.byteOffset, version.byteLength, true, headerLines, before,
                            behind);
}

}  // namespace

WorkspaceFile::Form WorkspaceFile::recognise(const QString& fileName) {
  try {
    return formOf(PlainFile(fileName, kCopyName).device());
  } catch (const WorkspaceLoaderException&) {
    return Form::Unknown;
  }
}

WorkspaceFile::Form WorkspaceFile::recognise(PlainFile& file) {
  return formOf(file.rewound());
}

void WorkspaceFile::read(IXMLComponentReader& reader, const QString& fileName, QStringList& headerLines) {
  // An enciphered file shows its form only when deciphered.
  PlainFile plain(fileName, kCopyName);
  switch (formOf(plain.device())) {
    case Form::Workspace:
      reader.ReadInput(fileName, headerLines);
      return;
    case Form::PlainXml:
      reader.ReadInput(plain.fileName());
      return;
    case Form::Versioned: {
      QString error;
      const QList<VersionInfo> versions = VersionStore(plain.fileName()).versions(error);
      if (versions.isEmpty())
        break;
      readPiece(reader, fileName, VersionStore::newest(versions), headerLines);
      return;
    }
    case Form::Unknown:
      break;
  }
  throw noWorkspaceFile(fileName);
}

void WorkspaceFile::readVersion(IXMLComponentReader& reader, const QString& fileName,
                                const VersionInfo& version, QStringList& headerLines) {
  readPiece(reader, fileName, version, headerLines);
  if (reader.GetDocumentType() == kUnknownDocument)
    throw noWorkspaceFile(fileName);
}

WorkspaceFile::WorkspaceFile(const QString& fileName) {
  PlainFile plain(fileName, kCopyName);
  m_form = formOf(plain.device());
  if (m_form != Form::Workspace && m_form != Form::PlainXml)
    throw noWorkspaceFile(fileName);
  takeSurroundings(plain);
  if (m_hasHeader) {
    QBuffer xml;
    xml.open(QIODevice::WriteOnly);
    WorkspaceSplitter splitter;
    splitter.split(plain.rewound(), xml, fileName);
    m_headerLines = splitter.headerLines();
  }
}

WorkspaceFile::WorkspaceFile(PlainFile& file, Form form, const QStringList& headerLines)
    : m_form(form), m_headerLines(headerLines) {
  takeSurroundings(file);
}

void WorkspaceFile::takeSurroundings(PlainFile& file) {
  QByteArray declaration;
  const auto addToDeclaration = [&](const FileLines& lines, int prefix) {
    if (declaration.size() < kDeclarationLength)
      declaration.append(lines.data() + prefix, std::min(lines.size() - prefix, kDeclarationLength));
    return declaration.size() < kDeclarationLength;
  };
  FileLines lines(file.rewound());
  bool hasXml = m_form == Form::PlainXml;
  bool hasHeaderEnded = false;
  bool isFirst = true;
  bool inXml = false;
  while (lines.next()) {
    if (isFirst) {
      isFirst = false;
      m_mark = lines.byteOrderMark();
      const int count = lines.unitCount();
      if (lines.endsLine() && count >= 2 && lines.unit(count - 2) == '\r' && lines.unit(count - 1) == '\n')
        m_lineEnd = "\r\n";
    }
    if (m_form == Form::PlainXml) {
      if (!addToDeclaration(lines, 0))
        break;
      continue;
    }
    int prefix = 0;
    if (lines.startsLine()) {
      if (m_hasHeader && !hasHeaderEnded) {
        hasHeaderEnded = lines.matchComment(WorkspaceSplitter::kEndHeader) > 0;
        m_rawHeader.append(lines.data(), lines.size());
        continue;
      }
      if (!m_hasHeader && lines.matchComment(WorkspaceSplitter::kStartHeader) > 0) {
        m_hasHeader = true;
        inXml = false;
        m_rawHeader.append(lines.data(), lines.size());
        continue;
      }
      prefix = m_hasHeader ? 0 : lines.matchComment("");
      inXml = prefix > 0;
      hasXml = hasXml || inXml;
    } else if (m_hasHeader && !hasHeaderEnded) {
      m_rawHeader.append(lines.data(), lines.size());
      continue;
    }
    if (inXml) {
      addToDeclaration(lines, prefix * lines.unitSize());
      continue;
    }
    QByteArray& part = hasHeaderEnded ? m_behind : hasXml ? m_between : m_before;
    part.append(lines.data(), lines.size());
  }
  if (lines.byteOrder()) {
    m_encoding = lines.byteOrder() == 'L' ? "UTF-16LE" : "UTF-16BE";
  } else {
    const QTextCodec* const codec = fileCodec(declaredEncoding(declaration));
    m_encoding = codec ? codec->name() : QByteArray();
    if (m_encoding.isEmpty() || isWide())
      m_encoding = ORXSystemEncodingName();
  }
}

bool WorkspaceFile::setEncoding(const QByteArray& name) {
  const QTextCodec* const codec = fileCodec(name);
  if (!codec)
    return false;
  if (m_encoding != codec->name())
    m_rawHeader.clear();
  m_encoding = codec->name();
  m_mark =
      isWide() ? (m_encoding == "UTF-16BE" ? QByteArray("\xfe\xff") : QByteArray("\xff\xfe")) : QByteArray();
  return true;
}

void WorkspaceFile::setHeaderLines(const QStringList& lines) {
  m_headerLines = lines;
  m_rawHeader.clear();
  m_hasHeader = true;
}

bool WorkspaceFile::isWide() const {
  return m_encoding.startsWith("UTF-16");
}

QByteArray WorkspaceFile::encodedAscii(const QByteArray& ascii) const {
  if (!isWide())
    return ascii;
  QByteArray wide;
  for (const char character : ascii) {
    if (m_encoding == "UTF-16BE")
      wide.append('\0').append(character);
    else
      wide.append(character).append('\0');
  }
  return wide;
}

QByteArray WorkspaceFile::encodedHeader(QString& error) const {
  static const QByteArray prefix = WorkspaceSplitter::kPrefix;
  QString text;
  for (const QString& line : m_headerLines) {
    QBuffer buffer;
    buffer.setData(line.toUtf8());
    buffer.open(QIODevice::ReadOnly);
    FileLines lines(buffer);
    const bool isEnd = lines.next() && lines.matchComment(WorkspaceSplitter::kEndHeader) > 0;
    if (isEnd || line.contains(QLatin1Char('\n')) || line.endsWith(QLatin1Char('\r')))
      error = documentText(messages::kBadHeaderLine, {line});
    text += line + QString::fromLatin1(m_lineEnd);
  }
  const auto encode = [&](const QTextCodec& codec) {
    QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
    return codec.fromUnicode(text.constData(), text.size(), &state);
  };
  const QTextCodec& codec = *QTextCodec::codecForName(m_encoding);
  QByteArray bytes = encode(codec);
  if (!isWide() && m_encoding != "UTF-8") {
    // The reader takes a header for UTF-8 whenever it can be that.
    QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
    const QTextCodec& utf8 = *QTextCodec::codecForName("UTF-8");
    utf8.toUnicode(bytes.constData(), bytes.size(), &state);
    if (!codec.canEncode(text) || (state.invalidChars == 0 && state.remainingChars == 0))
      bytes = encode(utf8);
  }
  return encodedAscii(prefix + WorkspaceSplitter::kStartHeader + m_lineEnd) + bytes +
         encodedAscii(prefix + WorkspaceSplitter::kEndHeader + m_lineEnd);
}

bool WorkspaceFile::writeXml(QIODevice& device, DocumentType type,
                             const std::function<void(XMLComponentWriter&)>& fill, QString& error) const {
  const QByteArray prefix = m_form == Form::PlainXml ? QByteArray() : QByteArray(WorkspaceSplitter::kPrefix);
  CommentLineDevice lines(device, encodedAscii(prefix), encodedAscii("\n"), encodedAscii(m_lineEnd));
  XMLComponentWriter writer(&lines, type);
  writer.setEncoding(m_encoding);
  writer.setByteOrderMark(false);
  fill(writer);
  if (!writer.getRefusal().isEmpty()) {
    error = writer.getRefusal();
    return false;
  }
  writer.writeDocument();
  if (writer.stream().status() != QTextStream::Ok) {
    error = writer.getRefusal().isEmpty() ? lines.errorString() : writer.getRefusal();
    return false;
  }
  return true;
}

bool WorkspaceFile::write(QIODevice& device, DocumentType type,
                          const std::function<void(XMLComponentWriter&)>& fill, QString& error) const {
  error.clear();
  QByteArray header;
  if (m_hasHeader) {
    if (m_form == Form::PlainXml) {
      error = documentText(messages::kNoHeaderInXml);
      return false;
    }
    header = m_rawHeader.isEmpty() ? encodedHeader(error) : m_rawHeader;
    if (!error.isEmpty())
      return false;
  }
  device.write(m_mark);
  device.write(m_before);
  if (!writeXml(device, type, fill, error))
    return false;
  device.write(m_between);
  if (!m_between.isEmpty() && !m_between.endsWith(encodedAscii("\n")) && m_hasHeader)
    device.write(encodedAscii(m_lineEnd));
  device.write(header);
  device.write(m_behind);
  return true;
}

bool WorkspaceFile::save(const QString& fileName, DocumentType type,
                         const std::function<void(XMLComponentWriter&)>& fill, QString& error) const {
  const auto fail = [&](const QString& reason) {
    error = documentText(messages::kWorkspaceNotWritten, {fileName, reason});
    return false;
  };
  AtomicFile file(fileName);
  if (!file.open())
    return fail(file.errorString());
  if (!write(file.device(), type, fill, error))
    return fail(error);
  return file.commit() || fail(file.errorString());
}
