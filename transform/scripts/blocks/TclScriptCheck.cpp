#include <transform/scripts/ScriptBlocks.h>
#include <transform/scripts/blocks/ScriptRefusal.h>
#include <transform/scripts/blocks/TclCommand.h>
#include <transform/scripts/blocks/TclLineBreaks.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QByteArray>
#include <QSet>

#include <algorithm>

namespace messages = orx::messages;

namespace {

// What is put in front of the line that gives the value.
constexpr int kReturnSize = sizeof("return ") - 1;

// Lines of a text lose the blanks around them and get empty lines between them when they are written. Answers
// where the first line of such a text ends, or null.
const char* findTextOfSeveralLines(const TclCommand& command) {
  static const QSet<QByteArray> kTakeData = {"append", "lappend", "list", "return", "set"};
  const QVector<const Tcl_Token*> words = command.words();
  const bool takesData = kTakeData.contains(wordText(*words.first()));
  for (const Tcl_Token* each : words) {
    const Tcl_Token& word = *each;
    const char* const end = word.start + word.size;
    const char* const lineEnd = std::find(word.start, end, '\n');
    if (lineEnd != end && (*word.start == '"' || (takesData && isBracedWord(word)))) {
      return lineEnd;
    }
  }
  return nullptr;
}

// Whether the commands from `script` up to `end` finish with one that leaves the procedure.
bool endsInReturn(const char* script, const char* end) {
  QByteArray last;
  while (script < end) {
    const TclCommand command(script, static_cast<int>(end - script));
    if (!command.isComplete()) {
      return false;
    }
    if (command.wordCount() > 0) {
      last = wordText(*command.words().first());
    }
    script = command.end();
  }
  return last == "return" || last == "error";
}

// A "return " inside a command does no harm when it stands alone at the end of a nested script that has
// returned before it.
bool isHarmlessInside(const TclCommand& command, const char* inserted) {
  static const QSet<QByteArray> kTakeScripts = {"if", "while", "for", "foreach"};
  const QVector<const Tcl_Token*> words = command.words();
  if (!kTakeScripts.contains(wordText(*words.first()))) {
    return false;
  }
  return std::any_of(words.begin(), words.end(), [inserted](const Tcl_Token* word) {
    return isBracedWord(*word) && inserted + kReturnSize == word->start + word->size - 1 &&
           inserted > word->start && endsInReturn(word->start + 1, inserted);
  });
}

// The Tcl library parses brackets within brackets, and indices within indices, by calling itself. Their
// number bounds how deep; scripts that people write stay far below.
bool exceedsParserDepth(const QString& code) {
  constexpr int kMostBrackets = 5000;
  int brackets = 0;
  bool inName = false;
  for (const QChar character : code) {
    if (character == QLatin1Char('[') || (inName && character == QLatin1Char('('))) {
      ++brackets;
    }
    inName = character == QLatin1Char('$') ||
             (inName && (character.isLetterOrNumber() || character == QLatin1Char('_') ||
                         character == QLatin1Char(':')));
  }
  return brackets > kMostBrackets;
}

class TclBody {
 public:
  TclBody(const QStringList& written, const QStringList& code)
      : m_text(written.join(QLatin1Char('\n')).toUtf8()), m_result(scriptResultLine(code)) {
    if (m_result >= 0) {
      const int at =
          written.mid(0, m_result).join(QLatin1Char('\n')).toUtf8().size() + (m_result > 0 ? 1 : 0);
      m_resultStart = m_text.constData() + at;
      m_isReturnInserted = written[m_result] != code[m_result].trimmed() &&
                           !code[m_result].trimmed().startsWith(QLatin1String("return"));
    }
  }

  ScriptRefusal refuse() const {
    if (const ScriptRefusal refusal = forEachCommand([](const TclCommand&) { return ScriptRefusal(); })) {
      return refusal;
    }
    if (const ScriptRefusal refusal = refuseEscape()) {
      return refusal;
    }
    if (const ScriptRefusal refusal =
            forEachCommand([this](const TclCommand& command) { return refuseCommand(command); })) {
      return refusal;
    }
    const char* const lineBreak = findResultWithLineBreak(m_text);
    return lineBreak ? ScriptRefusal{messages::kResultBreaksLine, lineOf(lineBreak)} : ScriptRefusal();
  }

 private:
  template <typename Refuse>
  ScriptRefusal forEachCommand(Refuse refuse) const {
    const char* at = m_text.constData();
    const char* const end = at + m_text.size();
    while (at < end) {
      const TclCommand command(at, static_cast<int>(end - at));
      if (!command.isComplete()) {
        return {messages::kScriptUnbalanced, lineOf(std::min(command.fault(), end))};
      }
      if (command.wordCount() > 0) {
        if (const ScriptRefusal refusal = refuse(command)) {
          return refusal;
        }
      }
      at = command.end();
    }
    return {};
  }

  ScriptRefusal refuseCommand(const TclCommand& command) const {
    if (const char* lineEnd = findTextOfSeveralLines(command)) {
      return {messages::kScriptTextOfSeveralLines, lineOf(lineEnd) + 1};
    }
    if (!m_isReturnInserted || command.end() <= m_resultStart) {
      return {};
    }
    if (command.begin() < m_resultStart) {
      return isHarmlessInside(command, m_resultStart)
                 ? ScriptRefusal()
                 : ScriptRefusal{messages::kScriptResultInsideStatement, m_result + 1};
    }
    // The inserted "return" takes one value; a second word would become an option, a second command would
    // never be reached.
    const bool isOneValue = command.begin() == m_resultStart && command.wordCount() == 2;
    return isOneValue ? ScriptRefusal() : ScriptRefusal{messages::kScriptResultNoValue, m_result + 1};
  }

  // Within the braces of the procedure, braces in comments and texts count as well.
  ScriptRefusal refuseEscape() const {
    const QByteArray head = "proc ParamFunc {} {\n";
    const QByteArray block = head + m_text + "\n}";
    const TclCommand command(block.constData(), block.size());
    if (!command.isComplete()) {
      return {messages::kScriptUnbalanced, braceCommentLine()};
    }
    if (command.end() == block.constData() + block.size() && command.wordCount() == 4) {
      return {};
    }
    // The command reaches over its line end.
    const auto offset = command.end() - 1 - block.constData() - head.size();
    return {messages::kScriptUnbalanced, lineOf(m_text.constData() + std::max<std::ptrdiff_t>(offset, 0))};
  }

  // The code by itself is complete, so it is a comment that holds the brace; without one, the last line.
  int braceCommentLine() const {
    const QList<QByteArray> lines = m_text.split('\n');
    const auto found = std::find_if(lines.begin(), lines.end(), [](const QByteArray& line) {
      return line.startsWith('#') && line.count('{') != line.count('}');
    });
    return found != lines.end() ? 1 + static_cast<int>(found - lines.begin()) : lines.size();
  }

  int lineOf(const char* at) const { return 1 + static_cast<int>(std::count(m_text.constData(), at, '\n')); }

  QByteArray m_text;
  int m_result;
  const char* m_resultStart = nullptr;
  bool m_isReturnInserted = false;
};

ScriptRefusal refuseTcl(const QString& prefix, const QString& encodedCode) {
  const QStringList code = scriptCodeLines(encodedCode);
  if (const ScriptRefusal refusal = refuseUnwritableLines(code)) {
    return refusal;
  }
  for (int i = 0; i < code.size(); ++i) {
    const QString line = code[i].trimmed();
    if (line.endsWith(QLatin1Char('\\'))) {
      return {messages::kScriptContinuation, i + 1};
    }
    if (prefix.isEmpty()) {
      continue;
    }
    // A name in braces is taken letter by letter: nothing in it can be looked up.
    static const QLatin1String kBracedLookup("${ORX_MacroValues(");
    for (const ScriptKey& key : redirectedTclKeys(line)) {
      const int start = key.position - kBracedLookup.size();
      if (start >= 0 && line.midRef(start).startsWith(kBracedLookup)) {
        return {messages::kScriptLookup, i + 1};
      }
    }
  }
  const QStringList written = tclBodyLines(prefix, encodedCode);
  if (exceedsParserDepth(written.join(QLatin1Char('\n')))) {
    return {messages::kScriptTooManyBrackets, 0};
  }
  return TclBody(written, code).refuse();
}

}  // namespace

bool canWriteTclParameter(const QString& prefix, const QString& parameterName, const QString& encodedCode,
                          QString& reason) {
  if (!isScriptableName(parameterName)) {
    reason = scriptNameRefusalText(parameterName, parameterName);
    return false;
  }
  if (!isFreeOf(prefix, QStringLiteral(" \"\\$[](){}"))) {
    reason = scriptNameRefusalText(parameterName, prefix);
    return false;
  }
  const ScriptRefusal refusal = refuseTcl(prefix, encodedCode);
  if (refusal) {
    reason = scriptRefusalText(parameterName, refusal);
  }
  return !refusal;
}
