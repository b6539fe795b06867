// The one setting of the process that says in which language texts are shown.
#pragma once

#include <platform/Export.h>

#include <QString>

// Two lower-case letters; "en" until a language is set. Taken from LC_ALL, LC_MESSAGES and LANG on first use.
ORX_EXPORT QString QORXLanguage();

// Anything but two letters (a locale such as "de_AT.UTF-8" counts by its first two) selects "en".
ORX_EXPORT void QORXSetLanguage(const QString& language);
