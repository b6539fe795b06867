// Macro references inside values: "$(NAME)", nested references in NAME included, and the deferred form
// "$[NAME]". NAME holds only characters that the word encoding lets pass. A text that is no reference is just
// text.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <utility>
#include <vector>

// The outermost references of the text, in order: begin and end.
ORX_EXPORT std::vector<std::pair<int, int>> macroReferences(const QString& text);

// The word encoding of the text, in which references are left as they stand, since the engine puts the
// macros' values in their places.
ORX_EXPORT QString encodeAroundReferences(const QString& text);
// The same for a text that is word-encoded already, or should be: what is not gets encoded.
ORX_EXPORT QString reencodeAroundReferences(const QString& encoded);

// Whether a macro may bear the name: it is one word of a macro statement and of a reference.
ORX_EXPORT bool isMacroName(const QString& name);

// A text with a harmless word in place of every reference.
ORX_EXPORT QString withoutReferences(const QString& text);
