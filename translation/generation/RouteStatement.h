// Statements that only lead features on.
#pragma once

#include <QString>
#include <QStringList>

class AttributeCopies;
class MFBuffer;

// A TeeFactory from every type of `from`, each named once, to `to`, with functions behind. Names are quoted
// here.
void writeRoute(MFBuffer& buffer, const QString& factoryName, const QStringList& from, const QString& to,
                const QStringList& functions);

// The function that gives a feature attributes with the values of others, all at once; empty for none. Names
// are word-encoded.
QString copyAttributesFunction(const AttributeCopies& copies);
// The statement that leads one flow on to another by such a function.
void writeCopies(MFBuffer& buffer, const QString& from, const QString& to, const QString& function);
