// One version of a custom transformer in a file that holds several.
#pragma once

#include <QString>

struct VersionInfo {
  QString name;
  int version = 1;
  QString category;
  QString guid;           // without braces
  int startLine = 0;      // number of lines in front of the version's document
  qint64 byteOffset = 0;  // of the line that opens the version
  qint64 byteLength = 0;  // up to the end of the version's document
};
