// Converts single values between the encodings that the mapping file knows.
#pragma once

#include <transform/core/ValueEncoding.h>

#include <QString>

namespace value_conversion {

// `quote` quotes the result where it needs quotes; a result in the word encoding never does. References to
// macros and "<Unused>" are left as they stand.
QString convert(const QString& value, ValueEncoding from, ValueEncoding to, bool quote);

}  // namespace value_conversion
