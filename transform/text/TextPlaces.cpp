#include <transform/text/MacroText.h>
#include <transform/text/MappingFileKeywords.h>
#include <transform/text/MappingFileWords.h>
#include <transform/text/MessageNumbers.h>
#include <transform/text/TclText.h>
#include <transform/text/TextPlaces.h>

#include <algorithm>

namespace messages = orx::messages;

namespace {

const QLatin1Char kQuote('"');
const QLatin1Char kBackslash('\\');

bool isBlank(QChar c) {
  return c == QLatin1Char(' ') || c == QLatin1Char('\t');
}

bool holdsBlank(const QString& text) {
  return std::any_of(text.begin(), text.end(), isBlank);
}

bool isKeyword(const QString& word, const QSet<QString>& keys) {
  return word == kInputKeyword || word == kOutputKeyword || keys.contains(word);
}

// One word that means itself without quotes.
bool isBareWord(const QString& text) {
  MappingFileWords words(text);
  MappingFileWord word;
  return !text.startsWith(kQuote) && words.next(word) && word.kind == MappingFileWord::Kind::Bare &&
         word.text.size() == text.size();
}

// Whether calls inside the words, too, come to an end.
bool closesCalls(const QString& text) {
  for (int at = text.indexOf(QLatin1Char('@')); at >= 0; at = text.indexOf(QLatin1Char('@'), at + 1)) {
    const QStringRef name = mappingFileCallName(text, at, text.size());
    if (name.isEmpty())
      continue;
    const int end = endOfMappingFileCall(text, at + 1 + name.size(), text.size());
    if (end < 0)
      return false;
    at = end - 1;
  }
  return true;
}

long refuseOneLine(TextPlace place, const QString& text) {
  switch (place) {
    case TextPlace::Word:
    case TextPlace::Name:
    case TextPlace::ParallelSetting:
      return canBeWord(text) ? 0 : messages::kNoWord;
    case TextPlace::Port:
      return isBareWord(text) && text != kFeatureTypeKeyword ? 0 : messages::kNoPort;
    case TextPlace::LoopSetting:
      return text.isEmpty() || (!holdsBlank(text) && !text.startsWith(kQuote)) ? 0 : messages::kNoLoopSetting;
    case TextPlace::QuotedName:
      return text.contains(kQuote) ? messages::kNoQuotedName : 0;
    case TextPlace::MacroName:
      return isMacroName(text) ? 0 : messages::kNameInMacro;
    case TextPlace::PrintedName:
      return holdsBlank(text) ? messages::kNoPrintedName : 0;
    case TextPlace::MacroValue:
      return text.endsWith(kBackslash) ? messages::kEndsInBackslash : 0;
    case TextPlace::TclBraces:
      return tcl_text::meansItselfInBraces(withoutReferences(text)) ? 0 : messages::kValueInScript;
    case TextPlace::TclQuotes:
      return tcl_text::meansItselfInQuotes(withoutReferences(text)) ? 0 : messages::kValueInScript;
    case TextPlace::HeaderField:
      return text.contains(QLatin1Char(',')) || text != text.trimmed() ? messages::kNoHeaderField : 0;
  }
  return 0;
}

}  // namespace

long TextPlaces::refuse(TextPlace place, const QString& text) {
  if (!isOneLine(text))
    return messages::kBreaksLine;
  if (place == TextPlace::Name && beginsMacroReference(text))
    return messages::kReferenceInName;
  const bool isScript = place == TextPlace::TclBraces || place == TextPlace::TclQuotes;
  if (!isScript && !closesDeferredReferences(text))
    return messages::kValueUnclosed;
  return refuseOneLine(place, text);
}

long TextPlaces::refusePlainValue(const QString& text, const QSet<QString>& keys, Calls calls) {
  if (!isOneLine(text))
    return messages::kBreaksLine;
  if (!closesDeferredReferences(text))
    return messages::kValueUnclosed;
  MappingFileWords words(text);
  for (MappingFileWord word; words.next(word);) {
    if (word.kind == MappingFileWord::Kind::Call && calls == Calls::Refused)
      return messages::kCallInValue;
    if (!word.isClosed || word.isGlued)
      return messages::kOpenInValue;
    if (word.kind == MappingFileWord::Kind::Bare && isKeyword(word.text.toString(), keys))
      return messages::kKeywordInValue;
  }
  return closesCalls(text) ? 0 : messages::kOpenInValue;
}

bool TextPlaces::holdsCall(const QString& text) {
  MappingFileWords words(text);
  for (MappingFileWord word; words.next(word);) {
    if (word.kind == MappingFileWord::Kind::Call)
      return true;
  }
  return false;
}

long TextPlaces::refuseEncodedValue(const QString& text) {
  if (!isOneLine(text))
    return messages::kBreaksLine;
  if (!closesDeferredReferences(text))
    return messages::kValueUnclosed;
  // A quote inside would be one of the list that the word may stand in.
  const bool isEncoded = isBareWord(text) && closesCalls(text) && !withoutReferences(text).contains(kQuote);
  return text.isEmpty() || isEncoded ? 0 : messages::kNotEncoded;
}

QString TextPlaces::withoutKeyword(const QString& encoded, const QSet<QString>& keys) {
  if (encoded.isEmpty() || !isKey(encoded.midRef(0)) || !isKeyword(encoded, keys))
    return encoded;
  return QStringLiteral("<u%1>").arg(encoded.at(0).unicode(), 4, 16, QLatin1Char('0')) + encoded.midRef(1);
}

bool TextPlaces::isOneLine(const QString& text) {
  for (int i = 0; i < text.size(); ++i) {
    const QChar c = text.at(i);
    if (c == QLatin1Char('\n') || c == QLatin1Char('\r') || c.isNull())
      return false;
    if (c.isSurrogate()) {
      if (!c.isHighSurrogate() || i + 1 == text.size() || !text.at(i + 1).isLowSurrogate())
        return false;
      ++i;
    }
  }
  return true;
}

bool TextPlaces::isKey(const QStringRef& word) {
  return !word.isEmpty() && std::all_of(word.begin(), word.end(), [](QChar c) {
    return (c >= QLatin1Char('A') && c <= QLatin1Char('Z')) ||
           (c >= QLatin1Char('0') && c <= QLatin1Char('9')) || c == QLatin1Char('_');
  });
}
