#include <transform/files/output/OutputPlace.h>

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <limits.h>
#include <memory>
#include <unistd.h>

namespace {

constexpr int kMostLinks = 40;  // what the system itself follows

void splitPath(const QByteArray& path, OutputPlace& place) {
  const int slash = path.lastIndexOf('/');
  place.name = path.mid(slash + 1);
  place.folder = slash < 0 ? QByteArray(".") : slash == 0 ? QByteArray("/") : path.left(slash);
}

// The number of this process's descriptor that the place names, -1 when it names none.
int ownDescriptor(const OutputPlace& place) {
  bool isNumber = false;
  const int number = place.name.toInt(&isNumber);
  if (!isNumber || number < 0) {
    return -1;
  }
  const std::unique_ptr<char, void (*)(void*)> folder(::realpath(place.folder.constData(), nullptr),
                                                      &std::free);
  return folder && QByteArray(folder.get()) == "/proc/" + QByteArray::number(::getpid()) + "/fd" ? number
                                                                                                 : -1;
}

OutputPlace& unusable(OutputPlace& place, int error) {
  place.kind = OutputPlace::Kind::Unusable;
  place.error = error;
  return place;
}

}  // namespace

OutputPlace OutputPlace::find(const QByteArray& fileName) {
  OutputPlace place;
  if (fileName.isEmpty() || fileName.contains('\0')) {
    return unusable(place, fileName.isEmpty() ? ENOENT : EINVAL);
  }
  QByteArray path = fileName;
  for (int links = 0; links <= kMostLinks; ++links) {
    splitPath(path, place);
    if (place.name.isEmpty()) {
      return unusable(place, EISDIR);
    }
    place.descriptor = ownDescriptor(place);
    if (place.descriptor >= 0) {
      place.kind = Kind::Descriptor;
      return place;
    }
    if (::lstat(path.constData(), &place.status) != 0) {
      if (errno != ENOENT) {
        return unusable(place, errno);
      }
      place.kind = Kind::New;
      return place;
    }
    if (!S_ISLNK(place.status.st_mode)) {
      if (S_ISDIR(place.status.st_mode)) {
        return unusable(place, EISDIR);
      }
      place.kind = S_ISREG(place.status.st_mode) ? Kind::Regular : Kind::Special;
      return place;
    }
    char target[PATH_MAX];
    const ssize_t length = ::readlink(path.constData(), target, sizeof target);
    if (length <= 0 || length == static_cast<ssize_t>(sizeof target)) {
      return unusable(place, length < 0 ? errno : ENAMETOOLONG);
    }
    const QByteArray linked(target, static_cast<int>(length));
    path = linked.startsWith('/') ? linked : place.folder + '/' + linked;
  }
  return unusable(place, ELOOP);
}
