// Runs the dependency checks that a definition carries: one Tcl script each, in an interpreter that can
// neither reach the system nor run away.
//
// A script has expressions, control structures, list and string commands, "catch", and these:
//   ORX_EncodeText TEXT       the text as one word of the word encoding; ORX_DecodeText WORD its inverse
//   orx_fileExists PATH       1 when there is such a file or folder
//   orx_env NAME              the value of the environment variable, empty without one
//   orx_programInPath NAME    1 when a folder of PATH holds such a program
//   orx_hasPackage NAME       1 when a folder of ::auto_path offers such a Tcl package
// Scripts are bounded in commands (10 000), time (1 s), their length and that of words, variables and lists,
// and patterns in the number of "*". There are no procedures and no regular expressions, and numbers stay
// within 64 bits: none of those could be stopped half-way.
#pragma once

#include <QString>
#include <QStringList>

class DependencyChecker {
 public:
  struct Verdict {
    bool isMet = true;
    QString message;  // why not: the script's own answer, or "Tcl error: ...\n"
  };

  // Runs the scripts in order, each in an interpreter of its own; the first that answers with a text, or
  // fails, gives the verdict. No interpreter is made when there are no scripts.
  static Verdict check(const QStringList& scripts);
};
