// A buffer of the mapping file that keeps what is written.
#pragma once

#include <transform/text/MFBuffer.h>

#include <QBuffer>
#include <QRegularExpression>
#include <QStringList>

class TextBuffer : public MFBuffer {
 public:
  TextBuffer() {
    m_device.open(QIODevice::WriteOnly);
    setDevice(&m_device);
  }
  ~TextBuffer() override { setDevice(nullptr); }
  void write(const QByteArray& bytes) override { m_device.write(bytes); }
  QString text() const { return QString::fromUtf8(m_device.data()); }
  // Physical lines, without the columns of continued ones and the empty lines behind statements.
  QStringList lines() const { return text().split(QRegularExpression(" *\\\\?\n"), Qt::SkipEmptyParts); }

 private:
  QBuffer m_device;
};
