#include <platform/qorxcore/Language.h>
#include <platform/qorxcore/Local8Bit.h>

#include <QtGlobal>

namespace {

bool isAsciiLetter(QChar character) {
  const ushort lower = character.unicode() | 0x20;
  return lower >= 'a' && lower <= 'z';
}

QString languageOfLocale(const QString& locale) {
  const bool twoLetters = locale.size() >= 2 && isAsciiLetter(locale.at(0)) && isAsciiLetter(locale.at(1));
  // "POSIX" and three-letter languages must not be taken by their first two letters.
  const bool ends =
      locale.size() == 2 || (locale.size() > 2 && QStringLiteral("_-.@").contains(locale.at(2)));
  return twoLetters && ends ? locale.left(2).toLower() : QStringLiteral("en");
}

QString languageOfEnvironment() {
  for (const char* variable : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
    const QByteArray locale = qgetenv(variable);
    if (!locale.isEmpty()) {
      return languageOfLocale(QORXFromLocal8Bit(locale));
    }
  }
  return QStringLiteral("en");
}

QString& currentLanguage() {
  static QString language = languageOfEnvironment();
  return language;
}

}  // namespace

QString QORXLanguage() {
  return currentLanguage();
}

void QORXSetLanguage(const QString& language) {
  currentLanguage() = languageOfLocale(language);
}
