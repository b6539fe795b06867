// Runs script blocks of the mapping file the way the engine does, and tells which macros they define.
#pragma once

#include <QMap>
#include <QString>
#include <QStringList>
#include <QVector>

struct ScriptRun {
  QStringList block;
  QMap<QString, QString> macros;
};

// The macros that a block defines, or the entry "!" with the error. One python3 runs all of them.
QVector<QMap<QString, QString>> runPythonBlocks(const QVector<ScriptRun>& runs);
QMap<QString, QString> runTclBlock(const ScriptRun& run);

// The block as the mapping-file buffer leaves it: an empty line behind every line, blank lines gone.
QStringList asFlushed(const QStringList& block);
