#include <transform/text/MFFileBuffer.h>

MFFileBuffer::MFFileBuffer(const QString& fileName) : m_file(fileName) {
  m_file.open(QIODevice::WriteOnly | QIODevice::Truncate);
  setDevice(&m_file);
}

MFFileBuffer::~MFFileBuffer() {
  setDevice(nullptr);
  m_file.close();
}

void MFFileBuffer::write(const QByteArray& bytes) {
  if (m_file.isOpen()) {
    m_file.write(bytes);
  }
}
