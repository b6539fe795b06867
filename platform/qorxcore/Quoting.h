// Quoting of one value.
#pragma once

#include <platform/Export.h>

#include <QString>

// Wraps a text that is empty or holds any of the characters of `specials` in double quotes; nothing inside
// the text is changed.
ORX_EXPORT QString QORXQuotifyString(const QString& text, const QString& specials);
