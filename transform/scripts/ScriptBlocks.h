// The bodies of the script blocks, as they are written into the mapping file.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>
#include <QVector>

#include <functional>

// The encoded code as lines; no lines for an empty code. Line ends of the form CR LF count as LF.
QStringList scriptCodeLines(const QString& encodedCode);

// The index of the last line that is neither blank nor a comment, or -1: the line that gives the value.
int scriptResultLine(const QStringList& lines);

// The body lines of the block: continuations joined, indented, redirected to the instance, the result
// returned.
QStringList pythonBodyLines(const QString& prefix, const QString& encodedCode);
QStringList tclBodyLines(const QString& prefix, const QString& encodedCode);

// Where in a line the keys of the macro lookups stand that are redirected to the instance.
struct ScriptKey {
  int position;
  int length;
};
QVector<ScriptKey> redirectedPythonKeys(const QString& line);
QVector<ScriptKey> redirectedTclKeys(const QString& line);

// Whether the block that getPythonParameterLines() writes for these arguments means what the script says.
// False, with a message for the user in `reason`, when a name or the code would break out of the block, or
// the block would compute something else: an empty script, a text of several lines, a backslash continuation
// over more than two lines, a last line that is the end of a statement begun above it or no expression. This
// looks at the line structure; it does not replace Python's own check of the syntax. A caller gives an unset
// parameter no script.
ORX_EXPORT bool canWritePythonParameter(const QString& prefix, const QString& parameterName,
                                        const QString& encodedCode, QString& reason);

// The same for getTclParameterLines(); the code is parsed by the Tcl library. An empty script is fine: its
// value is empty.
ORX_EXPORT bool canWriteTclParameter(const QString& prefix, const QString& parameterName,
                                     const QString& encodedCode, QString& reason);

// Why a script that can be written cannot be run where it stands: it reads a macro that is not set before.
// Empty when nothing is wrong. Only names that the code spells out are judged, and none of a script that
// looks whether macros are there, or catches errors.
ORX_EXPORT QString unsetReadByScript(bool isPython, const QString& parameterName, const QString& encodedCode,
                                     const std::function<bool(const QString& name)>& isSetBefore,
                                     const std::function<bool(const QString& name)>& isSetBehind);
