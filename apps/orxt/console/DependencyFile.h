// What a file was made from, in the form that make and Ninja read: "made: from from ...", and each of these
// once more without anything behind it, so that one that is gone stops nothing.
#pragma once

#include <QString>
#include <QStringList>

namespace dependency_file {

// The whole text, with every name escaped.
QString text(const QString& made, const QStringList& from);

// Replaces the file as a whole. False, with the reason in `error`.
bool write(const QString& fileName, const QString& made, const QStringList& from, QString& error);

}  // namespace dependency_file
