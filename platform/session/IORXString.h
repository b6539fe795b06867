// A text of 8-bit characters, for callers without the string library. Encoding: the system's 8-bit encoding.
#pragma once

#include <platform/Export.h>

#include <cstddef>

class ORX_EXPORT IORXString {
 public:
  virtual ~IORXString();

  // Null-terminated; valid until the text is changed or destroyed. A text may hold null characters: length()
  // tells its true length.
  virtual const char* data() const = 0;
  virtual std::size_t length() const = 0;
  virtual void set(const char* bytes, std::size_t length) = 0;
};
