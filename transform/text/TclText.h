// Whether a text means itself in a Tcl script, judged by the Tcl library's own parser.
#pragma once

#include <QString>
#include <QStringList>

namespace tcl_text {

// "{text}" is one word, and the word is the text.
bool meansItselfInBraces(const QString& text);
// The text inside a string in double quotes, the whole inside braces, is the text: nothing is substituted.
bool meansItselfInQuotes(const QString& text);
// Splits a Tcl list; false when it is none.
bool splitList(const QString& text, QStringList& elements);

}  // namespace tcl_text
