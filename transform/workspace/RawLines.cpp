#include <transform/workspace/PlainFile.h>
#include <transform/workspace/RawLines.h>
#include <transform/workspace/reading/FileLines.h>
#include <transform/workspace/reading/WorkspaceSplitter.h>

#include <algorithm>
#include <array>

namespace {

constexpr int kShownLength = 60;
constexpr std::size_t kMostLines = 10000;
const char* const kOurs = "<<<<<<<";
const char* const kTheirs = ">>>>>>>";

bool isBlank(ushort unit) {
  return unit == ' ' || unit == '\t' || unit == '\r' || unit == '\n';
}

bool isMark(const FileLines& lines, const char* mark) {
  const int length = static_cast<int>(qstrlen(mark));
  return lines.startsWith(mark) && (lines.unitCount() == length || isBlank(lines.unit(length)));
}

// The text without blanks around it; an empty comment line has none.
QString textOf(const FileLines& lines) {
  QString text;
  for (int i = 0; i < lines.unitCount() && text.size() < kShownLength; ++i) {
    if (!text.isEmpty() || !isBlank(lines.unit(i)))
      text += QChar(lines.unit(i));
  }
  if (!lines.byteOrder())
    text = QString::fromUtf8(text.toLatin1());
  text = text.trimmed();
  return text == QLatin1String("#!") ? QString() : text;
}

class Finder {
 public:
  void add(const FileLines& lines) {
    if (!lines.startsLine() || m_found.size() >= kMostLines)
      return;
    if (isConflict(lines)) {
      m_found.push_back({RawLine::Kind::Conflict, lines.lineNumber(), textOf(lines)});
      return;
    }
    if (m_headerLine > 0) {
      addBehind(lines);
      return;
    }
    if (lines.matchComment(WorkspaceSplitter::kStartHeader) > 0) {
      m_headerLine = lines.lineNumber();
      return;
    }
    if (lines.matchComment("") > 0) {
      m_found.insert(m_found.end(), m_waiting.begin(), m_waiting.end());
      m_waiting.clear();
      m_hasXml = true;
    } else if (m_hasXml && m_waiting.size() < kMostLines) {
      const QString text = textOf(lines);
      if (!text.isEmpty())
        m_waiting.push_back({RawLine::Kind::Stray, lines.lineNumber(), text});
    }
  }

  std::vector<RawLine> inOrder() {
    if (m_headerLine > 0 && !m_isHeaderClosed)
      m_found.push_back({RawLine::Kind::OpenHeader, m_headerLine, QString()});
    std::stable_sort(m_found.begin(), m_found.end(),
                     [](const RawLine& left, const RawLine& right) { return left.line < right.line; });
    return std::move(m_found);
  }

 private:
  // An engine's statements may stand there, but no document.
  void addBehind(const FileLines& lines) {
    if (!m_isHeaderClosed) {
      m_isHeaderClosed = lines.matchComment(WorkspaceSplitter::kEndHeader) > 0;
    } else if (!m_hasBehind && lines.matchComment("") > 0 && !textOf(lines).isEmpty()) {
      m_hasBehind = true;
      m_found.push_back({RawLine::Kind::Behind, lines.lineNumber(), textOf(lines)});
    }
  }

  // A line of "=" may be an ornament, but not between the others.
  bool isConflict(const FileLines& lines) {
    static constexpr std::array<const char*, 2> kInner = {"|||||||", "======="};
    if (isMark(lines, kOurs)) {
      m_isOpen = true;
      return true;
    }
    const bool isEnd = isMark(lines, kTheirs);
    const bool isInner = m_isOpen && std::any_of(kInner.begin(), kInner.end(),
                                                 [&](const char* mark) { return isMark(lines, mark); });
    m_isOpen = m_isOpen && !isEnd;
    return isEnd || isInner;
  }

  std::vector<RawLine> m_found;
  std::vector<RawLine> m_waiting;  // raw lines behind which no XML has come yet
  bool m_isOpen = false;
  bool m_hasXml = false;
  int m_headerLine = 0;
  bool m_isHeaderClosed = false;
  bool m_hasBehind = false;
};

}  // namespace

std::vector<RawLine> RawLine::find(const QString& fileName) {
  PlainFile plain(fileName, QStringLiteral("kx-in-XXXXXX"));
  return find(plain);
}

std::vector<RawLine> RawLine::find(PlainFile& file) {
  FileLines lines(file.rewound());
  Finder finder;
  while (lines.next())
    finder.add(lines);
  return finder.inOrder();
}
