// The lines of a workspace file that are neither XML nor header and yet disturb: marks that version control
// left when it could not merge, and lines that stand between lines of the XML.
#pragma once

#include <platform/Export.h>

#include <QString>

#include <vector>

class PlainFile;

struct ORX_EXPORT RawLine {
  enum class Kind {
    Conflict,    // "<<<<<<<", "|||||||", "=======" or ">>>>>>>", anywhere in the file
    Stray,       // not blank; written again it would stand behind the XML
    OpenHeader,  // begins a header that does not end
    Behind,      // marked like XML, but behind the header; the first of them
  };

  Kind kind;
  int line;
  QString text;  // the beginning of it

  // In their order. Of plain XML, whose lines bear no mark, only conflicts are found. Throws
  // WorkspaceLoaderException when the file cannot be read.
  static std::vector<RawLine> find(const QString& fileName);
  static std::vector<RawLine> find(PlainFile& file);
};
