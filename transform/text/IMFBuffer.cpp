#include <transform/text/IMFBuffer.h>
#include <transform/text/MFFileBuffer.h>

IMFBuffer::~IMFBuffer() = default;

IMFBuffer* IMFBuffer::create(const char* fileName, bool isMangled) {
  auto* buffer = new MFFileBuffer(QString::fromLatin1(fileName));
  buffer->setIsMangled(isMangled);
  return buffer;
}

void IMFBuffer::destroy(IMFBuffer*& buffer) {
  delete buffer;
  buffer = nullptr;
}
