// What every fuzz target is made of.
#pragma once

#include <QString>

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>

// Called with each input; ends the process when it finds a fault.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

// A property that holds for every input.
inline void require(bool holds, const char* property) {
  if (!holds) {
    std::fprintf(stderr, "fuzz: it does not hold that %s\n", property);
    std::abort();
  }
}

// The input as text in two readings: as UTF-8, and as UTF-16 code units, lone surrogates included.
inline QString textFromUtf8(const std::uint8_t* data, std::size_t size) {
  return QString::fromUtf8(reinterpret_cast<const char*>(data), static_cast<int>(size));
}
inline QString textFromUtf16(const std::uint8_t* data, std::size_t size) {
  QString text;
  text.reserve(static_cast<int>(size / 2));
  for (std::size_t i = 0; i + 1 < size; i += 2) {
    text.append(QChar(static_cast<ushort>(data[i] | (data[i + 1] << 8))));
  }
  return text;
}
