#include <transform/text/TclText.h>

#include <QByteArray>
#include <QStringList>
#include <tcl.h>

#include <cstring>
#include <limits>

namespace {

void initialise() {
  static const bool kInitialised = (Tcl_FindExecutable(nullptr), true);
  (void)kInitialised;
}

// Characters that mean nothing to Tcl, in braces as in quotes.
bool isHarmless(const QString& text) {
  for (const QChar c : text) {
    const ushort code = c.unicode();
    if (code < 0x80 && (code == 0 || std::strchr("{}[]$\\\"\n\r", code) != nullptr)) {
      return false;
    }
  }
  return true;
}

// Whether the parsed text consists of pieces that stay as they are.
bool isPlainText(const Tcl_Parse& parse) {
  for (int i = 0; i < parse.numTokens; ++i) {
    if (parse.tokenPtr[i].type != TCL_TOKEN_TEXT) {
      return false;
    }
  }
  return true;
}

using ParseFunction = int (*)(Tcl_Interp*, const char*, int, Tcl_Parse*, int, const char**);

bool meansItself(ParseFunction parseText, char open, const QString& text, char close) {
  const QByteArray bytes = text.toUtf8();
  if (bytes.size() > std::numeric_limits<int>::max() / 2 || bytes.contains('\0')) {
    return false;
  }
  const QByteArray word = open + bytes + close;
  Tcl_Parse parse;
  const char* end = nullptr;
  if (parseText(nullptr, word.constData(), word.size(), &parse, 0, &end) != TCL_OK) {
    return false;
  }
  const bool isWhole = end == word.constData() + word.size() && isPlainText(parse);
  Tcl_FreeParse(&parse);
  return isWhole;
}

}  // namespace

namespace tcl_text {

bool meansItselfInBraces(const QString& text) {
  if (isHarmless(text)) {
    return true;
  }
  initialise();
  return meansItself(Tcl_ParseBraces, '{', text, '}');
}

bool meansItselfInQuotes(const QString& text) {
  if (isHarmless(text)) {
    return true;
  }
  initialise();
  return meansItself(Tcl_ParseBraces, '{', text, '}') && meansItself(Tcl_ParseQuotedString, '"', text, '"');
}

bool splitList(const QString& text, QStringList& elements) {
  initialise();
  int count = 0;
  const char** pieces = nullptr;
  if (Tcl_SplitList(nullptr, text.toUtf8().constData(), &count, &pieces) != TCL_OK) {
    return false;
  }
  for (int i = 0; i < count; ++i) {
    elements.append(QString::fromUtf8(pieces[i]));
  }
  Tcl_Free(reinterpret_cast<char*>(pieces));
  return true;
}

}  // namespace tcl_text
