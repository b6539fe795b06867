// What a document may hold at most; the reader refuses more, and the writer writes no more.
#pragma once

#include <QtGlobal>

namespace limits {

inline constexpr int kNesting = 256;
// UTF-16 units of one value as it stands in the document, escapes included.
inline constexpr qint64 kValueLength = 16 * 1024 * 1024;
// The parser compares each attribute of an element with all others.
inline constexpr int kAttributesPerElement = 4096;

}  // namespace limits
