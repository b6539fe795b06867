// What references to macros bring into a value. An engine puts the values of macros in their places inside
// words, calls and lists that it has told apart already, or is yet to: what is known of them is judged as the
// engine sees it.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <functional>

class TransformParamCfg;

namespace carried_references {

// Carries out the references whose values are known; the others stay. False when they do not come to an end.
using Expand = std::function<bool(QString& text)>;

// How a table reaches its statement: as one packed text, or cell by cell.
enum class TableForm { Packed, ByRows };

// The number of the message that says why a text that a reference of the stored value stands for would change
// what is around it; 0 when none would.
ORX_EXPORT long refuse(const TransformParamCfg& record, const QString& stored, TableForm form,
                       const Expand& expand);

// Whether a text that a reference brings stays one piece of an expression, and is read there as what it is.
// Among word-encoded texts it is one itself; a plain one is decoded with the text around it.
ORX_EXPORT bool fitsExpression(const QString& text, bool isEncoded);

// Whether a list of word-encoded texts still holds the value as one, once the references in it are carried
// out.
ORX_EXPORT bool fitsEncodedList(const QString& value, const Expand& expand);

}  // namespace carried_references
