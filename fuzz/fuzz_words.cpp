// The word encoding: any text there and back, and any text at all through the decoder.
#include <platform/qorxcore/WordEncoding.h>
#include <transform/text/TextHelpers.h>

#include <fuzz/FuzzTarget.h>

namespace {

void tryText(const QString& text) {
  const QString encoded = QORXWwjdEncode(text);
  require(QORXWwjdDecode(encoded) == text, "decoding gives back what was encoded");
  require(QORXWwjdIsWellFormed(encoded), "what was encoded is well formed");
  for (const QChar c : encoded) {
    require(!c.isSpace() && !QStringLiteral("\"{}[]$\\;,%()").contains(c),
            "the encoded text is one bare token");
  }
  const QString decoded = QORXWwjdDecode(text);
  require(decoded.size() <= text.size(), "decoding does not make a text longer");
  require(QORXWwjdDecode(QORXWwjdEncode(decoded)) == decoded, "a decoded text can be encoded");
  QORXWwjdIsWellFormed(text);
  encodeUserString(decodeUserString(text));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  tryText(textFromUtf8(data, size));
  tryText(textFromUtf16(data, size));
  return 0;
}
