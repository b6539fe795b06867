// Writes the Tcl fragments with which the engine looks a choice up when the mapping file runs.
//
// The texts are fixed; what they cannot carry is refused by MappingFileChecks before anything is written.
#pragma once

#include <platform/orxparameter/orxparameter.h>

#include <QString>

#include <utility>
#include <vector>

class MFBuffer;

// What a box lookup is about.
struct BoxLookup {
  QString value;
  QString prompt;
  QString macro;       // the macro that receives the stored side
  QString identifier;  // of the transformer, for the message when a value is missing
  bool isOptional;     // an empty value is allowed
};

namespace lookup_writers {

void writeChoiceBox(MFBuffer& buffer, const ChoiceList& choices, const BoxLookup& lookup);
void writeListBox(MFBuffer& buffer, const ChoiceList& choices, const BoxLookup& lookup);
// The procedure maps the shown side to the stored one and gives back any other value as it is. Returns its
// call.
QString writeChoiceProcedure(MFBuffer& buffer, const ChoiceList& choices, const QString& procedure,
                             const QString& value);

using Entries = std::vector<std::pair<QString, QString>>;
// The order of the entries: that of the choices, unless the fragment would take one entry for another in it.
Entries listBoxOrder(const ChoiceList& choices);
Entries procedureOrder(const ChoiceList& choices);
// A text as an element of the list of a list-box lookup.
QString listElement(const QString& text);

}  // namespace lookup_writers
