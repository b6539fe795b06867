// Takes statements that nobody wants.
#pragma once

#include <transform/text/MFBuffer.h>

class NullBuffer : public MFBuffer {
 public:
  void write(const QByteArray&) override {}
};
