// What was found wrong with the document of a custom transformer.
#pragma once

#include <QString>

struct NetworkProblem {
  enum class Kind {
    UnknownTransformer,
    UnknownVersion,
    UnknownParameter,
    UnknownInput,
    UnknownOutput,
    DanglingLink,
    BadPort,
    DuplicateNumber,
    DuplicateName,
    BadPromptLine,
    UnmetDependency,
    Upgraded,  // a hint: parameters were brought to their newest form
    Nesting,   // stands inside itself, or too deep
    NoBody,    // the document or the file could not be read
    NoLoop,    // the whole is to be repeated, and nothing leads back
  };

  Kind kind;
  int line = 0;  // of the element in the file that the document was read from; 0 when there is none
  QString node;  // empty when no node is meant
  QString text;  // for the user, in the current language
};
