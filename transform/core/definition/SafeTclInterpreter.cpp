#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/definition/SafeTclInterpreter.h>
#include <transform/core/definition/SystemQuestions.h>

#include <QByteArray>
#include <QStringList>
#include <tcl.h>

#include <algorithm>
#include <cstring>
#include <iterator>
namespace {

constexpr int kMostCommands = 10000;
constexpr int kMostSeconds = 1;
constexpr int kDeepestCalls = 60;
constexpr int kDeepestBrackets = 100;
constexpr int kMostStars = 3;
// Texts grow by what a script writes into one word, times the length of variables: without procedures both
// are bounded by these.
constexpr int kLongestScript = 16 * 1024;
constexpr int kLongestWord = 1024;
constexpr int kMostWords = 64;
constexpr int kLongestVariable = 8 * 1024;
constexpr int kLongestList = 1024;

// All that scripts may call; every other command is taken away.
constexpr const char* kCommands[] = {"append",  "break",  "concat",   "continue", "error",   "expr",   "for",
                                     "foreach", "if",     "incr",     "join",     "lappend", "lindex", "list",
                                     "llength", "lrange", "lreverse", "lsearch",  "lsort",   "return", "set",
                                     "split",   "string", "switch",   "unset",    "while"};

// What of "string" grows a text without bound.
constexpr const char* kRemovedParts[] = {"::tcl::string::repeat"};

QString textOf(Tcl_Obj* object) {
  int length = 0;
  const char* bytes = Tcl_GetStringFromObj(object, &length);
  return QString::fromUtf8(bytes, length);
}

void setResult(Tcl_Interp* interp, const QString& text) {
  const QByteArray bytes = text.toUtf8();
  Tcl_SetObjResult(interp, Tcl_NewStringObj(bytes.constData(), bytes.size()));
}

struct TextCommand {
  const char* name;
  QString (*transform)(const QString& text);
  const char* usage;
};

// Each takes exactly one word.
const TextCommand kTextCommands[] = {
    {"ORX_EncodeText", QORXWwjdEncode,
     "ORX_EncodeText procedure requires one parameter -- the value to be encoded"},
    {"ORX_DecodeText", QORXWwjdDecode,
     "ORX_DecodeText procedure requires one parameter -- the value to be decoded"},
    {"orx_fileExists", askFileExists, "orx_fileExists requires one parameter -- the path"},
    {"orx_env", askEnvironment, "orx_env requires one parameter -- the name of the variable"},
    {"orx_programInPath", askProgramInPath, "orx_programInPath requires one parameter -- the program"},
    {"orx_hasPackage", askTclPackage, "orx_hasPackage requires one parameter -- the package"},
};

int runTextCommand(ClientData data, Tcl_Interp* interp, int count, Tcl_Obj* const words[]) {
  const auto* command = static_cast<const TextCommand*>(data);
  if (count != 2) {
    Tcl_SetObjResult(interp, Tcl_NewStringObj(command->usage, -1));
    return TCL_ERROR;
  }
  setResult(interp, command->transform(textOf(words[1])));
  return TCL_OK;
}

bool usesPatterns(const char* command) {
  return std::strstr(command, "string") || std::strstr(command, "switch") || std::strstr(command, "lsearch");
}

// The parser follows brackets by recursion.
bool isTooDeep(const char* text) {
  int depth = 0;
  for (; *text; ++text) {
    if (*text == '[' || *text == '{' || *text == '(') {
      if (++depth > kDeepestBrackets) {
        return true;
      }
    } else if ((*text == ']' || *text == '}' || *text == ')') && depth > 0) {
      --depth;
    }
  }
  return false;
}

// Null when a text may be passed on, otherwise why not.
const char* refusalOfWord(Tcl_Obj* word) {
  // A large number is refused before it is turned into digits, which may take very long.
  if (!word->bytes && word->typePtr && std::strcmp(word->typePtr->name, "bignum") == 0) {
    return "a number is too large";
  }
  int length = 0;
  const char* text = Tcl_GetStringFromObj(word, &length);
  if (length > kLongestWord) {
    return "a word is too long";
  }
  if (isTooDeep(text)) {
    return "brackets are nested too deeply";
  }
  if (std::strstr(text, "**") || std::strstr(text, "<<")) {
    return "powers and shifts are not available";
  }
  return nullptr;
}

// Whether a variable that is about to grow is long enough already.
bool isFull(Tcl_Interp* interp, Tcl_Obj* name, bool isList) {
  Tcl_Obj* value = Tcl_ObjGetVar2(interp, name, nullptr, 0);
  if (!value) {
    return false;
  }
  int length = 0;
  if (isList) {
    return Tcl_ListObjLength(nullptr, value, &length) == TCL_OK && length > kLongestList;
  }
  Tcl_GetStringFromObj(value, &length);
  return length > kLongestVariable;
}

const char* refusal(Tcl_Interp* interp, int count, Tcl_Obj* const words[]) {
  if (count > kMostWords) {
    return "a command has too many words";
  }
  for (int i = 0; i < count; ++i) {
    if (const char* why = refusalOfWord(words[i])) {
      return why;
    }
  }
  const char* command = Tcl_GetString(words[0]);
  if (count > 1 && std::strstr(command, "append") &&
      isFull(interp, words[1], std::strstr(command, "lappend"))) {
    return "a variable is too long";
  }
  if (usesPatterns(command)) {
    for (int i = 1; i < count; ++i) {
      const char* text = Tcl_GetString(words[i]);
      if (std::count(text, text + std::strlen(text), '*') > kMostStars) {
        return "a pattern has too many \"*\"";
      }
      if (std::strncmp(text, "-r", 2) == 0) {
        return "regular expressions are not available";
      }
    }
  }
  return nullptr;
}

// "catch" that stores no text longer than a word.
int runCatch(ClientData, Tcl_Interp* interp, int count, Tcl_Obj* const words[]) {
  if (count != 2 && count != 3) {
    Tcl_WrongNumArgs(interp, 1, words, "script ?resultVarName?");
    return TCL_ERROR;
  }
  const int code = Tcl_EvalObjEx(interp, words[1], 0);
  if (Tcl_LimitExceeded(interp)) {
    return TCL_ERROR;
  }
  if (count == 3) {
    Tcl_Obj* result = Tcl_GetObjResult(interp);
    const char* why = refusalOfWord(result);
    Tcl_Obj* kept = why ? Tcl_NewStringObj(why, -1) : result;
    if (!Tcl_ObjSetVar2(interp, words[2], nullptr, kept, TCL_LEAVE_ERR_MSG)) {
      return TCL_ERROR;
    }
  }
  Tcl_SetObjResult(interp, Tcl_NewIntObj(code));
  return TCL_OK;
}

int watchCommand(ClientData, Tcl_Interp* interp, int, const char*, Tcl_Command, int count,
                 Tcl_Obj* const words[]) {
  if (const char* why = refusal(interp, count, words)) {
    Tcl_SetObjResult(interp, Tcl_NewStringObj(why, -1));
    return TCL_ERROR;
  }
  return TCL_OK;
}

}  // namespace

SafeTclInterpreter::SafeTclInterpreter() {
  static const bool isLibraryReady = [] {
    Tcl_FindExecutable(nullptr);
    return true;
  }();
  Q_UNUSED(isLibraryReady)
  m_interp = Tcl_CreateInterp();
  Tcl_MakeSafe(m_interp);
  const QByteArray autoPath = tclLibraryFolder().toUtf8();
  Tcl_SetVar2(m_interp, "::auto_path", nullptr, autoPath.constData(), TCL_GLOBAL_ONLY);
  removeUnlistedCommands();
  addCommands();
}

SafeTclInterpreter::~SafeTclInterpreter() {
  Tcl_DeleteInterp(m_interp);
}

void SafeTclInterpreter::removeUnlistedCommands() {
  const QByteArrayList commands = listOf("info commands ::*");
  // Commands in namespaces go with these; what "string" and expressions are made of stays.
  const QByteArrayList namespaces = listOf("concat [namespace children ::] [namespace children ::tcl]");
  for (const QByteArray& name : namespaces) {
    const bool isNeeded = name == "::tcl" || name == "::tcl::string" || name == "::tcl::mathfunc";
    Tcl_Namespace* unneeded =
        isNeeded ? nullptr : Tcl_FindNamespace(m_interp, name.constData(), nullptr, TCL_GLOBAL_ONLY);
    if (unneeded) {
      Tcl_DeleteNamespace(unneeded);
    }
  }
  for (const char* part : kRemovedParts) {
    Tcl_DeleteCommand(m_interp, part);
  }
  for (const QByteArray& command : commands) {
    const QByteArray name = command.startsWith("::") ? command.mid(2) : command;
    if (std::find(std::begin(kCommands), std::end(kCommands), name) == std::end(kCommands)) {
      Tcl_DeleteCommand(m_interp, command.constData());
    }
  }
  Tcl_ResetResult(m_interp);
}

QByteArrayList SafeTclInterpreter::listOf(const char* script) {
  QByteArrayList elements;
  int count = 0;
  const char** names = nullptr;
  Tcl_Eval(m_interp, script);
  if (Tcl_SplitList(m_interp, Tcl_GetStringResult(m_interp), &count, &names) == TCL_OK) {
    for (int i = 0; i < count; ++i) {
      elements.append(names[i]);
    }
    Tcl_Free(reinterpret_cast<char*>(names));
  }
  return elements;
}

void SafeTclInterpreter::addCommands() {
  for (const TextCommand& command : kTextCommands) {
    Tcl_CreateObjCommand(m_interp, command.name, runTextCommand, const_cast<TextCommand*>(&command), nullptr);
  }
  Tcl_CreateObjCommand(m_interp, "catch", runCatch, nullptr, nullptr);
}

bool SafeTclInterpreter::evaluate(const QString& script, QString& result) {
  const QByteArray bytes = script.toUtf8();
  if (bytes.size() > kLongestScript) {
    result = QStringLiteral("the script is too long");
    return false;
  }
  if (isTooDeep(bytes.constData())) {
    result = QStringLiteral("brackets are nested too deeply");
    return false;
  }
  Tcl_SetRecursionLimit(m_interp, kDeepestCalls);
  Tcl_LimitSetCommands(m_interp, kMostCommands);
  Tcl_LimitTypeSet(m_interp, TCL_LIMIT_COMMANDS);
  Tcl_Time deadline;
  Tcl_GetTime(&deadline);
  deadline.sec += kMostSeconds;
  Tcl_LimitSetTime(m_interp, &deadline);
  Tcl_LimitTypeSet(m_interp, TCL_LIMIT_TIME);
  // Without flags every command is seen, also those that would be compiled in place.
  Tcl_CreateObjTrace(m_interp, 0, 0, watchCommand, nullptr, nullptr);

  const int code = Tcl_EvalEx(m_interp, bytes.constData(), bytes.size(), TCL_EVAL_GLOBAL);
  Tcl_Obj* answer = Tcl_GetObjResult(m_interp);
  if (const char* why = code == TCL_OK ? refusalOfWord(answer) : nullptr) {
    result = QString::fromLatin1(why);
    return false;
  }
  result = textOf(answer);
  return code == TCL_OK || code == TCL_RETURN;
}
