#include <platform/qorxcore/Local8Bit.h>
#include <transform/core/definition/SystemQuestions.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>
#include <QStringList>

namespace {

constexpr qint64 kLargestIndex = 1024 * 1024;

QString answer(bool yes) {
  return QString::number(yes ? 1 : 0);
}

bool indexOffers(const QString& indexFile, const QString& package) {
  QFile file(indexFile);
  if (!file.open(QIODevice::ReadOnly)) {
    return false;
  }
  const QStringList words =
      QString::fromUtf8(file.read(kLargestIndex)).simplified().split(QLatin1Char(' '), Qt::SkipEmptyParts);
  for (int i = 0; i + 2 < words.size(); ++i) {
    if (words[i + 1] == QLatin1String("ifneeded") && words[i].endsWith(QLatin1String("package")) &&
        words[i + 2] == package) {
      return true;
    }
  }
  return false;
}

// A folder's own index, and those of the folders in it.
bool folderOffers(const QString& folder, const QString& package) {
  const QLatin1String indexName("/pkgIndex.tcl");
  if (indexOffers(folder + indexName, package)) {
    return true;
  }
  const QStringList inner = QDir(folder).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
  for (const QString& name : inner) {
    if (indexOffers(folder + QLatin1Char('/') + name + indexName, package)) {
      return true;
    }
  }
  return false;
}

}  // namespace

QString askFileExists(const QString& path) {
  return answer(!path.isEmpty() && QFileInfo::exists(path));
}

QString askEnvironment(const QString& name) {
  const QByteArray value = qgetenv(QORXToLocal8Bit(name).constData());
  return QORXFromLocal8Bit(value);
}

QString askProgramInPath(const QString& program) {
  const bool isBareName = !program.isEmpty() && !program.contains(QLatin1Char('/'));
  return answer(isBareName && !QStandardPaths::findExecutable(program).isEmpty());
}

QString tclLibraryFolder() {
  return askEnvironment(QStringLiteral("TCL_LIBRARY"));
}

QString askTclPackage(const QString& name) {
  if (name == QLatin1String("Tcl")) {
    return answer(true);
  }
  QStringList folders;
  const QString library = tclLibraryFolder();
  if (!library.isEmpty()) {
    // Packages stand in the library's folder and beside it.
    folders << library << QFileInfo(library).path();
  }
  folders << QStringLiteral("/usr/share/tcltk") << QStringLiteral("/usr/lib/tcltk");
  for (const QString& folder : std::as_const(folders)) {
    if (folderOffers(folder, name)) {
      return answer(true);
    }
  }
  return answer(false);
}
