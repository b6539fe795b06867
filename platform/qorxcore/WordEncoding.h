// The word encoding: any Unicode text as one token without blanks, quotes, braces or separators.
//
// Letters, digits, - _ . : + * = ! ? ~ ^ | # and everything from U+00A1 up that is not white space stand for
// themselves; every other character is written as its Unicode name in angle brackets, lower case, blanks and
// hyphens dropped ("<space>", "<solidus>"), or as "<uXXXX>" (four to six lower-case hexadecimal digits) when
// it has no such name. Lone surrogates are "<ud800>" and so on.
#pragma once

#include <platform/Export.h>

#include <QString>

ORX_EXPORT QString QORXWwjdEncode(const QString& text);

// Unknown "<...>" is left as it stands, so that "<Unused>" and "<BLANK>" survive. Any character may be given
// by its number, in lower-case digits.
ORX_EXPORT QString QORXWwjdDecode(const QString& encoded);

// True when the text holds only characters that pass, known names and macro references "$(NAME)", whose NAME
// holds only characters that pass.
ORX_EXPORT bool QORXWwjdIsWellFormed(const QString& encoded);
