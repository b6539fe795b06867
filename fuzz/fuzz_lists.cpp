// Packed lists: splitting is the inverse of packing for every list, nested too.
#include <platform/orxparameter/ConfigToken.h>
#include <platform/qorxcore/Lists.h>

#include <QStringList>

#include <fuzz/FuzzTarget.h>

namespace {

void tryText(const QString& text) {
  for (const QChar separator : {QLatin1Char(','), QLatin1Char('%'), QLatin1Char(' '), QLatin1Char('"')}) {
    const QStringList split = QORXSdfStringToList(text, separator);
    const QString packed = QORXListToSdfString(split, separator);
    require(QORXSdfStringToList(packed, separator) == split, "splitting is the inverse of packing");

    // The input's lines as elements: a list that no splitter has made, then packed as one element of another.
    const QStringList lines = text.split(QLatin1Char('\n'));
    const QString inner = QORXListToSdfString(lines, separator);
    const QStringList nested{QORXListToSdfString(split, separator), inner, text};
    require(QORXSdfStringToList(inner, separator) == lines, "lines can be packed");
    require(QORXSdfStringToList(QORXListToSdfString(nested, separator), separator) == nested,
            "lists can be nested");

    for (const QString& element : QORXStringToList(text, separator)) {
      require(!element.isEmpty(), "the lenient splitter drops empty pieces");
    }
  }
  // A configuration is one line: breaks in it are written as words.
  const QString oneLine =
      QString(text).replace(QLatin1Char('\n'), QLatin1Char(' ')).remove(QLatin1Char('\r'));
  for (const QString& piece : ORX_splitConfig(oneLine, QLatin1Char('%'))) {
    require(ORX_splitConfig(ORX_quoteConfigPiece(piece), QLatin1Char('%')) == QStringList{piece},
            "a piece of a configuration can be written and read");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  tryText(textFromUtf8(data, size));
  tryText(textFromUtf16(data, size));
  return 0;
}
