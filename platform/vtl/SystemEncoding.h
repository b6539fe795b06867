#pragma once

#include <platform/Export.h>

// Name of the encoding that this system writes text files in: "UTF-8". Static storage.
ORX_EXPORT const char* ORXSystemEncodingName();
