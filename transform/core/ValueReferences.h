// The attribute references "@Value(NAME)" inside a value, in the forms in which they are stored: plain,
// word-encoded, and word-encoded with "@" as it is. What is a reference is decided here alone. Which forms
// are references, and which are letters of a text, follows from the type of the value.
//
// Brackets inside a name count when they are matched, and not at all in a name in double quotes; of
// references inside one another only the innermost is one; one that is never closed is text. So references
// never overlap.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <vector>

class GUIType;

enum class ReferenceForms {
  Plain,   // values that are not word-encoded
  BareAt,  // also word-encoded, with "@" as it is: an encoded "@" is one of the text
  All,     // also word-encoded as a whole
};
ORX_EXPORT ReferenceForms referenceForms(const GUIType& type, const QString& value);

struct ValueReference {
  int begin;
  int end;
  QString name;  // of the attribute
  QString word;  // the name word-encoded, references to macros in it as they stand
};

// In the order of the text; linear in its size.
ORX_EXPORT std::vector<ValueReference> valueReferences(const QString& text,
                                                       ReferenceForms forms = ReferenceForms::All);
// Those of a value of the type.
ORX_EXPORT std::vector<ValueReference> valueReferences(const GUIType& type, const QString& value);

// Whether the text is one reference, with nothing before or behind it.
ORX_EXPORT bool isValueReference(const QString& text, ReferenceForms forms = ReferenceForms::All);

// Whether some reference begins in the text, be it closed or not.
ORX_EXPORT bool beginsValueReference(const QString& text, ReferenceForms forms = ReferenceForms::All);

// In a decoded text: behind the "@Value(NAME)" that begins at the position, whatever NAME holds; -1 when it
// is not closed.
ORX_EXPORT int endOfValueReference(const QString& text, int begin);
