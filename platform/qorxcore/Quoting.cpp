#include <platform/qorxcore/Quoting.h>

#include <algorithm>

QString QORXQuotifyString(const QString& text, const QString& specials) {
  const bool special = std::any_of(text.cbegin(), text.cend(),
                                   [&specials](QChar character) { return specials.contains(character); });
  if (!text.isEmpty() && !special) {
    return text;
  }
  QString quoted;
  quoted.reserve(text.size() + 2);
  quoted += QLatin1Char('"');
  quoted += text;
  quoted += QLatin1Char('"');
  return quoted;
}
