#include <translation/generation/MFDeviceBuffer.h>

#include <QIODevice>

MFDeviceBuffer::MFDeviceBuffer(QIODevice& device) : m_device(device) {
  setDevice(&device);
}

MFDeviceBuffer::~MFDeviceBuffer() {
  setDevice(nullptr);
}

void MFDeviceBuffer::write(const QByteArray& bytes) {
  if (m_device.write(bytes) != bytes.size())
    m_hasFailed = true;
}
