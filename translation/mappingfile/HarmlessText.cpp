#include <translation/mappingfile/HarmlessText.h>

#include <QLatin1String>

#include <algorithm>
#include <array>
#include <cstring>

namespace {

// Any other is quoted, expanded, run or refused somewhere.
bool isHarmlessCharacter(QChar c) {
  const ushort code = c.unicode();
  if (code >= 0x80)
    return code > 0xa0 && !c.isSpace() && !c.isSurrogate() && code != QChar::ReplacementCharacter;
  return c.isLetterOrNumber() || (code != 0 && std::strchr(" _-.,:;<>/=+*%&!?'^~", code));
}

}  // namespace

bool isHarmlessText(const QString& text) {
  static const std::array<QLatin1String, 4> kMeaning = {QLatin1String("INPUT"), QLatin1String("OUTPUT"),
                                                        QLatin1String("FACTORY_"), QLatin1String("ORX_")};
  return std::all_of(text.begin(), text.end(), isHarmlessCharacter) &&
         std::none_of(kMeaning.begin(), kMeaning.end(),
                      [&](QLatin1String word) { return text.contains(word); });
}
