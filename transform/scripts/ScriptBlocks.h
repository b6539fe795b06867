// The bodies of the script blocks, as they are written into the mapping file.
#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

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
