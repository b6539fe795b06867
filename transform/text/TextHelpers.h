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

// Quotes a value for the mapping file when it holds a blank, a tab, a parenthesis, a backslash or a double
// quote, or is empty. Quotes inside are written as backslash and quote; backslashes at the end are doubled,
// so that none escapes the closing quote. Other backslashes stay as they are.
ORX_EXPORT QString quotifyStringForMF(const QString& text);

// Quotes an attribute name of a definition line as quotifyStringForMF does. A name in quotes of its own keeps
// them as escaped quotes around the quoted text; any other name whose quoted form holds a blank gets one more
// pair of quotes around it.
ORX_EXPORT QString quotifyDefAttrName(const QString& name);

// Backslash and the control characters 7 to 13 become escapes: the form in which a text that the user typed
// enters the mapping file. (The name is the one that the rest of the system knows.)
ORX_EXPORT QString decodeUserString(const QString& text);

// The inverse: escapes become characters; any other backslash is kept. The result passes through the system's
// 8-bit encoding.
ORX_EXPORT QString encodeUserString(const QString& text);

// Splits at every separator; empty items are dropped. `out` is cleared first.
ORX_EXPORT void stringToList(const QString& text, QStringList& out, char separator);
ORX_EXPORT void stringToList(const QString& text, QStringList& out, QChar separator);

// Removes every "orx_basicstring:...:" mark, also one that joins up when another is removed. A mark that no
// further colon closes loses its own text alone.
ORX_EXPORT QString stripBasicStringInfo(const QString& text);

// Reads a port description of a link: "fo N NAME" or "fi N NAME" for feature ports, "ao N M NAME" or "ai N M
// NAME" for attribute ports, the name word-encoded. Missing trailing pieces leave their arguments as they
// were; a piece that should be a number and is none makes the answer false, which leaves all of them.
ORX_EXPORT bool decodePortDescription(const QString& description, bool& isFeaturePort, bool& isOutput,
                                      unsigned& first, unsigned& second, QString& name);

// Appends the script block that computes a parameter with a Python function body. `prefix` is the prefix
// macro of a custom transformer's instance, or empty; with one, the lookups of ORX_MacroValues read the
// instance's macros, those of the built-in macros excepted. `encodedCode` is word-encoded. The last line that
// is neither blank nor a comment gives the value. Whatever is given is written; ask canWritePythonParameter()
// (transform/scripts/ScriptBlocks.h) first. Both are defined on the floor of the scripts.
ORX_EXPORT void getPythonParameterLines(const QString& prefix, const QString& parameterName,
                                        const QString& encodedCode, QStringList& lines);

// The same for a Tcl procedure body; every line loses the blanks around it.
ORX_EXPORT void getTclParameterLines(const QString& prefix, const QString& parameterName,
                                     const QString& encodedCode, QStringList& lines);
