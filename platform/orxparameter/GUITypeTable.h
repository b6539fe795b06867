// The table of parameter types that the system knows.
#pragma once

#include <platform/Export.h>

#include <QLatin1String>
#include <QString>

#include <vector>

struct GUITypeEntry {
  QLatin1String word;     // the type as it is written, for NAMEDGROUP NO_EDIT two words
  bool takesConfig;       // a configuration token stands in the prompt line, `""` when empty
  bool valueIsEncoded;    // values are kept in the word encoding
  QLatin1String purpose;  // what the type is for, for documentation
};

// In alphabetical order of the word.
ORX_EXPORT const std::vector<GUITypeEntry>& ORX_guiTypes();

// Null for a word that is not in the table.
ORX_EXPORT const GUITypeEntry* ORX_findGuiType(const QString& word);
