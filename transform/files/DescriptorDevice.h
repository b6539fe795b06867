// Buffered writing to an open file descriptor of the system; no error between first write and close gets
// lost.
#pragma once

#include <platform/Export.h>

#include <QByteArray>
#include <QIODevice>

class ORX_EXPORT DescriptorDevice : public QIODevice {
 public:
  DescriptorDevice() = default;
  ~DescriptorDevice() override;

  // Takes the descriptor over: it is closed with the device. The device must not be open.
  void openDescriptor(int descriptor);

  // Hands what is buffered to the system. False after any error since the device was opened.
  bool flush();
  void close() override;
  bool isSequential() const override { return true; }

  // The system's number of the first error since the device was opened, 0 for none. It survives close().
  int firstError() const { return m_firstError; }

 protected:
  qint64 readData(char* data, qint64 maxSize) override;
  // After an error nothing more is written: what follows a gap is of no use.
  qint64 writeData(const char* data, qint64 size) override;

 private:
  bool writeOut(const char* data, qint64 size);
  void fail(int error);

  QByteArray m_buffer;
  int m_descriptor = -1;
  int m_firstError = 0;
};
