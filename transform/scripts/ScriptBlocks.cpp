#include <platform/qorxcore/WordEncoding.h>
#include <transform/scripts/ScriptBlocks.h>
#include <transform/text/GlobalMacros.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>
#include <transform/text/TextHelpers.h>

#include <algorithm>

namespace {

const QLatin1String kReturn("return");
const QLatin1Char kBackslash('\\');

void removeTrailingBlanks(QString& line) {
  int size = line.size();
  while (size > 0 && line[size - 1] == QLatin1Char(' ')) {
    --size;
  }
  line.truncate(size);
}

void joinContinuations(QStringList& lines) {
  for (int i = 0; i < lines.size(); ++i) {
    removeTrailingBlanks(lines[i]);
    if (i + 1 < lines.size() && lines[i].endsWith(kBackslash)) {
      lines[i].chop(1);
      lines[i] += lines[i + 1].trimmed();
      lines[i + 1].clear();
    }
  }
}

// A key names a macro directly when it is a plain string literal.
QString literalPythonKey(const QString& key) {
  QString trimmed = key.trimmed();
  if (trimmed.size() >= 2 && (trimmed[0] == QLatin1Char('\'') || trimmed[0] == QLatin1Char('"')) &&
      trimmed[0] == trimmed[trimmed.size() - 1]) {
    return trimmed.mid(1, trimmed.size() - 2);
  }
  return trimmed;
}

bool isAsciiBlank(QChar character) {
  return character == QLatin1Char(' ') || (character.unicode() >= 9 && character.unicode() <= 13);
}

// Finds `open`, a key of at least one character, and `close`; the first `close` ends the key. A key may
// itself hold a lookup, so the search goes on at the key, not behind it; the place of the closing character
// is remembered, so that lookups nested in each other to any depth cost one walk.
QVector<ScriptKey> findLookups(const QString& line, QLatin1String open, QChar close, bool blankEndsSearch) {
  QVector<ScriptKey> keys;
  int end = 0;
  for (int at = line.indexOf(open); at >= 0; at = line.indexOf(open, at + open.size())) {
    const int key = at + open.size();
    end = std::max(end, key + 1);
    while (end < line.size() && line[end] != close && !(blankEndsSearch && isAsciiBlank(line[end]))) {
      ++end;
    }
    if (end >= line.size()) {
      break;
    }
    const bool startsKey = blankEndsSearch ? !isAsciiBlank(line[key]) : line[key] != close;
    if (startsKey && line[end] == close) {
      keys.append({key, end - key});
    }
  }
  return keys;
}

void removeGlobalMacros(QVector<ScriptKey>& keys, const QString& line, QString (*macroName)(const QString&)) {
  constexpr int kLongestKey = 100;  // no built-in macro's name is anywhere near as long
  const auto isGlobal = [&](const ScriptKey& key) {
    return key.length <= kLongestKey && isGlobalMacro(macroName(line.mid(key.position, key.length)));
  };
  keys.erase(std::remove_if(keys.begin(), keys.end(), isGlobal), keys.end());
}

void insertBeforeKeys(QString& line, const QVector<ScriptKey>& keys, const QString& inserted) {
  if (keys.isEmpty()) {
    return;
  }
  QString rewritten;
  rewritten.reserve(line.size() + keys.size() * inserted.size());
  int done = 0;
  for (const ScriptKey& key : keys) {
    rewritten += line.midRef(done, key.position - done);
    rewritten += inserted;
    done = key.position;
  }
  rewritten += line.midRef(done);
  line = rewritten;
}

int firstNonBlank(const QString& line) {
  int i = 0;
  while (i < line.size() && line[i].isSpace()) {
    ++i;
  }
  return i;
}

// Whether a script asks for macros that may not be there, and goes on without them.
bool minds(const QString& code, bool isPython) {
  const QStringList marks = isPython
                                ? QStringList{QStringLiteral("in ORX_MacroValues"), QStringLiteral("try:"),
                                              QStringLiteral("ORX_MacroValues =")}
                                : QStringList{QStringLiteral("info exists"), QStringLiteral("catch"),
                                              QStringLiteral("try "), QStringLiteral("array ")};
  return std::any_of(marks.begin(), marks.end(), [&](const QString& mark) { return code.contains(mark); });
}

// The macro that a key names, if it is spelt out and its value is read.
QString nameRead(const QString& line, const ScriptKey& key, bool isPython) {
  const QString text = line.mid(key.position, key.length).trimmed();
  if (!isPython) {
    const bool isSet = line.left(key.position).contains(QLatin1String("set ORX_MacroValues("));
    const bool isSpelt = std::none_of(text.begin(), text.end(), [](QChar c) {
      return c == QLatin1Char('$') || c == QLatin1Char('[') || c == kBackslash;
    });
    return isSpelt && !isSet ? text : QString();
  }
  const QString name = literalPythonKey(text);
  const bool isSpelt =
      name.size() + 2 == text.size() && !name.contains(text.at(0)) && !name.contains(kBackslash);
  const QString behind = line.mid(key.position + key.length + 1).trimmed();
  const bool isSet = behind.startsWith(QLatin1Char('=')) && !behind.startsWith(QLatin1String("=="));
  return isSpelt && !isSet ? name : QString();
}

}  // namespace

QStringList scriptCodeLines(const QString& encodedCode) {
  QString code = QORXWwjdDecode(encodedCode);
  if (code.isEmpty()) {
    return QStringList();
  }
  code.replace(QLatin1String("\r\n"), QLatin1String("\n"));
  return code.split(QLatin1Char('\n'));
}

int scriptResultLine(const QStringList& lines) {
  for (int i = lines.size() - 1; i >= 0; --i) {
    const int start = firstNonBlank(lines[i]);
    if (start < lines[i].size() && lines[i][start] != QLatin1Char('#')) {
      return i;
    }
  }
  return -1;
}

QVector<ScriptKey> redirectedPythonKeys(const QString& line) {
  QVector<ScriptKey> keys =
      findLookups(line, QLatin1String("ORX_MacroValues["), QLatin1Char(']'), /*blankEndsSearch=*/false);
  removeGlobalMacros(keys, line, literalPythonKey);
  return keys;
}

QVector<ScriptKey> redirectedTclKeys(const QString& line) {
  QVector<ScriptKey> keys =
      findLookups(line, QLatin1String("ORX_MacroValues("), QLatin1Char(')'), /*blankEndsSearch=*/true);
  removeGlobalMacros(keys, line, [](const QString& key) { return key; });
  return keys;
}

QStringList pythonBodyLines(const QString& prefix, const QString& encodedCode) {
  QStringList lines = scriptCodeLines(encodedCode);
  joinContinuations(lines);
  const QString inserted = QStringLiteral("ORX_MacroValues['") + prefix + QStringLiteral("'] + '_' + ");
  for (QString& line : lines) {
    line.prepend(QLatin1String("  "));
    if (!prefix.isEmpty()) {
      insertBeforeKeys(line, redirectedPythonKeys(line), inserted);
    }
  }
  const int result = scriptResultLine(lines);
  if (result >= 0) {
    QString& line = lines[result];
    const int start = firstNonBlank(line);
    if (!line.midRef(start).startsWith(kReturn)) {
      line.insert(start, QLatin1String("return "));
    }
  }
  return lines;
}

QStringList tclBodyLines(const QString& prefix, const QString& encodedCode) {
  QStringList lines = scriptCodeLines(encodedCode);
  const QString inserted = QStringLiteral("$ORX_MacroValues(") + prefix + QStringLiteral(")_");
  for (QString& line : lines) {
    line = line.trimmed();
    if (!prefix.isEmpty()) {
      insertBeforeKeys(line, redirectedTclKeys(line), inserted);
    }
  }
  const int result = scriptResultLine(lines);
  if (result >= 0 && !lines[result].startsWith(kReturn)) {
    lines[result].prepend(QLatin1String("return "));
  }
  return lines;
}

void getPythonParameterLines(const QString& prefix, const QString& parameterName, const QString& encodedCode,
                             QStringList& lines) {
  lines << kIncludePython << QStringLiteral("def ParamFunc():");
  lines << pythonBodyLines(prefix, encodedCode);
  lines << QStringLiteral("value = ParamFunc()");
  lines << (prefix.isEmpty() ? QStringLiteral("macroName = '") + parameterName + QLatin1Char('\'')
                             : QStringLiteral("macroName = ORX_MacroValues['") + prefix +
                                   QStringLiteral("'] + '_") + parameterName + QLatin1Char('\''));
  lines << QStringLiteral("if value == None:") << QStringLiteral("  return { macroName : '' }")
        << QStringLiteral("else:") << QStringLiteral("  return { macroName : str(value) }") << kIncludeEnd;
}

void getTclParameterLines(const QString& prefix, const QString& parameterName, const QString& encodedCode,
                          QStringList& lines) {
  lines << kIncludeTcl << QStringLiteral("proc ParamFunc {} {")
        << QStringLiteral(" upvar ORX_MacroValues ORX_MacroValues");
  lines << tclBodyLines(prefix, encodedCode);
  lines << QStringLiteral("}");
  if (prefix.isEmpty()) {
    lines << QStringLiteral("puts \"MACRO ") + parameterName + QStringLiteral(" [ParamFunc]\" ");
  } else {
    lines << QStringLiteral("set macroName \"$ORX_MacroValues(") + prefix + QStringLiteral(")_") +
                 parameterName + QLatin1Char('"')
          << QStringLiteral("puts \"MACRO $macroName [ParamFunc]\" ");
  }
  lines << kIncludeEnd;
}

QString unsetReadByScript(bool isPython, const QString& parameterName, const QString& encodedCode,
                          const std::function<bool(const QString& name)>& isSetBefore,
                          const std::function<bool(const QString& name)>& isSetBehind) {
  const QStringList lines = scriptCodeLines(encodedCode);
  if (minds(lines.join(QLatin1Char('\n')), isPython))
    return QString();
  for (const QString& line : lines) {
    if (line.trimmed().startsWith(QLatin1Char('#')))
      continue;
    for (const ScriptKey& key : isPython ? redirectedPythonKeys(line) : redirectedTclKeys(line)) {
      const QString name = nameRead(line, key, isPython);
      if (name.isEmpty() || isSetBefore(name))
        continue;
      const long reason = name != parameterName && isSetBehind(name) ? orx::messages::kScriptReadsLater
                                                                     : orx::messages::kScriptReadsUnknown;
      return TransformResString(orx::messages::kScriptRefused,
                                {parameterName, TransformResString(reason, name)});
    }
  }
  return QString();
}
