// Statements that only lead features on.
#pragma once

#include <QString>
#include <QStringList>

class MFBuffer;

// A TeeFactory from every type of `from`, each named once, to `to`, with functions behind. Names are quoted
// here.
void writeRoute(MFBuffer& buffer, const QString& factoryName, const QStringList& from, const QString& to,
                const QStringList& functions);

// The function that gives a feature a second attribute with the value of another; names are word-encoded.
QString copyAttributeFunction(const QString& to, const QString& from);
