#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>

#include <QDir>
#include <QFileInfo>

#include <dlfcn.h>

namespace {

// The folder of this library, by the address of one of its own functions; empty when it cannot be told.
QString libraryFolder() {
  Dl_info info{};
  if (dladdr(reinterpret_cast<const void*>(&QORXOrxHome), &info) == 0 || info.dli_fname == nullptr) {
    return QString();
  }
  return QFileInfo(QFileInfo(QORXFromLocal8Bit(info.dli_fname)).canonicalFilePath()).path();
}

QString homeWithoutEnvironment() {
  const QString folder = libraryFolder();
  // The second place serves library folders of one more level, such as lib/<architecture>.
  for (const char* place : {"/../share/orx", "/../../share/orx"}) {
    const QString installed = QORXPrettyUpFileName(folder + QLatin1String(place));
    if (!folder.isEmpty() && QFileInfo(installed).isDir()) {
      return installed;
    }
  }
  return QORXPrettyUpFileName(QStringLiteral(ORX_SOURCE_RESOURCES));
}

bool hasDriveLetter(const QString& name) {
  return name.size() >= 2 && name.at(1) == QLatin1Char(':') && name.at(0).unicode() < 0x80 &&
         name.at(0).isLetter() &&
         (name.size() == 2 || name.at(2) == QLatin1Char('/') || name.at(2) == QLatin1Char('\\'));
}

}  // namespace

QString QORXOrxHome() {
  const QByteArray home = qgetenv("ORX_HOME");
  if (!home.isEmpty()) {
    return QORXPrettyUpFileName(QORXFromLocal8Bit(home));
  }
  static const QString fallback = homeWithoutEnvironment();
  return fallback;
}

QString QORXPrettyUpFileName(const QString& fileName) {
  if (fileName.isEmpty()) {
    return fileName;
  }
  QString name = fileName;
  const bool rooted = name.startsWith(QLatin1Char('/'));
  if (!rooted && name.contains(QLatin1Char('\\')) && !QFileInfo::exists(name)) {
    name.replace(QLatin1Char('\\'), QLatin1Char('/'));
  }
  if (!name.startsWith(QLatin1Char('/')) && !hasDriveLetter(name)) {
    name.prepend(QDir::currentPath() + QLatin1Char('/'));
  }
  name = QDir::cleanPath(name);
  // A step above the root stays at the root.
  while (name.startsWith(QLatin1String("/../"))) {
    name.remove(0, 3);
  }
  return name == QLatin1String("/..") ? QStringLiteral("/") : name;
}
