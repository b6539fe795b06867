// A growing array of 8-bit texts, for callers without the string library.
#pragma once

#include <platform/Export.h>

#include <cstddef>

class IORXString;

class ORX_EXPORT IORXStringArray {
 public:
  virtual ~IORXStringArray();

  virtual std::size_t entries() const = 0;
  // Owned by the array; An `index` that is not below entries() gives an empty text.
  virtual const IORXString& elementAt(std::size_t index) const = 0;
  virtual void append(const char* bytes, std::size_t length) = 0;
  virtual void clear() = 0;
};
