// One command of a script, parsed by the Tcl library.
#pragma once

#include <QByteArray>
#include <QVector>
#include <tcl.h>

// The script outlives it.
class TclCommand {
 public:
  TclCommand(const char* script, int size) {
    static const bool kInitialised = (Tcl_FindExecutable(nullptr), true);
    (void)kInitialised;
    m_isComplete = Tcl_ParseCommand(nullptr, script, size, 0, &m_parse) == TCL_OK;
  }
  ~TclCommand() {
    if (m_isComplete) {
      Tcl_FreeParse(&m_parse);
    }
  }
  TclCommand(const TclCommand&) = delete;
  TclCommand& operator=(const TclCommand&) = delete;

  bool isComplete() const { return m_isComplete; }
  // Where the parser stopped over a fault.
  const char* fault() const { return m_parse.term; }
  const char* begin() const { return m_parse.commandStart; }
  const char* end() const { return m_parse.commandStart + m_parse.commandSize; }
  int wordCount() const { return m_parse.numWords; }

  // Each with its components behind it, as long as this object lives.
  QVector<const Tcl_Token*> words() const {
    QVector<const Tcl_Token*> words;
    words.reserve(m_parse.numWords);
    for (int i = 0; i < m_parse.numTokens; i += m_parse.tokenPtr[i].numComponents + 1) {
      words.append(&m_parse.tokenPtr[i]);
    }
    return words;
  }

 private:
  Tcl_Parse m_parse;
  bool m_isComplete;
};

inline QByteArray wordText(const Tcl_Token& word) {
  return QByteArray(word.start, word.size);
}

inline bool isBracedWord(const Tcl_Token& word) {
  return word.type == TCL_TOKEN_SIMPLE_WORD && word.size >= 2 && *word.start == '{';
}
