#include <platform/qorxcore/Local8Bit.h>
#include <transform/files/FolderListing.h>

#include <algorithm>
#include <cerrno>
#include <dirent.h>
#include <fcntl.h>
#include <memory>
#include <sys/stat.h>

namespace {

// The type of an entry with links followed; 0 for one that leads nowhere.
unsigned typeOf(DIR* folder, const dirent& entry) {
  if (entry.d_type == DT_REG) {
    return S_IFREG;
  }
  if (entry.d_type == DT_DIR) {
    return S_IFDIR;
  }
  struct stat status {};
  return ::fstatat(::dirfd(folder), entry.d_name, &status, 0) == 0 ? status.st_mode & S_IFMT : 0;
}

}  // namespace

FolderListing FolderListing::files(const QString& folder, const QString& suffix) {
  return list(folder, suffix, S_IFREG);
}

FolderListing FolderListing::folders(const QString& folder) {
  return list(folder, QString(), S_IFDIR);
}

FolderListing FolderListing::list(const QString& folder, const QString& suffix, unsigned wantedType) {
  FolderListing listing;
  const std::unique_ptr<DIR, int (*)(DIR*)> stream(::opendir(QORXToLocal8Bit(folder).constData()),
                                                   &::closedir);
  if (!stream) {
    listing.m_error = folder + QLatin1String(": ") + qt_error_string(errno);
    return listing;
  }
  for (;;) {
    errno = 0;
    const dirent* entry = ::readdir(stream.get());
    if (entry == nullptr) {
      break;
    }
    const QString name = QORXFromLocal8Bit(entry->d_name);
    if (name.startsWith(QLatin1Char('.')) || !name.endsWith(suffix)) {
      continue;
    }
    const unsigned type = typeOf(stream.get(), *entry);
    if (type == wantedType) {
      listing.m_names.append(name);
    } else if (type != S_IFREG && type != S_IFDIR) {
      listing.m_unusableNames.append(name);
    }
  }
  if (errno != 0) {
    listing.m_error = folder + QLatin1String(": ") + qt_error_string(errno);
    listing.m_names.clear();
    listing.m_unusableNames.clear();
    return listing;
  }
  std::sort(listing.m_names.begin(), listing.m_names.end());
  std::sort(listing.m_unusableNames.begin(), listing.m_unusableNames.end());
  return listing;
}
