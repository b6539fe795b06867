// Stored values of parameters: the part of a multi-parameter that belongs to a member, attribute references.
#pragma once

#include <platform/Export.h>

#include <QString>
#include <QStringList>

class GUIType;
class TransformParamCfg;

// Whether the name is one that a multi-parameter lists, not its own.
bool isMemberOf(const TransformParamCfg& record, const QString& name);

// The record's value, or the part of it that belongs to the member.
QString storedValue(const TransformParamCfg& record, const QString& name);
void storeValue(TransformParamCfg& record, const QString& name, const QString& value);

// "&NAME" as the encoded "@Value(NAME)" for types that take it in that form; any other value as it is.
QString withAttributeReference(const GUIType& type, const QString& value);

// The number of the message that says why the value is none of an encoded type, which is one word wherever it
// stands: as a value, a member, a cell, the value of a macro; 0 when it is one, and for any other type.
// Expressions are judged as such.
ORX_EXPORT long refuseEncoding(const GUIType& type, const QString& value);

// The results of a conditional value, word-encoded as they stand; any other value by itself.
QStringList possibleValues(const QString& value);

// Whether a value of the type may be an attribute reference or hold some.
bool takesAttributeReference(const GUIType& type);
