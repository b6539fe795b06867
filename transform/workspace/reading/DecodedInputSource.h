// Feeds the XML parser with UTF-16 that is decoded here and has passed the guard, whatever encoding the bytes
// of the document have: so the guard sees what the parser sees.
#pragma once

#include <transform/workspace/reading/DocumentGuard.h>

#include <QIODevice>
#include <QTextCodec>
#include <xercesc/sax/InputSource.hpp>
#include <xercesc/util/BinInputStream.hpp>

// Device, codec and guard belong to the caller and outlive the source. The device is open and stands at the
// first byte of the document; it is read once.
class DecodedInputSource : public XERCES_CPP_NAMESPACE::InputSource {
 public:
  DecodedInputSource(QIODevice& device, const QTextCodec& codec, DocumentGuard& guard);

  XERCES_CPP_NAMESPACE::BinInputStream* makeStream() const override;

 private:
  QIODevice& m_device;
  const QTextCodec& m_codec;
  DocumentGuard& m_guard;
};

// The encoding in which a document is read: what its first bytes and its declaration say.
//
// `declared` is the name that the parser captured from the declaration (or detected), empty when there is
// none; then a byte order mark decides, and without one the system's encoding. Answers null for a name that
// is not known, or that the bytes contradict. `markLength` receives the length of the byte order mark.
QTextCodec* documentCodec(const QByteArray& firstBytes, const QByteArray& declared, int& markLength);

// 'L' or 'B' for bytes of UTF-16 in that byte order, 0 for all else.
char utf16ByteOrder(const QByteArray& firstBytes);

// Whether it can hold every character; only such a codec may produce U+FFFD from bytes that really mean it.
bool isUnicodeCodec(const QTextCodec& codec);
