// What the fixed texts of the lookup fragments cannot carry. References to macros count as harmless words:
// the engine puts the macros' values in their places before it runs a fragment.
//
// Each function answers with the number of the message that says why, or 0.
#pragma once

#include <platform/Export.h>

#include <QString>

class ChoiceList;
struct BoxLookup;

namespace lookup_checks {

ORX_EXPORT long refuseChoiceBox(const ChoiceList& choices, const BoxLookup& lookup);
ORX_EXPORT long refuseListBox(const ChoiceList& choices, const BoxLookup& lookup);
ORX_EXPORT long refuseChoiceProcedure(const ChoiceList& choices, const QString& procedure,
                                      const QString& value);

// Whether a text means itself wherever it stands in a fragment.
ORX_EXPORT bool fitsFragment(const QString& text);

}  // namespace lookup_checks
