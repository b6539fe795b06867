#include <platform/orxutil/ORXLocalizedMessageDatabase.h>
#include <platform/qorxcore/OrxHome.h>
#include <transform/text/MessageStrings.h>

#include <QDir>

namespace {

const ORXLocalizedMessageDatabase& database() {
  static const ORXLocalizedMessageDatabase kDatabase;
  return kDatabase;
}

}  // namespace

QString TransformResStringIn(const QString& language, long number) {
  if (language.isEmpty())
    return TransformResString(number);
  QORXString message;
  database().getMessage(number, message, language);
  return message.toQString();
}

QString TransformResString(long number) {
  return TransformResString(number, QStringList());
}

QString TransformResString(long number, const QString& argument) {
  return TransformResString(number, QStringList(argument));
}

QString TransformResString(long number, const QStringList& arguments) {
  QORXString message;
  database().getMessage(number, message);
  const QString& text = message.toQString();
  if (text.isEmpty()) {
    return QString();
  }
  const QStringList& a = arguments;
  switch (a.size()) {
    case 1:
      // Qt complains of a text that has no place for it.
      return text.contains(QLatin1Char('%')) ? text.arg(a[0], 0, QLatin1Char(' ')) : text;
    case 2:
      return text.arg(a[0], a[1]);
    case 3:
      return text.arg(a[0], a[1], a[2]);
    case 4:
      return text.arg(a[0], a[1], a[2], a[3]);
    case 5:
      return text.arg(a[0], a[1], a[2], a[3], a[4]);
    default:
      return text;
  }
}

QStringList orx::messageLanguages() {
  QStringList languages;
  const QDir folder(QORXOrxHome() + QLatin1String("/messages"));
  for (const QString& file : folder.entryList({QStringLiteral("*.msg")}, QDir::Files, QDir::Name))
    languages.append(file.section(QLatin1Char('.'), 0, 0));
  return languages;
}
