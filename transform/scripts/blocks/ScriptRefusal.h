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

// A name that can stand in a macro line and in a string literal of a script.
bool isScriptableName(const QString& name);
// A text without the characters of `specials`, control characters and broken surrogate pairs.
bool isFreeOf(const QString& text, const QString& specials);

// Characters that do not survive in a line of the mapping file, and lines that would end the block.
ScriptRefusal refuseUnwritableLines(const QStringList& codeLines);

// The text for the user.
QString scriptRefusalText(const QString& parameterName, const ScriptRefusal& refusal);
QString scriptNameRefusalText(const QString& parameterName, const QString& badName);
