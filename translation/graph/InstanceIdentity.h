// The identity of a transformer instance, from its place in the document alone: the same document gives the
// same identity wherever and whenever it is translated.
#pragma once

#include <QString>
#include <QStringList>

// The stem of unique identifiers: a name-based UUID of the path of sub-document names, the record's
// identifier and the instance's name, "-" written as "_".
QString instanceStem(const QStringList& documentPath, int recordIdentifier, const QString& name);
