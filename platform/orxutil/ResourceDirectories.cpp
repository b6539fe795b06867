#include <platform/orxutil/ResourceDirectories.h>
#include <platform/qorxcore/Local8Bit.h>
#include <platform/qorxcore/OrxHome.h>

#include <QDir>
#include <QDirIterator>
#include <QFileInfo>
#include <QSet>

#include <algorithm>

namespace {

QStringList& addedFolders() {
  static QStringList folders;
  return folders;
}

bool isPlainWord(const QString& kind) {
  return !kind.isEmpty() && std::all_of(kind.cbegin(), kind.cend(), [](QChar character) {
    return character.unicode() < 0x80 && (character.isLetterOrNumber() || character == QLatin1Char('_'));
  });
}

// The user's data folder; a relative $XDG_DATA_HOME counts as unset.
QString userDataFolder() {
  const QString set = QORXFromLocal8Bit(qgetenv("XDG_DATA_HOME"));
  return set.startsWith(QLatin1Char('/')) ? set : QDir::homePath() + QLatin1String("/.local/share");
}

enum class SubFolders { Included, LeftOut };

// The places of one kind in order, whether they exist or not.
QStringList candidates(const QString& kind, SubFolders subFoldersOfHome) {
  const QString folderName = kind + QLatin1Char('s');
  const QString homeFolder = QORXOrxHome() + QLatin1Char('/') + folderName;
  QStringList places{homeFolder};
  const QStringList subFolders =
      subFoldersOfHome == SubFolders::LeftOut
          ? QStringList()
          : QDir(homeFolder).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name);
  for (const QString& subFolder : subFolders) {
    places.append(homeFolder + QLatin1Char('/') + subFolder);
  }
  places.append(userDataFolder() + QLatin1String("/orx/") + folderName);
  const QByteArray variable = "ORX_" + kind.toLatin1().toUpper() + "_PATH";
  places += QORXFromLocal8Bit(qgetenv(variable.constData())).split(QLatin1Char(':'), Qt::SkipEmptyParts);
  places += addedFolders();
  return places;
}

enum class FolderState { Missing, Unreadable, WithoutFiles, WithFiles };

FolderState stateOf(const QString& folder) {
  const QFileInfo info(folder);
  return !info.isDir()                                 ? FolderState::Missing
         : !(info.isReadable() && info.isExecutable()) ? FolderState::Unreadable
         : QDirIterator(folder, QDir::Files).hasNext() ? FolderState::WithFiles
                                                       : FolderState::WithoutFiles;
}

QStringList foldersInState(FolderState state, const QString& kind) {
  QStringList folders;
  if (!isPlainWord(kind)) {
    return folders;
  }
  QSet<QString> seen;
  const QStringList places = candidates(kind, SubFolders::Included);
  for (const QString& place : places) {
    if (stateOf(place) != state) {
      continue;
    }
    const QString canonical = QFileInfo(place).canonicalFilePath();
    if (!seen.contains(canonical)) {
      seen.insert(canonical);
      folders.append(QORXPrettyUpFileName(place));
    }
  }
  return folders;
}

}  // namespace

QStringList ORX_resourceDirectories(const QString& kind) {
  return foldersInState(FolderState::WithFiles, kind);
}

QStringList ORX_unreadableResourceDirectories(const QString& kind) {
  return foldersInState(FolderState::Unreadable, kind);
}

QStringList ORX_resourcePlaces(const QString& kind) {
  QStringList places;
  if (isPlainWord(kind)) {
    for (const QString& place : candidates(kind, SubFolders::LeftOut)) {
      places.append(QORXPrettyUpFileName(place));
    }
    places.removeDuplicates();
  }
  return places;
}

void ORX_addResourceDirectory(const QString& folder) {
  const QString name = QORXPrettyUpFileName(folder);
  if (!name.isEmpty() && !addedFolders().contains(name)) {
    addedFolders().append(name);
  }
}
