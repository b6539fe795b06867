// A mapping-file buffer that writes into a file of its own.
#pragma once

#include <transform/text/MFBuffer.h>

#include <QFile>

class ORX_EXPORT MFFileBuffer : public MFBuffer {
 public:
  // Opens the file for writing and truncates it; a failure to open is not reported.
  explicit MFFileBuffer(const QString& fileName);
  // Closes the file without flushing: lines still pending are lost.
  ~MFFileBuffer() override;

  QFile& file() { return m_file; }
  void write(const QByteArray& bytes) override;

 private:
  QFile m_file;
};
