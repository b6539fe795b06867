// Keeps what is written.
#pragma once

#include <transform/text/MFBuffer.h>

#include <QBuffer>

class TextBuffer : public MFBuffer {
 public:
  TextBuffer() {
    m_device.open(QIODevice::WriteOnly);
    setDevice(&m_device);
  }
  ~TextBuffer() override { setDevice(nullptr); }
  void write(const QByteArray& bytes) override { m_device.write(bytes); }
  QString text() const { return QString::fromUtf8(m_device.data()); }

 private:
  QBuffer m_device;
};
