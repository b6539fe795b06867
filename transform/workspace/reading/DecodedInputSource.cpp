#include <platform/vtl/SystemEncoding.h>
#include <transform/workspace/reading/DecodedInputSource.h>

#include <xercesc/util/XMLUni.hpp>
#include <xercesc/util/XMLUniDefs.hpp>

#include <cstring>

namespace {

using XERCES_CPP_NAMESPACE::BinInputStream;
using XERCES_CPP_NAMESPACE::XMLUni;

constexpr int kChunk = 64 * 1024;
constexpr ushort kByteOrderMark = 0xfeff;

class DecodedStream : public BinInputStream {
 public:
  DecodedStream(QIODevice& device, const QTextCodec& codec, DocumentGuard& guard)
      : m_device(device),
        m_codec(codec),
        m_guard(guard),
        m_state(QTextCodec::IgnoreHeader | QTextCodec::ConvertInvalidToNull),
        m_bytes(kChunk, Qt::Uninitialized) {
    if (!isUnicodeCodec(codec))
      m_guard.setReplacementUnit(QChar::ReplacementCharacter);
  }

  XMLFilePos curPos() const override { return m_position; }
  const XMLCh* getContentType() const override { return nullptr; }

  XMLSize_t readBytes(XMLByte* const target, const XMLSize_t size) override {
    if (m_taken == m_allowed && !refill())
      return 0;
    const auto units = std::min(static_cast<XMLSize_t>(m_allowed - m_taken), size / sizeof(ushort));
    std::memcpy(target, m_units.utf16() + m_taken, units * sizeof(ushort));
    m_taken += static_cast<int>(units);
    m_position += units * sizeof(ushort);
    return units * sizeof(ushort);
  }

 private:
  bool refill() {
    m_taken = 0;
    m_allowed = 0;
    while (m_allowed == 0 && !m_ended) {
      const qint64 count = m_device.read(m_bytes.data(), kChunk);
      if (count <= 0) {
        m_ended = true;
        // A character that the end of the file cuts off.
        m_units = m_state.remainingChars > 0 ? QString(QChar(0)) : QString();
      } else {
        m_units = m_codec.toUnicode(m_bytes.constData(), static_cast<int>(count), &m_state);
      }
      if (m_first && m_units.startsWith(QChar(kByteOrderMark)))
        m_units.remove(0, 1);
      m_first = m_first && m_units.isEmpty();
      m_allowed = m_guard.check(m_units.utf16(), m_units.size());
      m_ended = m_ended || m_guard.hasRefused();
    }
    return m_allowed > 0;
  }

  QIODevice& m_device;
  const QTextCodec& m_codec;
  DocumentGuard& m_guard;
  QTextCodec::ConverterState m_state;
  QByteArray m_bytes;
  QString m_units;
  int m_taken = 0;
  int m_allowed = 0;
  XMLFilePos m_position = 0;
  bool m_first = true;
  bool m_ended = false;
};

}  // namespace

bool isUnicodeCodec(const QTextCodec& codec) {
  const QByteArray name = codec.name().toUpper();
  return name.startsWith("UTF-") || name.startsWith("GB18030") || name.startsWith("ISO-10646");
}

DecodedInputSource::DecodedInputSource(QIODevice& device, const QTextCodec& codec, DocumentGuard& guard)
    : m_device(device), m_codec(codec), m_guard(guard) {
  static_assert(sizeof(XMLCh) == sizeof(ushort));
  setEncoding(Q_BYTE_ORDER == Q_LITTLE_ENDIAN ? XMLUni::fgUTF16LEncodingString
                                              : XMLUni::fgUTF16BEncodingString);
}

BinInputStream* DecodedInputSource::makeStream() const {
  return new DecodedStream(m_device, m_codec, m_guard);
}

char utf16ByteOrder(const QByteArray& bytes) {
  if (bytes.size() < 4)
    return 0;
  const auto at = [&](int i) { return static_cast<unsigned char>(bytes[i]); };
  if (at(0) == 0xff && at(1) == 0xfe && (at(2) != 0 || at(3) != 0))
    return 'L';
  if (at(0) == 0xfe && at(1) == 0xff)
    return 'B';
  // Without a mark: "<" or "#" followed by another ASCII character.
  const auto isAscii = [&](int i) { return at(i) != 0 && at(i) < 0x80; };
  if (isAscii(0) && at(1) == 0 && isAscii(2) && at(3) == 0)
    return 'L';
  if (at(0) == 0 && isAscii(1) && at(2) == 0 && isAscii(3))
    return 'B';
  return 0;
}

QTextCodec* documentCodec(const QByteArray& bytes, const QByteArray& declared, int& markLength) {
  markLength = 0;
  const QByteArray name = declared.toUpper();
  const bool saysUtf16 = name.startsWith("UTF-16") || name.startsWith("UTF16") || name == "ISO-10646-UCS-2";
  if (const char order = utf16ByteOrder(bytes)) {
    if (!name.isEmpty() && !saysUtf16)
      return nullptr;
    const bool marked = static_cast<unsigned char>(bytes[0]) >= 0xfe;
    markLength = marked ? 2 : 0;
    return QTextCodec::codecForName(order == 'L' ? "UTF-16LE" : "UTF-16BE");
  }
  if (saysUtf16)
    return nullptr;
  if (bytes.startsWith("\xef\xbb\xbf")) {
    markLength = 3;
    if (name.isEmpty())
      return QTextCodec::codecForName("UTF-8");
  }
  return QTextCodec::codecForName(name.isEmpty() ? QByteArray(ORXSystemEncodingName()) : declared);
}
