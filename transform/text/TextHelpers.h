// Free functions that turn user-facing text into text that is safe inside the mapping file, and back.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

// Blank, "&", ",", "@", "\" and "/" become "_"; nothing else changes.
ORX_EXPORT QString safeMacroName(const QString& text);

// The name of the macro that holds the identifier of a custom transformer's instance.
ORX_EXPORT QString makePrefixMacro(const QString& text);

// `left` padded to `width`, one blank, `right`.
ORX_EXPORT QString makeColumnString(const QString& left, const QString& right, int width);

ORX_EXPORT QString quotifyString(const QString& text, const QString& specials);

// Quotes a value for the mapping file when it holds a blank, a tab, a parenthesis, a backslash or a double quote,
// or is empty. Inner quotes are escaped; a trailing backslash never escapes the closing quote.
ORX_EXPORT QString quotifyStringForMF(const QString& text);

// Quotes an attribute name of a definition line; quotes that belong to the name survive as escaped quotes.
ORX_EXPORT QString quotifyDefAttrName(const QString& name);

// Backslash and the control characters 7 to 13 become escapes: the form in which a text that the user typed
// enters the mapping file. (The name is the one that the rest of the system knows.)
ORX_EXPORT QString decodeUserString(const QString& text);

// The inverse: escapes become characters; any other backslash is kept. The result passes through the system's
// 8-bit encoding.
ORX_EXPORT QString encodeUserString(const QString& text);

// Splits at every separator; empty items are dropped. `out` is cleared first.
ORX_EXPORT void stringToList(const QString& text, QStringList& out, QChar separator);

// Removes every "orx_basicstring:...:" mark. A mark that no further colon closes loses its own text alone.
ORX_EXPORT QString stripBasicStringInfo(const QString& text);

// Reads a port description of a link: "fo N NAME" or "fi N NAME" for feature ports, "ao N M NAME" or "ai N M NAME"
// for attribute ports, the name word-encoded. Missing trailing pieces leave their arguments as they were.
ORX_EXPORT bool decodePortDescription(const QString& description, bool& isFeaturePort, bool& isOutput,
                                      unsigned& first, unsigned& second, QString& name);

// Appends the script block that computes a parameter with a Python function body. `prefix` is the prefix macro of
// a custom transformer's instance, or empty. `encodedCode` is word-encoded.
ORX_EXPORT void getPythonParameterLines(const QString& prefix, const QString& parameterName,
                                        const QString& encodedCode, QStringList& lines);

// The same for a Tcl procedure body.
ORX_EXPORT void getTclParameterLines(const QString& prefix, const QString& parameterName,
                                     const QString& encodedCode, QStringList& lines);
