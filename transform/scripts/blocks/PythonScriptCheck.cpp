#include <transform/scripts/ScriptBlocks.h>
#include <transform/scripts/blocks/PythonLineScanner.h>
#include <transform/scripts/blocks/ScriptRefusal.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TextHelpers.h>

#include <QSet>

namespace messages = orx::messages;

namespace {

const QLatin1Char kBackslash('\\');

bool isWordCharacter(QChar character) {
  return character.isLetterOrNumber() || character == QLatin1Char('_');
}

// Whether two characters that meet when a continuation is joined could become one token.
bool wouldMerge(QChar left, QChar right) {
  static const QString kOperators = QStringLiteral("+-*/%@&|^~<>=!:.");
  return (isWordCharacter(left) && isWordCharacter(right)) ||
         (kOperators.contains(left) && kOperators.contains(right));
}

// The joining takes a backslash off one line and puts the next one behind it, once; whatever that would not
// carry over as it was meant is refused.
bool isJoinable(const QString& line, const QString& next, bool isItselfJoined,
                PythonLineScanner::LineEnd lineEnd) {
  if (isItselfJoined || lineEnd != PythonLineScanner::LineEnd::Code) {
    return false;
  }
  const QString following = next.trimmed();
  if (line.size() < 2 || following.isEmpty()) {
    return true;
  }
  const QChar last = line[line.size() - 2];
  return last != kBackslash && !wouldMerge(last, following[0]);
}

QString trimmedEnd(const QString& line) {
  int size = line.size();
  while (size > 0 && line[size - 1] == QLatin1Char(' ')) {
    --size;
  }
  return line.left(size);
}

QString firstWord(const QString& code) {
  int end = 0;
  while (end < code.size() && isWordCharacter(code[end])) {
    ++end;
  }
  return code.left(end);
}

// Whether "return " may stand in front of the code, or it returns by itself.
bool givesValue(const QString& code, bool hasStatementMark) {
  static const QSet<QString> kStatements = {
      QStringLiteral("assert"),   QStringLiteral("break"),  QStringLiteral("class"),
      QStringLiteral("continue"), QStringLiteral("def"),    QStringLiteral("del"),
      QStringLiteral("from"),     QStringLiteral("global"), QStringLiteral("import"),
      QStringLiteral("pass"),     QStringLiteral("raise"),  QStringLiteral("nonlocal"),
      QStringLiteral("yield"),    QStringLiteral("except"), QStringLiteral("finally")};
  const QString word = firstWord(code);
  if (word.startsWith(QLatin1String("return"))) {
    return word.size() == 6;
  }
  if (kStatements.contains(word)) {
    return false;
  }
  return !hasStatementMark || code.contains(QLatin1String("lambda"));
}

ScriptRefusal refusePython(const QStringList& codeLines, bool redirectsLookups) {
  if (const ScriptRefusal refusal = refuseUnwritableLines(codeLines)) {
    return refusal;
  }
  const int result = scriptResultLine(codeLines);
  if (result < 0) {
    return {messages::kScriptEmpty, 0};
  }
  PythonLineScanner scanner;
  bool isJoined = false;
  // Of the line that the current one is, or is joined to.
  int first = 0;
  bool startsStatement = true;
  bool hasStatementMark = false;
  for (int i = 0; i < codeLines.size(); ++i) {
    const QString line = trimmedEnd(codeLines[i]);
    if (!isJoined) {
      first = i;
      startsStatement = !scanner.isInsideBrackets();
      hasStatementMark = false;
    }
    if (const ScriptRefusal refusal = scanner.scan(line, redirectsLookups)) {
      return refusal;
    }
    hasStatementMark = hasStatementMark || scanner.hasStatementMark();
    const bool continues = line.endsWith(kBackslash);
    if (continues &&
        (i + 1 == codeLines.size() || !isJoinable(line, codeLines[i + 1], isJoined, scanner.lineEnd()))) {
      return {messages::kScriptContinuation, i + 1};
    }
    if (scanner.lineEnd() == PythonLineScanner::LineEnd::Text) {
      return {messages::kScriptUnbalanced, i + 1};
    }
    isJoined = continues;
    if (i < result) {
      continue;
    }
    if (scanner.isInsideBrackets()) {
      return {messages::kScriptUnbalanced, scanner.openBracketLine()};
    }
    if (scanner.lineEnd() == PythonLineScanner::LineEnd::TextOfSeveralLines) {
      return {messages::kScriptUnbalanced, i + 1};
    }
    if (!startsStatement) {
      return {messages::kScriptResultInsideStatement, first + 1};
    }
    if (i == result && !givesValue(codeLines[first].trimmed(), hasStatementMark)) {
      return {messages::kScriptResultNoValue, first + 1};
    }
  }
  return {};
}

}  // namespace

bool canWritePythonParameter(const QString& prefix, const QString& parameterName, const QString& encodedCode,
                             QString& reason) {
  if (!isScriptableName(parameterName)) {
    reason = scriptNameRefusalText(parameterName, parameterName);
    return false;
  }
  if (!isFreeOf(prefix, QStringLiteral("'\\"))) {
    reason = scriptNameRefusalText(parameterName, prefix);
    return false;
  }
  const ScriptRefusal refusal = refusePython(scriptCodeLines(encodedCode), !prefix.isEmpty());
  if (refusal) {
    reason = scriptRefusalText(parameterName, refusal);
  }
  return !refusal;
}
