#include <apps/orxt/console/DependencyFile.h>
#include <platform/qorxcore/Local8Bit.h>
#include <transform/files/AtomicFile.h>

namespace dependency_file {

namespace {

// A blank, and the backslashes before it, get a backslash; so do "#" and ":". A dollar sign is doubled.
QString escaped(const QString& name) {
  QString text;
  int backslashes = 0;
  for (const QChar unit : name) {
    if (unit == QLatin1Char(' '))
      text += QString(backslashes + 1, QLatin1Char('\\'));
    else if (unit == QLatin1Char('#') || unit == QLatin1Char(':'))
      text += QLatin1Char('\\');
    else if (unit == QLatin1Char('$'))
      text += QLatin1Char('$');
    backslashes = unit == QLatin1Char('\\') ? backslashes + 1 : 0;
    text += unit;
  }
  return text;
}

}  // namespace

QString text(const QString& made, const QStringList& from) {
  QString rule = escaped(made) + QLatin1Char(':');
  QString empty;
  for (const QString& name : from) {
    rule += QLatin1String(" \\\n  ") + escaped(name);
    empty += escaped(name) + QLatin1String(":\n");
  }
  return rule + QLatin1Char('\n') + empty;
}

bool write(const QString& fileName, const QString& made, const QStringList& from, QString& error) {
  AtomicFile file(fileName);
  const bool isWritten = file.open() && file.device().write(QORXToLocal8Bit(text(made, from))) >= 0;
  if (isWritten && file.commit())
    return true;
  error = file.errorString();
  return false;
}

}  // namespace dependency_file
