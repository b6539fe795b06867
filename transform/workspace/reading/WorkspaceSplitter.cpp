#include <platform/orxparameter/GUIType.h>
#include <platform/vtl/SystemEncoding.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/workspace/WorkspaceLoaderException.h>
#include <transform/workspace/reading/DecodedInputSource.h>
#include <transform/workspace/reading/DocumentLimits.h>
#include <transform/workspace/reading/FileLines.h>
#include <transform/workspace/reading/WorkspaceSplitter.h>

#include <QRegularExpression>
#include <QTextCodec>

#include <algorithm>

namespace messages = orx::messages;

const char* const WorkspaceSplitter::kStartHeader = "START_HEADER";
const char* const WorkspaceSplitter::kEndHeader = "END_HEADER";
const char* const WorkspaceSplitter::kPrefix = "#! ";

namespace {

constexpr int kDeclarationLength = 1024;

[[noreturn]] void fail(long message, const QString& fileName) {
  throw WorkspaceLoaderException(message, {fileName});
}

// False when the bytes are no text in that encoding.
bool decode(const QTextCodec& codec, const QByteArray& line, QString& text) {
  QTextCodec::ConverterState state(QTextCodec::IgnoreHeader);
  text = codec.toUnicode(line.constData(), line.size(), &state);
  return state.invalidChars == 0 && state.remainingChars == 0 &&
         (isUnicodeCodec(codec) || !text.contains(QChar::ReplacementCharacter));
}

bool isValid(const QTextCodec& codec, const QList<QByteArray>& lines) {
  QString text;
  return std::all_of(lines.begin(), lines.end(),
                     [&](const QByteArray& line) { return decode(codec, line, text); });
}

}  // namespace

QByteArray declaredEncoding(const QByteArray& xmlStart) {
  static const QRegularExpression pattern(
      QStringLiteral("^\\s*<\\?xml\\s[^>]*encoding\\s*=\\s*[\"']([A-Za-z][A-Za-z0-9._-]*)[\"']"));
  const int mark = xmlStart.startsWith("\xef\xbb\xbf") ? 3 : 0;
  const auto match = pattern.match(QString::fromLatin1(xmlStart.mid(mark, kDeclarationLength)));
  return match.captured(1).toLatin1();
}

void WorkspaceSplitter::split(QIODevice& input, QIODevice& xml, const QString& fileName) {
  m_rawHeader.clear();
  m_headerLines.clear();
  m_xmlStart.clear();
  m_firstHeaderLine = 0;
  m_lineMap = LineMap();
  FileLines lines(input);
  readXml(lines, xml, fileName);
  if (m_firstHeaderLine > 0) {
    readHeader(lines);
    decodeHeader(lines);
  }
  if (lines.hasFailed())
    fail(messages::kFileNotRead, fileName);
}

void WorkspaceSplitter::readXml(FileLines& lines, QIODevice& xml, const QString& fileName) {
  int xmlLine = 0;
  bool inXml = false;
  bool isFirst = true;
  const auto write = [&](const char* bytes, int size) {
    if (m_xmlStart.size() < kDeclarationLength)
      m_xmlStart.append(bytes, std::min(size, kDeclarationLength));
    if (xml.write(bytes, size) != size)
      fail(messages::kNoPlainCopy, fileName);
  };
  while (lines.next()) {
    if (isFirst)
      write(lines.byteOrderMark().constData(), lines.byteOrderMark().size());
    int prefix = 0;
    if (lines.startsLine()) {
      if (lines.matchComment(kStartHeader) > 0) {
        m_firstHeaderLine = m_firstLine + lines.lineNumber();
        return;
      }
      prefix = lines.matchComment("");
      inXml = prefix > 0;
      if (inXml)
        m_lineMap.add(++xmlLine, m_firstLine + lines.lineNumber() - 1);
    }
    isFirst = false;
    if (!inXml)
      continue;
    const int skipped = prefix * lines.unitSize();
    write(lines.data() + skipped, lines.size() - skipped);
    if (lines.endsLine() && (lines.unitCount() == 0 || lines.unit(lines.unitCount() - 1) != '\n')) {
      const QByteArray lineEnd = lines.encoded('\n');
      write(lineEnd.constData(), lineEnd.size());
    }
  }
}

void WorkspaceSplitter::readHeader(FileLines& lines) {
  // The rest of an over-long marker line.
  while (!lines.endsLine() && lines.next()) {
  }
  const QByteArray lineEnd = lines.encoded('\n');
  const QByteArray lineReturn = lines.encoded('\r');
  while (lines.next()) {
    if (!lines.startsLine()) {
      m_rawHeader.last().append(lines.data(), lines.size());
    } else {
      if (lines.matchComment(kEndHeader) > 0)
        return;
      m_rawHeader.append(QByteArray(lines.data(), lines.size()));
    }
    QByteArray& line = m_rawHeader.last();
    if (line.size() / lines.unitSize() > limits::kValueLength) {
      throw WorkspaceLoaderException(messages::kHeaderLineTooLong, {QString::number(limits::kValueLength)},
                                     m_firstLine + lines.lineNumber() - 1);
    }
    if (lines.endsLine()) {
      if (line.endsWith(lineEnd))
        line.chop(lineEnd.size());
      if (line.endsWith(lineReturn))
        line.chop(lineReturn.size());
    }
  }
}

void WorkspaceSplitter::decodeHeader(const FileLines& lines) {
  QTextCodec* codec = nullptr;
  if (lines.byteOrder()) {
    codec = QTextCodec::codecForName(lines.byteOrder() == 'L' ? "UTF-16LE" : "UTF-16BE");
  } else {
    codec = QTextCodec::codecForName(ORXSystemEncodingName());
    if (!isValid(*codec, m_rawHeader)) {
      if (QTextCodec* const declared = QTextCodec::codecForName(declaredEncoding(m_xmlStart)))
        codec = declared;
    }
  }
  for (const QByteArray& line : qAsConst(m_rawHeader)) {
    QString text;
    if (!decode(*codec, line, text)) {
      throw WorkspaceLoaderException(messages::kHeaderNotText, {QString::fromLatin1(codec->name())},
                                     m_firstHeaderLine + m_headerLines.size());
    }
    m_headerLines.append(text);
  }
  m_rawHeader.clear();
}

void WorkspaceSplitter::collectPrompts(const QStringList& headerLines, QHash<QString, QString>& prompts) {
  for (const QString& line : headerLines) {
    if (!line.startsWith(QLatin1String("GUI ")))
      continue;
    const GUIType type = GUIType::fromGuiLine(line);
    if (!type.isNull())
      prompts.insert(type.getName(), line);
  }
}

void WorkspaceSplitter::collectMacros(const QStringList& headerLines, QHash<QString, QString>& macros) {
  for (const QString& line : headerLines) {
    int at = 0;
    for (const QLatin1String keyword : {kDefaultMacroStatement, kMacroStatement}) {
      if (line.startsWith(keyword))
        at = keyword.size();
    }
    if (at == 0)
      continue;
    const auto skip = [&](bool blanks) {
      while (at < line.size() && (line[at] == QLatin1Char(' ')) == blanks)
        ++at;
    };
    skip(true);
    const int nameStart = at;
    skip(false);
    const QString name = line.mid(nameStart, at - nameStart);
    skip(true);
    if (!name.isEmpty())
      macros.insert(name, line.mid(at));
  }
}
