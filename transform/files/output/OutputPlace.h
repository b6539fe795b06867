// Where a file name leads: through symbolic links to a regular file, to something written directly, or to
// nothing yet.
#pragma once

#include <QByteArray>

#include <sys/stat.h>

struct OutputPlace {
  enum class Kind {
    Unusable,    // error tells why
    New,         // nothing stands there; the folder may be missing as well
    Regular,     // status describes the file
    Special,     // a device or a pipe
    Descriptor,  // a descriptor of this process, by a name such as /dev/stdout
  };

  Kind kind = Kind::Unusable;
  QByteArray folder;  // as the system takes it
  QByteArray name;    // inside the folder
  struct stat status {};
  int descriptor = -1;
  int error = 0;  // the system's error number

  QByteArray path() const { return folder + '/' + name; }

  static OutputPlace find(const QByteArray& fileName);
};
