#include <platform/qorxcore/WordEncoding.h>
#include <transform/core/SafeTclInterpreter.h>
#include <transform/core/SystemQuestions.h>

#include <QByteArray>
#include <QStringList>
#include <tcl.h>

#include <algorithm>
#include <cstring>
#include <iterator>
#include <malloc.h>

namespace {

constexpr int kMostCommands = 10000;
constexpr int kMostSeconds = 1;
constexpr int kDeepestCalls = 60;
constexpr int kLongestScript = 16 * 1024;
constexpr int kDeepestBrackets = 100;
constexpr int kLongestWord = 1024;
constexpr int kMostStars = 3;
constexpr std::size_t kMostMemory = 4 * 1024 * 1024;

// All that scripts may call; every other command is taken away.
constexpr const char* kCommands[] = {
    "append",  "break",  "catch",    "concat",  "continue", "error",    "expr",   "for",
    "foreach", "global", "if",       "incr",    "join",     "lappend",  "lindex", "list",
    "llength", "lrange", "lreverse", "lsearch", "lsort",    "proc",     "return", "set",
    "split",   "string", "switch",   "unset",   "upvar",    "variable", "while"};

// What of "string" and of the functions below it can grow without bound, or call commands by other names.
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

std::size_t memoryInUse() {
  const struct mallinfo2 info = mallinfo2();
  return info.uordblks + info.hblkhd;
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

int watchCommand(ClientData data, Tcl_Interp* interp, int, const char*, Tcl_Command, int count,
                 Tcl_Obj* const words[]) {
  const auto* watched = static_cast<const SafeTclInterpreter*>(data);
  if (const char* why = watched->refusal(count, reinterpret_cast<void* const*>(words))) {
    Tcl_SetObjResult(interp, Tcl_NewStringObj(why, -1));
    return TCL_ERROR;
  }
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
  Tcl_Eval(m_interp, "info commands ::*");
  int count = 0;
  const char** names = nullptr;
  if (Tcl_SplitList(m_interp, Tcl_GetStringResult(m_interp), &count, &names) != TCL_OK) {
    return;
  }
  // Functions of expressions, and the parts of the ensembles that go, stay out of reach with their
  // namespaces.
  Tcl_Eval(m_interp,
           "foreach ns [namespace children ::tcl] {"
           "  if {$ns ne {::tcl::string} && $ns ne {::tcl::mathfunc}} {namespace delete $ns}"
           "}");
  for (const char* part : kRemovedParts) {
    Tcl_DeleteCommand(m_interp, part);
  }
  for (int i = 0; i < count; ++i) {
    const char* name = names[i] + (std::strncmp(names[i], "::", 2) == 0 ? 2 : 0);
    const bool isListed = std::any_of(std::begin(kCommands), std::end(kCommands),
                                      [name](const char* listed) { return std::strcmp(name, listed) == 0; });
    if (!isListed) {
      Tcl_DeleteCommand(m_interp, name);
    }
  }
  Tcl_Free(reinterpret_cast<char*>(names));
  Tcl_ResetResult(m_interp);
}

void SafeTclInterpreter::addCommands() {
  for (const TextCommand& command : kTextCommands) {
    Tcl_CreateObjCommand(m_interp, command.name, runTextCommand, const_cast<TextCommand*>(&command), nullptr);
  }
}

const char* SafeTclInterpreter::refusal(int wordCount, void* const* words) const {
  static const Tcl_ObjType* const bigNumber = Tcl_GetObjType("bignum");
  const std::size_t memory = memoryInUse();
  if (memory > m_memoryAtStart + kMostMemory) {
    return "the script needs too much memory";
  }
  bool checksPattern = false;
  for (int i = 0; i < wordCount; ++i) {
    auto* word = static_cast<Tcl_Obj*>(words[i]);
    // Such a number is refused before it is turned into digits, which may take very long.
    if (!word->bytes && word->typePtr &&
        (word->typePtr == bigNumber || !std::strcmp(word->typePtr->name, "bignum"))) {
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
    if (i == 0) {
      checksPattern = usesPatterns(text);
    } else if (checksPattern) {
      if (std::count(text, text + length, '*') > kMostStars) {
        return "a pattern has too many \"*\"";
      }
      if (std::strncmp(text, "-re", 3) == 0) {
        return "regular expressions are not available";
      }
    }
  }
  return nullptr;
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
  m_memoryAtStart = memoryInUse();
  Tcl_SetRecursionLimit(m_interp, kDeepestCalls);
  Tcl_LimitSetCommands(m_interp, kMostCommands);
  Tcl_LimitTypeSet(m_interp, TCL_LIMIT_COMMANDS);
  Tcl_Time deadline;
  Tcl_GetTime(&deadline);
  deadline.sec += kMostSeconds;
  Tcl_LimitSetTime(m_interp, &deadline);
  Tcl_LimitTypeSet(m_interp, TCL_LIMIT_TIME);
  // Without flags every command is seen, also those that would be compiled in place.
  Tcl_CreateObjTrace(m_interp, 0, 0, watchCommand, this, nullptr);

  const int code = Tcl_EvalEx(m_interp, bytes.constData(), bytes.size(), TCL_EVAL_GLOBAL);
  Tcl_Obj* answer = Tcl_GetObjResult(m_interp);
  void* word = answer;
  if (const char* why = code == TCL_OK ? refusal(1, &word) : nullptr) {
    result = QString::fromLatin1(why);
    return false;
  }
  result = textOf(answer);
  return code == TCL_OK || code == TCL_RETURN;
}
