// A mapping-file buffer on any device.
#pragma once

#include <transform/text/MFBuffer.h>

class QIODevice;

class MFDeviceBuffer : public MFBuffer {
 public:
  // The device is open for writing, not owned, and outlives the buffer.
  explicit MFDeviceBuffer(QIODevice& device);
  ~MFDeviceBuffer() override;

  void write(const QByteArray& bytes) override;
  // Whether the device refused anything that write() gave it.
  bool hasFailed() const { return m_hasFailed; }

 private:
  QIODevice& m_device;
  bool m_hasFailed = false;
};
