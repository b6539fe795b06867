// Passes text on to another device with a prefix in front of each line and with the wanted line ends. For
// 8-bit encodings that contain ASCII and for UTF-16 in both byte orders.
#pragma once

#include <QByteArray>
#include <QIODevice>

class CommentLineDevice : public QIODevice {
 public:
  // `prefix` and `lineEnd` are in the encoding of the text, as is "\n" in `lineFeed`, which ends its lines.
  // The target belongs to the caller and is open for writing.
  CommentLineDevice(QIODevice& target, const QByteArray& prefix, const QByteArray& lineFeed,
                    const QByteArray& lineEnd);

  bool isSequential() const override { return true; }

 protected:
  qint64 readData(char* data, qint64 size) override;
  qint64 writeData(const char* data, qint64 size) override;

 private:
  bool pass(const char* data, qint64 size);
  qint64 lineFeedIn(const char* data, qint64 from, qint64 size) const;

  QIODevice& m_target;
  QByteArray m_prefix;
  QByteArray m_lineFeed;
  QByteArray m_lineEnd;
  bool m_atLineStart = true;
};
