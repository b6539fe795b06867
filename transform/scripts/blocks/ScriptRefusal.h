// What the checks of Python and Tcl scripts have in common: why a script cannot be written, and the checks
// that do not depend on the language.
#pragma once

#include <QString>
#include <QStringList>

// A message number, zero for none, and the line from 1 that it speaks of, zero for none.
struct ScriptRefusal {
  long message = 0;
  int line = 0;

  explicit operator bool() const { return message != 0; }
};

namespace script_refusal {
constexpr long kTooManyBrackets = 370729;
constexpr long kName = 370730;
constexpr long kEmpty = 370731;
constexpr long kCharacter = 370732;
constexpr long kBlockEnd = 370733;
constexpr long kContinuation = 370734;
constexpr long kTextOfSeveralLines = 370735;
constexpr long kUnbalanced = 370736;
constexpr long kResultInsideStatement = 370737;
constexpr long kResultNoValue = 370738;
constexpr long kLookup = 370739;
}  // namespace script_refusal

// A name that can stand in a macro line and in a string literal of a script.
bool isScriptableName(const QString& name);
// A text without the characters of `specials`, control characters and broken surrogate pairs.
bool isFreeOf(const QString& text, const QString& specials);

// Characters that do not survive in a line of the mapping file, and lines that would end the block.
ScriptRefusal refuseUnwritableLines(const QStringList& codeLines);

// The text for the user.
QString scriptRefusalText(const QString& parameterName, const ScriptRefusal& refusal);
QString scriptNameRefusalText(const QString& parameterName, const QString& badName);
