// Enciphered documents. The enciphered form is not known here: without a registered routine nothing is
// recognised as enciphered.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <functional>

// Answers true when `fileName` is enciphered and a plain copy was written to `plainCopy`.
ORX_EXPORT bool ORW_decryptWorkspace(const QString& fileName, const QString& plainCopy);

using ORWDecipherRoutine = std::function<bool(const QString& fileName, const QString& plainCopy)>;

// Registers a host's own routine for the rest of the process; an empty one restores the default.
ORX_EXPORT void ORW_setDecipherRoutine(ORWDecipherRoutine routine);
ORX_EXPORT bool ORW_hasDecipherRoutine();
