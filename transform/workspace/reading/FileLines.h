// The lines of a text file as raw bytes, in bounded memory, for 8-bit encodings that contain ASCII and for
// UTF-16 in both byte orders.
#pragma once

#include <QByteArray>
#include <QIODevice>

class FileLines {
 public:
  // The device is open, belongs to the caller, and is read from where it stands.
  explicit FileLines(QIODevice& device);

  // Moves to the next line, or to the next piece of a line that is longer than the buffer; false at the end.
  bool next();

  // The piece, its line end included. Valid until next().
  const char* data() const { return m_buffer.constData() + m_begin; }
  int size() const { return m_end - m_begin; }
  bool startsLine() const { return m_startsLine; }
  bool endsLine() const { return m_endsLine; }
  // Of the line the piece belongs to, from 1.
  int lineNumber() const { return m_line; }
  // Byte position of the piece in the device.
  qint64 position() const { return m_position; }
  // Whether the device failed while it was read.
  bool hasFailed() const { return m_failed; }

  // Bytes of one code unit, and its value at an index counted in units.
  int unitSize() const { return m_order ? 2 : 1; }
  int unitCount() const { return size() / unitSize(); }
  ushort unit(int index) const;
  // The encoded form of an ASCII character.
  QByteArray encoded(char ascii) const;
  // The byte order mark in front of the first line (no part of it); empty when there is none.
  const QByteArray& byteOrderMark() const { return m_mark; }
  // 'L' or 'B' for UTF-16, else 0.
  char byteOrder() const { return m_order; }

  // Whether the line begins with the ASCII text.
  bool startsWith(const char* ascii) const;
  // Number of units that the pattern "^ *#! *" and then `marker` covers; with an empty marker at least one
  // blank must follow "#!". 0: no match.
  int matchComment(const char* marker) const;

 private:
  bool fill();

  QIODevice& m_device;
  QByteArray m_buffer;
  QByteArray m_mark;
  char m_order = 0;
  int m_begin = 0;
  int m_end = 0;
  int m_filled = 0;
  int m_line = 0;
  qint64 m_position = 0;
  bool m_startsLine = false;
  bool m_endsLine = true;
  bool m_started = false;
  bool m_atEnd = false;
  bool m_failed = false;
};
