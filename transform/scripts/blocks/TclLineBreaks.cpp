#include <transform/scripts/blocks/TclCommand.h>
#include <transform/scripts/blocks/TclLineBreaks.h>

#include <QSet>

#include <algorithm>
#include <vector>

namespace {

// Commands in brackets inside each other that are looked into.
constexpr int kDeepest = 16;

bool isLineBreak(char c) {
  return c == '\n' || c == '\r';
}

class ResultSearch {
 public:
  const char* find(const QByteArray& script) {
    struct Range {
      const char* at;
      const char* end;
    };
    std::vector<Range> open{{script.constData(), script.constData() + script.size()}};
    while (!open.empty()) {
      Range& range = open.back();
      if (range.at >= range.end) {
        open.pop_back();
        continue;
      }
      const TclCommand command(range.at, static_cast<int>(range.end - range.at));
      if (!command.isComplete()) {
        open.pop_back();
        continue;
      }
      range.at = command.end();
      const QVector<const Tcl_Token*> words = command.words();
      if (words.isEmpty()) {
        continue;
      }
      const QByteArray name = wordText(*words.first());
      if (name == "return" && words.size() == 2 && mayBreak(*words.last(), 0)) {
        return command.begin();
      }
      noteVariable(name, words, open.size() == 1);
      static const QSet<QByteArray> kTakeScripts = {"if", "while", "for", "foreach"};
      for (const Tcl_Token* word : kTakeScripts.contains(name) ? words : QVector<const Tcl_Token*>()) {
        if (isBracedWord(*word)) {
          open.push_back({word->start + 1, word->start + word->size - 1});
        }
      }
    }
    return nullptr;
  }

 private:
  // A variable that is set anew for certain is known anew.
  void noteVariable(const QByteArray& name, const QVector<const Tcl_Token*>& words, bool isCertain) {
    const bool sets = name == "set";
    if (words.size() < 3 || !(sets || name == "append" || name == "lappend")) {
      return;
    }
    const QByteArray variable = wordText(*words[1]);
    if (std::any_of(words.begin() + 2, words.end(),
                    [this](const Tcl_Token* word) { return mayBreak(*word, 0); })) {
      m_breaking.insert(variable);
    } else if (sets && isCertain) {
      m_breaking.remove(variable);
    }
  }

  bool mayBreak(const Tcl_Token& word, int depth) const {
    for (int i = 1; i <= word.numComponents; ++i) {
      const Tcl_Token& part = *(&word + i);
      if (part.type == TCL_TOKEN_VARIABLE) {
        if (part.numComponents == 1 && m_breaking.contains(wordText(*(&part + 1)))) {
          return true;
        }
        i += part.numComponents;
      } else if (part.type == TCL_TOKEN_BS) {
        char text[TCL_UTF_MAX] = {};
        Tcl_UtfBackslash(part.start, nullptr, text);
        if (isLineBreak(text[0])) {
          return true;
        }
      } else if (part.type == TCL_TOKEN_TEXT) {
        if (std::any_of(part.start, part.start + part.size, &isLineBreak)) {
          return true;
        }
      } else if (part.type == TCL_TOKEN_COMMAND && depth < kDeepest &&
                 commandMayBreak(part.start + 1, part.size - 2, depth + 1)) {
        return true;
      }
    }
    return false;
  }

  // Commands that hand on the texts they are given.
  bool commandMayBreak(const char* script, int size, int depth) const {
    const TclCommand command(script, size);
    if (!command.isComplete() || command.wordCount() < 2) {
      return false;
    }
    const QVector<const Tcl_Token*> words = command.words();
    const QByteArray name = wordText(*words.first());
    static const QSet<QByteArray> kHandOn = {"concat", "format", "join", "list", "set"};
    const bool joinsTexts = name == "string" && wordText(*words[1]) == "cat";
    if (name == "set" && words.size() == 2) {
      return m_breaking.contains(wordText(*words[1]));
    }
    return (joinsTexts || kHandOn.contains(name)) &&
           std::any_of(words.begin() + 1, words.end(),
                       [&](const Tcl_Token* word) { return mayBreak(*word, depth); });
  }

  QSet<QByteArray> m_breaking;
};

}  // namespace

const char* findResultWithLineBreak(const QByteArray& script) {
  return ResultSearch().find(script);
}
