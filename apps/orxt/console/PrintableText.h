// Text of strangers made fit to be printed among our own.
#pragma once

#include <QString>
#include <QStringList>

// The text with U+FFFD for each character that would steer the terminal or turn the direction of writing, and
// at most `limit` characters of it, with an ellipsis where it was cut.
QString withoutControls(const QString& text, int limit);
// One line of at most `limit` characters, with an ellipsis where it was cut: blanks and line breaks become
// one blank, and characters that would steer the terminal or turn the direction of writing are left out.
QString onOneLine(const QString& text, int limit);
// That line broken between words to lines of `width`; a longer word stands alone.
QStringList wrapped(const QString& line, int width);
