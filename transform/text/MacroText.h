// References to macros in texts of every kind: values, names, statements. What is a reference is decided here
// alone: "$(NAME)", where NAME is not empty and holds no blank, "$" or parenthesis other than in references
// of its own, and the deferred form "$[NAME]". Anything else is text.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <vector>

struct MacroReference {
  int begin = 0;
  int end = 0;  // behind the closing bracket, or where it is missed
  bool isClosed = true;
  bool isDeferred = false;
  bool isInside = false;  // inside the name of another one
  bool hasInner = false;  // others stand inside its name

  QString name(const QString& text) const { return text.mid(begin + 2, end - begin - 3); }
};

// In the order of their ends. What begins like a reference and is none is not closed; where several would be
// inside one another, of ordinary ones only the outermost is told. Linear in the size of
// the text.
ORX_EXPORT std::vector<MacroReference> macroReferences(const QString& text);

// The text with `filler` in the place of what an engine reads as a reference, as long as it is.
ORX_EXPORT QString blankReferences(const QString& text, const std::vector<MacroReference>& references,
                                   QChar filler = QLatin1Char('x'));

// Whether every "$[" begins a reference: others would be written in other brackets.
ORX_EXPORT bool closesDeferredReferences(const QString& text);

// Whether something in the text begins like a reference, be it one or not.
ORX_EXPORT bool beginsMacroReference(const QString& text);

// The word encoding of the text, in which references are left as they stand, since the engine puts the
// macros' values in their places.
ORX_EXPORT QString encodeAroundReferences(const QString& text);
// The same for a text that is word-encoded already, or should be: what is not gets encoded.
ORX_EXPORT QString reencodeAroundReferences(const QString& encoded);

// Whether a macro may bear the name: it is one word of a macro statement and of a reference.
ORX_EXPORT bool isMacroName(const QString& name);

// A text with a harmless word in place of every reference.
ORX_EXPORT QString withoutReferences(const QString& text);
