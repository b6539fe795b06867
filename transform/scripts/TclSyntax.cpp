#include <transform/scripts/TclSyntax.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/MessageStrings.h>

#include <QByteArray>
#include <QVector>
#include <tcl.h>

#include <algorithm>
#include <memory>

namespace {

// Bodies inside bodies are followed this far; what lies deeper is only matched for its braces.
constexpr int kDeepest = 64;
// The Tcl library parses brackets within brackets, and indices within indices, by calling itself.
constexpr int kMostBrackets = 5000;

struct InterpreterDeleter {
  void operator()(Tcl_Interp* interpreter) const { Tcl_DeleteInterp(interpreter); }
};

class Parser {
 public:
  explicit Parser(const QByteArray& script) : m_begin(script.constData()) {
    static const bool kInitialised = (Tcl_FindExecutable(nullptr), true);
    (void)kInitialised;
    const auto brackets =
        std::count_if(script.begin(), script.end(), [](char c) { return c == '[' || c == '(' || c == '"'; });
    if (brackets > kMostBrackets) {
      m_fault = {1, 0, TransformResString(orx::messages::kTclTooManyBrackets)};
      return;
    }
    // An interpreter is there for its messages alone, and making one takes longer than parsing.
    if (!parseScript(script.constData(), script.size(), 0)) {
      m_interpreter.reset(Tcl_CreateInterp());
      parseScript(script.constData(), script.size(), 0);
    }
  }
  const TclFault& fault() const { return m_fault; }

 private:
  struct Word {
    const char* start;
    int size;
    bool isBraced;  // its content stands as it is
  };

  bool refuse(const char* at) {
    m_fault.line = 1 + static_cast<int>(std::count(m_begin, at, '\n'));
    m_fault.offset = static_cast<int>(at - m_begin);
    if (m_interpreter) {
      m_fault.text = QString::fromUtf8(Tcl_GetStringResult(m_interpreter.get()));
    }
    if (m_fault.text.isEmpty()) {
      m_fault.text = TransformResString(orx::messages::kTclNotParsed);
    }
    return false;
  }

  bool parseScript(const char* start, int size, int depth) {
    const char* const end = start + size;
    while (start < end) {
      Tcl_Parse parse;
      if (Tcl_ParseCommand(m_interpreter.get(), start, static_cast<int>(end - start), 0, &parse) != TCL_OK) {
        return refuse(start);
      }
      QVector<Word> words;
      bool isSound = true;
      for (int i = 0; i < parse.numTokens; i += parse.tokenPtr[i].numComponents + 1) {
        const Tcl_Token& word = parse.tokenPtr[i];
        const bool isBraced = word.type == TCL_TOKEN_SIMPLE_WORD && word.size >= 2 && *word.start == '{';
        words.append({word.start + (isBraced ? 1 : 0), word.size - (isBraced ? 2 : 0), isBraced});
      }
      // Commands in brackets, wherever they stand outside braces.
      for (int i = 0; i < parse.numTokens && isSound; ++i) {
        const Tcl_Token& token = parse.tokenPtr[i];
        if (token.type == TCL_TOKEN_COMMAND && token.size >= 2 && depth < kDeepest) {
          isSound = parseScript(token.start + 1, token.size - 2, depth + 1);
        }
      }
      start = parse.commandStart + parse.commandSize;
      Tcl_FreeParse(&parse);
      if (!isSound || (depth < kDeepest && !parseParts(words, depth + 1))) {
        return false;
      }
    }
    return true;
  }

  bool parseBody(const QVector<Word>& words, int index, int depth) {
    return index >= words.size() || !words[index].isBraced ||
           parseScript(words[index].start, words[index].size, depth);
  }

  bool parseExpression(const QVector<Word>& words, int index) {
    if (index >= words.size() || !words[index].isBraced) {
      return true;
    }
    Tcl_Parse parse;
    if (Tcl_ParseExpr(m_interpreter.get(), words[index].start, words[index].size, &parse) != TCL_OK) {
      return refuse(words[index].start);
    }
    Tcl_FreeParse(&parse);
    return true;
  }

  static bool is(const Word& word, const char* text) {
    return QByteArray::fromRawData(word.start, word.size) == text;
  }

  bool parseParts(const QVector<Word>& words, int depth) {
    if (words.isEmpty()) {
      return true;
    }
    const int last = words.size() - 1;
    if (is(words[0], "proc")) {
      return parseBody(words, 3, depth);
    }
    if (is(words[0], "expr")) {
      return last != 1 || parseExpression(words, 1);
    }
    if (is(words[0], "while")) {
      return parseExpression(words, 1) && parseBody(words, 2, depth);
    }
    if (is(words[0], "foreach")) {
      return parseBody(words, last, depth);
    }
    if (is(words[0], "for")) {
      return parseBody(words, 1, depth) && parseExpression(words, 2) && parseBody(words, 3, depth) &&
             parseBody(words, 4, depth);
    }
    if (is(words[0], "catch")) {
      return parseBody(words, 1, depth);
    }
    return !is(words[0], "if") || parseIf(words, depth);
  }

  // if EXPR ?then? BODY ?elseif EXPR ?then? BODY ...? ??else? BODY?
  bool parseIf(const QVector<Word>& words, int depth) {
    for (int i = 1; i < words.size();) {
      if (!parseExpression(words, i)) {
        return false;
      }
      ++i;
      if (i < words.size() && is(words[i], "then")) {
        ++i;
      }
      if (!parseBody(words, i, depth)) {
        return false;
      }
      ++i;
      if (i < words.size() && is(words[i], "elseif")) {
        ++i;
        continue;
      }
      if (i < words.size() && is(words[i], "else")) {
        ++i;
      }
      return parseBody(words, i, depth);
    }
    return true;
  }

  const char* m_begin;
  std::unique_ptr<Tcl_Interp, InterpreterDeleter> m_interpreter;
  TclFault m_fault;
};

}  // namespace

TclFault findTclFault(const QString& script) {
  const QByteArray text = script.toUtf8();
  return Parser(text).fault();
}
