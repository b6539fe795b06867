// The mapping-file output buffer, as callers without the string library see it.
#pragma once

#include <platform/Export.h>

class IORXString;

class ORX_EXPORT IMFBuffer {
 public:
  IMFBuffer() = default;

  // Adds one logical text, in the system's 8-bit encoding.
  virtual void add(const IORXString& text) = 0;
  // Writes the text at once, ahead of what was added and not yet flushed; no line end is added.
  virtual void addRaw(const IORXString& text) = 0;
  // Ends the statement made of everything added since the last flush.
  virtual void flush() = 0;
  virtual ~IMFBuffer();

  IMFBuffer& operator=(const IMFBuffer&) { return *this; }

  // A buffer on a file, truncated; the name is Latin-1. The caller owns it and gives it back to destroy(). A
  // file that cannot be opened is not reported: what is written to such a buffer is lost.
  static IMFBuffer* create(const char* fileName, bool isMangled);
  // Does not flush: pending lines are lost. Sets the pointer to null; a null pointer is fine.
  static void destroy(IMFBuffer*& buffer);

 protected:
  IMFBuffer(const IMFBuffer&) {}
};
